// KtrButton: the flat button of the message box, a child window class of our own.
// A click reaches the parent as WM_COMMAND with the control id and BN_CLICKED. Key presses are
// first offered to the top-level window (kPreviewKey), which sees them before the button does.
#pragma once

#include <windows.h>

#include <cstdint>
#include <string>

#include "common/constants.h"
#include "msgbox/msgbox_gdi_win32.h"

namespace checker::msgbox {

// Sent to the button's top-level window before the button handles a key:
// wParam = key code, lParam = 1 when Alt is down. Tab is offered as well (for focus moves).
inline constexpr UINT kPreviewKey = WM_APP + 0x40;

struct KtrButtonDesign {
    std::uint32_t backcolor = kButtonBack;
    std::uint32_t forecolor = kButtonFore;
    std::uint32_t forecolormousedown = kButtonForeDown;
    std::uint32_t backcolormousedown = kAnswerBackDown;
    Picture picture = Picture::None;
    int picturePx = 0;            // picture size at 96 dpi
    std::int32_t buttonstyle = 0; // 0 flat, 1 with a thin raised edge
    bool borderonfocus = false;
};

class KtrButton {
  public:
    KtrButton() = default;
    KtrButton(const KtrButton&) = delete;
    KtrButton& operator=(const KtrButton&) = delete;
    ~KtrButton();

    static bool Register(HINSTANCE instance);

    // Creates the child window at a pixel rectangle; false when the system refuses.
    bool Create(HWND parent, int id, const RECT& px, const KtrButtonDesign& design, HFONT font,
                int dpi);
    HWND hwnd() const noexcept { return hwnd_; }

    void setCaption(const std::string& caption);
    const std::string& caption() const noexcept { return caption_; }
    void setPosition(int xPx, int yPx);
    void setVisible(bool visible);
    bool visible() const;
    void setFocus();
    bool hasFocus() const;

    // The picture's placement beside the caption: kPictureLeft, or kPictureNone for none.
    void setPicturePosition(std::int32_t value);
    std::int32_t picturePosition() const noexcept { return picturePosition_; }

  private:
    static LRESULT CALLBACK StaticWndProc(HWND, UINT, WPARAM, LPARAM);
    LRESULT WndProc(UINT message, WPARAM wParam, LPARAM lParam);
    void paint(HDC dc);
    void click();
    bool offerKey(WPARAM key, bool alt); // false when the key closed the box

    HWND hwnd_ = nullptr;
    std::string caption_;
    KtrButtonDesign design_;
    HFONT font_ = nullptr; // owned by the window that holds the button
    int dpi_ = 0;
    std::int32_t picturePosition_ = kPictureLeft;
    bool pressed_ = false;
    bool tracking_ = false;
};

} // namespace checker::msgbox
