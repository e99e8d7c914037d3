// Small window helpers shared by the checker's windows.
#pragma once

#include <windows.h>

#include <string>

#include "common/error.h"

namespace checker {

// Makes a window topmost without moving or sizing it; the result is not examined.
void prSetTopMost(HWND hwnd) noexcept;

// Lets pending window messages run once (every message in the queue now).
void doEvents() noexcept;

// The last-resort handler: the error's number and description in a system message box,
// then the end of the process.
[[noreturn]] void prLastResort(const CheckerError& error) noexcept;
[[noreturn]] void prLastResortUnknown(const char* what) noexcept;

// Runs `body`, turning any escaping exception into the last-resort handler: no C++ exception
// may unwind through a Windows frame.
template <typename F> void guarded(F&& body) noexcept {
    try {
        body();
    } catch (const CheckerError& e) {
        prLastResort(e);
    } catch (const std::exception& e) {
        prLastResortUnknown(e.what());
    } catch (...) {
        prLastResortUnknown("Unexpected error");
    }
}

// The body of a window class's one static window procedure: binds the object from
// lpCreateParams in WM_NCCREATE (GWLP_USERDATA, full pointer width), forwards every message to
// its member procedure, and clears the binding in WM_NCDESTROY. No exception gets through.
template <typename T, HWND T::*Handle, LRESULT (T::*Proc)(UINT, WPARAM, LPARAM)>
LRESULT dispatchToWindow(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) noexcept {
    const auto defProc = ::IsWindowUnicode(hwnd) ? &::DefWindowProcW : &::DefWindowProcA;
    if (message == WM_NCCREATE) {
        // CREATESTRUCTA and CREATESTRUCTW begin alike: lpCreateParams is the first member.
        auto* self = static_cast<T*>(reinterpret_cast<CREATESTRUCTA*>(lParam)->lpCreateParams);
        if (self) {
            self->*Handle = hwnd;
            ::SetWindowLongPtrA(hwnd, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(self));
        }
    }
    auto* self = reinterpret_cast<T*>(::GetWindowLongPtrA(hwnd, GWLP_USERDATA));
    if (message == WM_NCDESTROY) {
        ::SetWindowLongPtrA(hwnd, GWLP_USERDATA, 0);
        if (self) self->*Handle = nullptr;
        return defProc(hwnd, message, wParam, lParam);
    }
    if (!self) return defProc(hwnd, message, wParam, lParam);
    LRESULT result = 0;
    guarded([&] { result = (self->*Proc)(message, wParam, lParam); });
    return result;
}

} // namespace checker
