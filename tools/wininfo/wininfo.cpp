// wininfo: what the end-to-end tests cannot see from X.
//   wininfo [--title TEXT] [--class NAME] [--children]   one line per matching top-level window
//   wininfo --post HWND MSG WPARAM LPARAM                 PostMessage (numbers: decimal or 0x)
//   wininfo --dpi                                         the screen's logical dots per inch
// A window line: hwnd=0x.. pid=N visible=0|1 topmost=0|1 x= y= w= h= cx= cy= class=.. title=..
// (x, y, w, h: window rectangle in pixels; cx, cy: client size in pixels; focus: has the
// keyboard focus of its thread).
#include <windows.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>

namespace {

struct Filter {
    const char* title = nullptr;
    const char* cls = nullptr;
    bool children = false;
    int found = 0;
};

void printWindow(HWND hwnd, const char* indent) {
    char title[512] = "", cls[256] = "";
    GetWindowTextA(hwnd, title, sizeof title);
    GetClassNameA(hwnd, cls, sizeof cls);
    RECT r{}, c{};
    GetWindowRect(hwnd, &r);
    GetClientRect(hwnd, &c);
    DWORD pid = 0;
    GetWindowThreadProcessId(hwnd, &pid);
    const LONG_PTR ex = GetWindowLongPtrA(hwnd, GWL_EXSTYLE);
    // focus=1: this window has the keyboard focus of its thread.
    GUITHREADINFO gui{};
    gui.cbSize = sizeof gui;
    const bool focused = GetGUIThreadInfo(GetWindowThreadProcessId(hwnd, nullptr), &gui) &&
                         gui.hwndFocus == hwnd;
    std::printf("%shwnd=0x%llx pid=%lu visible=%d topmost=%d x=%ld y=%ld w=%ld h=%ld cx=%ld cy=%ld "
                "id=%ld enabled=%d focus=%d class=%s title=%s\n",
                indent, (unsigned long long)(UINT_PTR)hwnd, pid, IsWindowVisible(hwnd) ? 1 : 0,
                (ex & WS_EX_TOPMOST) ? 1 : 0, r.left, r.top, r.right - r.left, r.bottom - r.top,
                c.right, c.bottom, (long)GetDlgCtrlID(hwnd), IsWindowEnabled(hwnd) ? 1 : 0,
                focused ? 1 : 0, cls, title);
}

BOOL CALLBACK eachChild(HWND hwnd, LPARAM) {
    printWindow(hwnd, "  ");
    return TRUE;
}

BOOL CALLBACK eachTop(HWND hwnd, LPARAM param) {
    auto* f = reinterpret_cast<Filter*>(param);
    char title[512] = "", cls[256] = "";
    GetWindowTextA(hwnd, title, sizeof title);
    GetClassNameA(hwnd, cls, sizeof cls);
    if (f->title && std::strcmp(title, f->title) != 0) return TRUE;
    if (f->cls && std::strcmp(cls, f->cls) != 0) return TRUE;
    ++f->found;
    printWindow(hwnd, "");
    if (f->children) EnumChildWindows(hwnd, eachChild, 0);
    return TRUE;
}

unsigned long long number(const char* s) { return std::strtoull(s, nullptr, 0); }

} // namespace

int main(int argc, char** argv) {
    Filter f;
    for (int i = 1; i < argc; ++i) {
        if (!std::strcmp(argv[i], "--title") && i + 1 < argc) f.title = argv[++i];
        else if (!std::strcmp(argv[i], "--class") && i + 1 < argc) f.cls = argv[++i];
        else if (!std::strcmp(argv[i], "--children")) f.children = true;
        else if (!std::strcmp(argv[i], "--dpi")) {
            HDC dc = GetDC(nullptr);
            std::printf("dpi=%d\n", GetDeviceCaps(dc, LOGPIXELSY));
            ReleaseDC(nullptr, dc);
            return 0;
        } else if (!std::strcmp(argv[i], "--post") && i + 4 < argc) {
            HWND hwnd = reinterpret_cast<HWND>(static_cast<UINT_PTR>(number(argv[i + 1])));
            const BOOL ok = PostMessageA(hwnd, static_cast<UINT>(number(argv[i + 2])),
                                         static_cast<WPARAM>(number(argv[i + 3])),
                                         static_cast<LPARAM>(number(argv[i + 4])));
            return ok ? 0 : 1;
        } else {
            std::fprintf(stderr, "usage: wininfo [--title T] [--class C] [--children] | --post H M W L | --dpi\n");
            return 2;
        }
    }
    EnumWindows(eachTop, reinterpret_cast<LPARAM>(&f));
    return f.found ? 0 : 1;
}
