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

} // namespace checker
