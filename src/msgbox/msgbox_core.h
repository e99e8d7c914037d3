// The message box's rules without a window: button sets, result codes, key answers, growth with
// the text, placement and focus. Positions are twips; the Win32 form only mirrors this model.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace checker::msgbox {

enum class Button { None, OK, No, Cancel, Close };

struct ButtonModel {
    std::string caption;
    int left = 0;
    int top = 0;
    bool visible = true;
    // The flat button's picture placement: a caller's caption gets the whole face.
    std::int32_t PicturePosition = 1;
};

// State of one frmMsgBox instance: the public fields start empty, the controls at their design.
struct MsgBoxModel {
    MsgBoxModel();

    // Public fields.
    std::uint8_t ReturnValue = 0;
    std::string Message;
    bool btnNo = false;
    bool btnCancel = false;
    bool CentreinMDIClient = false;
    bool AlwaysOnTop = false;

    // Controls and window, in twips.
    std::string title;       // lblCaption
    std::string messageText; // LblMsg
    int messageHeight;       // LblMsg, as fitted to its text
    int windowLeft = 0;
    int windowTop = 0;
    int windowWidth;
    int windowHeight;
    int shapeWidth;
    int shapeHeight;
    ButtonModel cmdOK, cmdNo, cmdCancel;
};

// ReturnValue is written as a 32-bit value and kept in a byte; a value that does not fit is
// the language's overflow error, as for any byte.
void setReturnValue(MsgBoxModel& box, std::int32_t value);

// Step 3 of a call: the button set of a style with the caller's captions (empty keeps the
// default). False, with nothing changed, for a style outside 0, 1, 3 and 4.
bool applyStyle(MsgBoxModel& box, std::int32_t style, std::string_view caption1,
                std::string_view caption2, std::string_view caption3);

// Step 4: a caller's caption clears the picture placement of its button, by argument position.
void applyCaptionPictures(MsgBoxModel& box, std::string_view caption1, std::string_view caption2,
                          std::string_view caption3);

// The largest message height that keeps the whole window, answer buttons included, on a screen
// `screenHeight` twips high (0: unknown, no limit). At least one design line.
int capMessageHeight(int fittedHeight, int screenHeight, bool centred);

// The fixed placement rule: left 4500, top (9600 - window height) / 2, in screen twips.
void prCentreInMDIClient(MsgBoxModel& box);

// Steps 3 to 6 of becoming active: growth by the fitted message height, the border, hiding the
// buttons the style does not keep, placement.
void activateLayout(MsgBoxModel& box, int fittedMessageHeight);

// Where the keyboard focus starts.
Button focusTarget(const MsgBoxModel& box);

// The result a button's click stores.
std::int32_t clickResult(const MsgBoxModel& box, Button button);

// The button a key code answers (letters by their upper-case key code), or None.
Button keyTarget(const MsgBoxModel& box, int keyCode);

// The access key of a caption: the character after the first single "&", upper case; 0 if none.
char accessKey(std::string_view caption);

// The visible answer button whose caption has `letter` as its access key, or None.
Button accessKeyTarget(const MsgBoxModel& box, char letter);

// What a call answers when the box closes: a box that never got as far as being shown answers
// as a box closed without a button.
std::int32_t finalResult(const MsgBoxModel& box);

} // namespace checker::msgbox
