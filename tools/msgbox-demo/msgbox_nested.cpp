// msgbox-nested: the box's modality and its one shared window, seen from a caller.
// Shows another window, then a box (style 3); while that box waits, a timer tries a second box.
// Prints "inner=N disabled-during=0|1" from the timer, then "outer=N enabled-after=0|1", and
// exits with the outer answer.
#include <windows.h>

#include <cstdio>

#include "msgbox/fnShowMsgBox_win32.h"

namespace {
HWND gOther = nullptr;
constexpr UINT kTryAfterMs = 500;

void CALLBACK tryInner(HWND, UINT, UINT_PTR id, DWORD) {
    ::KillTimer(nullptr, id);
    const bool disabled = !::IsWindowEnabled(gOther);
    const auto inner = checker::fnShowMsgBox("Inner", 0, "Inner", false, "", "", "", false);
    std::printf("inner=%d disabled-during=%d\n", static_cast<int>(inner), disabled ? 1 : 0);
    std::fflush(stdout);
}
} // namespace

int main() {
    gOther = ::CreateWindowExW(0, L"STATIC", L"Other window", WS_OVERLAPPEDWINDOW | WS_VISIBLE, 0,
                               0, 200, 100, nullptr, nullptr, ::GetModuleHandleW(nullptr), nullptr);
    ::SetTimer(nullptr, 0, kTryAfterMs, tryInner);
    const auto outer = checker::fnShowMsgBox("Outer", 3, "Nested", false, "", "", "", false);
    std::printf("outer=%d enabled-after=%d\n", static_cast<int>(outer),
                ::IsWindowEnabled(gOther) ? 1 : 0);
    std::fflush(stdout);
    return outer;
}
