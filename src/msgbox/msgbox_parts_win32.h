// The plain parts of the message box: the title strip panel, the two text labels and the
// picture. Each is a small child window that paints itself.
#pragma once

#include <windows.h>

#include <cstdint>
#include <functional>
#include <string>

#include "msgbox/msgbox_gdi_win32.h"

namespace checker::msgbox {

class MsgBoxPart {
  public:
    enum class Kind { Panel, Label, Image };

    MsgBoxPart() = default;
    MsgBoxPart(const MsgBoxPart&) = delete;
    MsgBoxPart& operator=(const MsgBoxPart&) = delete;
    ~MsgBoxPart();

    bool Create(HWND parent, Kind kind, int id, const RECT& px);
    HWND hwnd() const noexcept { return hwnd_; }

    // Look.
    void setBackground(std::uint32_t rgb) { back_ = rgb; }
    void setForeground(std::uint32_t rgb) { fore_ = rgb; }
    void setFont(HFONT font) { font_ = font; }
    void setWrap(bool wrap) { wrap_ = wrap; }
    void setPicture(Picture picture) { picture_ = picture; }

    // Labels: the text is shown as given (no "&" underlining, tabs expanded).
    void setText(const std::string& text);
    const std::string& text() const noexcept { return text_; }
    // The label's size for its text: one line as wide as the text, or wrapped at the current
    // width (then only the height is given). In pixels.
    SIZE fittedSize() const;

    void move(int xPx, int yPx, int widthPx, int heightPx);

    // Panels: any mouse button pressed on the panel itself.
    std::function<void()> onMouseDown;

  private:
    static LRESULT CALLBACK StaticWndProc(HWND, UINT, WPARAM, LPARAM);
    LRESULT WndProc(UINT message, WPARAM wParam, LPARAM lParam);
    UINT textFormat() const;

    HWND hwnd_ = nullptr;
    Kind kind_ = Kind::Label;
    std::uint32_t back_ = 0;
    std::uint32_t fore_ = 0;
    HFONT font_ = nullptr; // owned by the window that holds the part
    bool wrap_ = false;
    Picture picture_ = Picture::None;
    std::string text_;
};

} // namespace checker::msgbox
