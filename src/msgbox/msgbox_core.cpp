#include "msgbox/msgbox_core.h"

#include <algorithm>

#include "common/constants.h"
#include "common/error.h"

namespace checker::msgbox {

MsgBoxModel::MsgBoxModel()
    : title(kDesignTitle), messageText(kDesignMessage), messageHeight(kMsgHeight),
      windowWidth(kWindowWidth), windowHeight(kWindowHeight), shapeWidth(kWindowWidth),
      shapeHeight(kWindowHeight), cmdOK{std::string(kCaptionYes), kSlot1Left, kButtonTop},
      cmdNo{std::string(kCaptionNo), kSlot2Left, kButtonTop}, cmdCancel{std::string(kCaptionCancel),
                                                                        kSlot3Left, kButtonTop} {}

void setReturnValue(MsgBoxModel& box, std::int32_t value) {
    if (value < 0 || value > 255) throw overflowError("frmMsgBox");
    box.ReturnValue = static_cast<std::uint8_t>(value);
}

namespace {
std::string chosen(std::string_view caller, std::string_view fallback) {
    return std::string(caller.empty() ? fallback : caller);
}
} // namespace

bool applyStyle(MsgBoxModel& box, std::int32_t style, std::string_view caption1,
                std::string_view caption2, std::string_view caption3) {
    switch (style) {
    case kStyleOk:
        box.btnNo = false;
        box.btnCancel = false;
        box.cmdOK.caption = chosen(caption1, kCaptionOk);
        box.cmdOK.left = box.cmdCancel.left;
        return true;
    case kStyleOkCancel:
        box.btnNo = false;
        box.btnCancel = true;
        box.cmdOK.caption = chosen(caption1, kCaptionOk);
        box.cmdCancel.caption = chosen(caption2, kCaptionCancel);
        box.cmdOK.left = box.cmdNo.left;
        return true;
    case kStyleYesNoCancel:
        box.btnNo = true;
        box.btnCancel = true;
        box.cmdOK.caption = chosen(caption1, kCaptionYes);
        box.cmdNo.caption = chosen(caption2, kCaptionNo);
        box.cmdCancel.caption = chosen(caption3, kCaptionCancel);
        return true;
    case kStyleYesNo:
        box.btnNo = true;
        box.btnCancel = false;
        box.cmdOK.caption = chosen(caption1, kCaptionYes);
        box.cmdNo.caption = chosen(caption2, kCaptionNo);
        box.cmdOK.left = box.cmdNo.left; // before cmdNo leaves slot 2
        box.cmdNo.left = box.cmdCancel.left;
        return true;
    default:
        return false;
    }
}

void applyCaptionPictures(MsgBoxModel& box, std::string_view caption1, std::string_view caption2,
                          std::string_view caption3) {
    if (!caption1.empty()) box.cmdOK.PicturePosition = kPictureNone;
    if (!caption2.empty()) box.cmdNo.PicturePosition = kPictureNone;
    if (!caption3.empty()) box.cmdCancel.PicturePosition = kPictureNone;
}

int capMessageHeight(int fittedHeight, int screenHeight, bool centred) {
    // The window is the design height plus the growth: kWindowHeight + (h - kGrowthBase).
    const int fixedPart = kWindowHeight - kGrowthBase;
    int limit = fittedHeight;
    if (screenHeight > 0) {
        int maxWindow;
        if (centred) {
            // top = (span - H) / 2 must stay on the screen, and so must the bottom.
            maxWindow = std::min(kCentredSpan, 2 * screenHeight - kCentredSpan);
        } else {
            maxWindow = screenHeight - kUncentredTop;
        }
        limit = std::min(fittedHeight, maxWindow - fixedPart);
    }
    return std::max(limit, kMsgHeight);
}

void prCentreInMDIClient(MsgBoxModel& box) {
    box.windowLeft = kCentredLeft;
    box.windowTop = (kCentredSpan - box.windowHeight) / 2;
}

void activateLayout(MsgBoxModel& box, int fittedMessageHeight) {
    box.messageHeight = fittedMessageHeight;
    const int d = fittedMessageHeight - kGrowthBase;
    box.windowHeight += d;
    box.cmdOK.top += d;
    box.cmdNo.top += d;
    box.cmdCancel.top += d;

    box.shapeWidth = box.windowWidth;
    box.shapeHeight = box.windowHeight;

    if (!box.btnCancel) box.cmdCancel.visible = false;
    if (!box.btnNo) box.cmdNo.visible = false;

    if (box.CentreinMDIClient) {
        prCentreInMDIClient(box);
    } else {
        box.windowLeft = kUncentredLeft;
        box.windowTop = kUncentredTop;
    }
}

Button focusTarget(const MsgBoxModel& box) {
    return box.cmdNo.visible ? Button::No : Button::OK;
}

std::int32_t clickResult(const MsgBoxModel& box, Button button) {
    switch (button) {
    case Button::OK:
        return box.cmdOK.caption == kCaptionOk ? kResultOk : kResultYes;
    case Button::Cancel:
        return kResultCancel;
    case Button::No:
    case Button::Close:
        return kResultNo;
    default:
        return kResultNo;
    }
}

Button keyTarget(const MsgBoxModel& box, int keyCode) {
    switch (keyCode) {
    case kKeyYes:
        return box.cmdOK.caption == kCaptionYes && box.cmdOK.visible ? Button::OK : Button::None;
    case kKeyOk:
        return box.cmdOK.caption == kCaptionOk && box.cmdOK.visible ? Button::OK : Button::None;
    case kKeyNo:
        return box.cmdNo.visible ? Button::No : Button::None;
    case kKeyCancel:
        return box.cmdCancel.visible ? Button::Cancel : Button::None;
    default:
        return Button::None;
    }
}

char accessKey(std::string_view caption) {
    for (std::size_t i = 0; i + 1 < caption.size(); ++i) {
        if (caption[i] != '&') continue;
        if (caption[i + 1] == '&') { // "&&" is a plain ampersand
            ++i;
            continue;
        }
        const char c = caption[i + 1];
        return (c >= 'a' && c <= 'z') ? static_cast<char>(c - 'a' + 'A') : c;
    }
    return 0;
}

Button accessKeyTarget(const MsgBoxModel& box, char letter) {
    if (letter == 0) return Button::None;
    if (box.cmdOK.visible && accessKey(box.cmdOK.caption) == letter) return Button::OK;
    if (box.cmdCancel.visible && accessKey(box.cmdCancel.caption) == letter) return Button::Cancel;
    if (box.cmdNo.visible && accessKey(box.cmdNo.caption) == letter) return Button::No;
    return Button::None;
}

std::int32_t finalResult(const MsgBoxModel& box) {
    return box.ReturnValue == 0 ? kResultNo : box.ReturnValue;
}

} // namespace checker::msgbox
