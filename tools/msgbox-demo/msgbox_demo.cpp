// msgbox-demo: shows one message box through fnShowMsgBox and reports the answer.
//   msgbox-demo.exe [--message TEXT] [--style N] [--title TEXT] [--centre] [--caption1 TEXT]
//                   [--caption2 TEXT] [--caption3 TEXT] [--topmost]
// Prints "result=N" when the box closes and exits with N. "\n" in TEXT is a line break.
#include <windows.h>

#include <cstdio>
#include <cstdlib>
#include <string>

#include "common/text.h"
#include "msgbox/fnShowMsgBox_win32.h"
#include "msgbox/msgbox_gdi_win32.h"

namespace {

constexpr char kUsage[] =
    "usage: msgbox-demo.exe [--message TEXT] [--style N] [--title TEXT] [--centre]\n"
    "                       [--caption1 TEXT] [--caption2 TEXT] [--caption3 TEXT] [--topmost]\n"
    "Shows one message box, prints result=N when it closes and exits with N.\n"
    "\"\\n\" in TEXT is a line break.\n";

std::string text(const wchar_t* arg) {
    return checker::replaceAll(checker::msgbox::toUtf8(arg), "\\n", "\n");
}

} // namespace

int wmain(int argc, wchar_t** argv) {
    std::string message, title, caption1, caption2, caption3;
    std::int32_t style = 0;
    bool centre = false, topmost = false;
    for (int i = 1; i < argc; ++i) {
        const std::wstring a = argv[i];
        const bool hasValue = i + 1 < argc;
        if (a == L"--help" || a == L"-h" || a == L"/?") {
            std::fputs(kUsage, stdout);
            return 0;
        } else if (a == L"--centre") {
            centre = true;
        } else if (a == L"--topmost") {
            topmost = true;
        } else if (a == L"--message" && hasValue) {
            message = text(argv[++i]);
        } else if (a == L"--title" && hasValue) {
            title = text(argv[++i]);
        } else if (a == L"--caption1" && hasValue) {
            caption1 = text(argv[++i]);
        } else if (a == L"--caption2" && hasValue) {
            caption2 = text(argv[++i]);
        } else if (a == L"--caption3" && hasValue) {
            caption3 = text(argv[++i]);
        } else if (a == L"--style" && hasValue) {
            style = static_cast<std::int32_t>(std::wcstol(argv[++i], nullptr, 10));
        } else {
            std::fputs(kUsage, stderr);
            return 2;
        }
    }
    const std::int32_t result =
        checker::fnShowMsgBox(message, style, title, centre, caption1, caption2, caption3, topmost);
    std::printf("result=%d\n", static_cast<int>(result));
    std::fflush(stdout);
    return result;
}
