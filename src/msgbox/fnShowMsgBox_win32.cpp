#include "msgbox/fnShowMsgBox_win32.h"

#include <windows.h>

#include <memory>

#include "common/constants.h"
#include "msgbox/frmMsgBox_win32.h"

namespace checker {

namespace {
// The one shared box; a call creates it when there is none and unloads it when answered.
std::unique_ptr<msgbox::frmMsgBox> gBox;

template <typename F> void step(F&& body) noexcept {
    try {
        body();
    } catch (...) {
    }
}
} // namespace

std::int32_t fnShowMsgBox(const std::string& strMessage, std::int32_t lngStyle,
                          const std::string& strTitle, bool blnCentre,
                          const std::string& strCaption1, const std::string& strCaption2,
                          const std::string& strCaption3, bool blnAlwaysOnTop) {
    // The box already waits for an answer further up this thread: there is only the one
    // window, so this call neither reconfigures nor unloads it, and answers as closed.
    if (gBox && gBox->showing()) return msgbox::kResultNo;

    step([&] {
        if (!gBox) gBox = std::make_unique<msgbox::frmMsgBox>(::GetModuleHandleW(nullptr));
        gBox->Message(strMessage);
    });
    if (!gBox) return msgbox::kResultNo;
    msgbox::frmMsgBox& box = *gBox;

    step([&] { box.setTitle(strTitle); });
    // Captions, slots, btnNo and btnCancel; an unknown style leaves the design as it is.
    step([&] { box.applyStyle(lngStyle, strCaption1, strCaption2, strCaption3); });
    step([&] { box.applyCaptionPictures(strCaption1, strCaption2, strCaption3); });
    step([&] {
        box.CentreinMDIClient(blnCentre);
        box.AlwaysOnTop(blnAlwaysOnTop);
    });
    step([&] { box.ShowModal(); });

    std::int32_t result = msgbox::kResultNo;
    step([&] { result = msgbox::finalResult(box.model()); });
    gBox.reset();
    return result;
}

} // namespace checker
