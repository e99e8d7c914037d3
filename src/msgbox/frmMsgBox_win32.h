// frmMsgBox: the program's own modal message window. Borderless and light cream, with a black
// title strip (title and "X"), a red exclamation mark, the message and up to three answer
// buttons. Its rules live in msgbox_core; this class mirrors the model onto windows.
#pragma once

#include <windows.h>

#include <cstdint>
#include <string>
#include <vector>

#include "common/unique_win32.h"
#include "msgbox/flat_button_win32.h"
#include "msgbox/msgbox_core.h"
#include "msgbox/msgbox_parts_win32.h"

namespace checker::msgbox {

class frmMsgBox {
  public:
    // Control ids (what wininfo reports for the children).
    enum ControlId : int {
        idFrame1 = 1,
        idLblCaption,
        idCmdClose,
        idImage1,
        idLblMsg,
        idCmdOK,
        idCmdNo,
        idCmdCancel
    };

    explicit frmMsgBox(HINSTANCE instance);
    ~frmMsgBox(); // unloads
    frmMsgBox(const frmMsgBox&) = delete;
    frmMsgBox& operator=(const frmMsgBox&) = delete;

    // ---- public operations
    std::int32_t ReturnValue() const noexcept { return model_.ReturnValue; }
    void ReturnValue(std::int32_t value) { setReturnValue(model_, value); }
    void Message(const std::string& text) { model_.Message = text; }
    void btnNo(bool value) noexcept { model_.btnNo = value; }
    void btnCancel(bool value) noexcept { model_.btnCancel = value; }
    void CentreinMDIClient(bool value) noexcept { model_.CentreinMDIClient = value; }
    void AlwaysOnTop(bool value) noexcept { model_.AlwaysOnTop = value; }

    // ---- what fnShowMsgBox does with the controls; the first of them loads the window
    void setTitle(const std::string& title); // lblCaption
    bool applyStyle(std::int32_t style, const std::string& caption1, const std::string& caption2,
                    const std::string& caption3); // captions, slots, btnNo, btnCancel
    void applyCaptionPictures(const std::string& caption1, const std::string& caption2,
                              const std::string& caption3); // the buttons' numeric property
    // Shows the window modally and returns once it is hidden (or gone).
    void ShowModal();

    bool loaded() const noexcept { return hwnd_ != nullptr; }
    bool showing() const noexcept { return showing_; }
    HWND hwnd() const noexcept { return hwnd_; }
    const MsgBoxModel& model() const noexcept { return model_; }

  private:
    static LRESULT CALLBACK StaticWndProc(HWND, UINT, WPARAM, LPARAM);
    LRESULT WndProc(UINT message, WPARAM wParam, LPARAM lParam);

    void Load(); // creates the window and its controls at their design, then Form_Load
    void Form_Load();
    void Form_Activate();
    void Form_KeyDown(int keyCode);
    void Frame1_MouseDown();
    void cmdOK_Click();
    void cmdNo_Click();
    void cmdCancel_Click();
    void cmdClose_Click();
    void prAnswer(Button button);
    void prClick(Button button);
    void prTabFocus(HWND from, bool forward);
    void prSyncLayout(); // model positions and visibility onto the windows
    void prPaint(HDC dc);

    KtrButton* buttonOf(Button button);
    int xPx(int twips) const;
    int yPx(int twips) const;
    RECT rectPx(int left, int top, int width, int height) const;

    HINSTANCE instance_;
    HWND hwnd_ = nullptr;
    MsgBoxModel model_;
    int twipsX_ = 0, twipsY_ = 0, dpiY_ = 0;
    bool showing_ = false;
    bool activated_ = false;

    UniqueGdiObject captionFont_, messageFont_, buttonFont_;
    MsgBoxPart Frame1, lblCaption, Image1, LblMsg;
    KtrButton cmdClose, cmdOK, cmdNo, cmdCancel;
};

} // namespace checker::msgbox
