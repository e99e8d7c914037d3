// Picture1: the picture box that covers the main window's client area, draws the window's
// artwork (title lettering and two button bars along the bottom) and holds the three labels.
#pragma once

#include <windows.h>

#include "common/unique_win32.h"

namespace checker {

class Picture1 {
  public:
    Picture1() = default;
    Picture1(const Picture1&) = delete;
    Picture1& operator=(const Picture1&) = delete;

    // Creates the picture box and its labels, laid out with the screen's twips per pixel.
    // Clicks on the labels reach `parent` as WM_COMMAND with the label's id and STN_CLICKED.
    void create(HWND parent, HINSTANCE instance, int twipsPerPixelX, int twipsPerPixelY);

    HWND hwnd() const noexcept { return hwnd_; }
    HWND label2() const noexcept { return label2_; }

  private:
    static LRESULT CALLBACK StaticWndProc(HWND, UINT, WPARAM, LPARAM);
    LRESULT WndProc(UINT message, WPARAM wParam, LPARAM lParam);
    void paint(HDC dc) const;
    RECT labelRect(int left, int top, int width, int height) const;
    HWND makeLabel(HINSTANCE instance, const char* text, int id, RECT where, HFONT font);

    HWND hwnd_ = nullptr; // children go with the main window
    HWND label2_ = nullptr;
    int tppX_ = 15, tppY_ = 15;
    UniqueGdiObject commandFont_, label2Font_, titleFont_;
};

} // namespace checker
