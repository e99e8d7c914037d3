// The message box's rules: button sets and slots, result codes, key answers, growth,
// placement, focus.
#include <gtest/gtest.h>

#include "common/constants.h"
#include "common/error.h"
#include "msgbox/msgbox_core.h"

using namespace checker;
using namespace checker::msgbox;

namespace {
// A box as a call leaves it once it has become active with a one-line message.
MsgBoxModel shown(std::int32_t style, std::string_view c1 = "", std::string_view c2 = "",
                  std::string_view c3 = "", bool centre = false, int fitted = kMsgHeight) {
    MsgBoxModel box;
    applyStyle(box, style, c1, c2, c3);
    applyCaptionPictures(box, c1, c2, c3);
    box.CentreinMDIClient = centre;
    activateLayout(box, fitted);
    return box;
}

struct Shown {
    bool visible;
    int left;
    std::string_view caption;
};
Shown of(const ButtonModel& b) {
    return {b.visible, b.left, b.caption};
}
bool operator==(const Shown& a, const Shown& b) {
    return a.visible == b.visible && (!a.visible || (a.left == b.left && a.caption == b.caption));
}
std::ostream& operator<<(std::ostream& os, const Shown& s) {
    return os << (s.visible ? "shown " : "hidden ") << s.caption << " at " << s.left;
}

const Shown hidden{false, 0, ""};
} // namespace

TEST(MsgBoxStyles, EachStyleShowsItsButtonsInTheirSlots) {
    struct Case {
        std::int32_t style;
        Shown ok, no, cancel;
    } cases[] = {
        {0, {true, 5700, "&OK"}, hidden, hidden},
        {1, {true, 4575, "&OK"}, hidden, {true, 5700, "&Cancel"}},
        {3, {true, 3450, "&Yes"}, {true, 4575, "&No"}, {true, 5700, "&Cancel"}},
        {4, {true, 4575, "&Yes"}, {true, 5700, "&No"}, hidden},
        // No button set: only the first button, as designed.
        {2, {true, 3450, "&Yes"}, hidden, hidden},
        {16, {true, 3450, "&Yes"}, hidden, hidden},
        {-1, {true, 3450, "&Yes"}, hidden, hidden},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE("style " + std::to_string(c.style));
        const auto box = shown(c.style);
        EXPECT_EQ(of(box.cmdOK), c.ok);
        EXPECT_EQ(of(box.cmdNo), c.no);
        EXPECT_EQ(of(box.cmdCancel), c.cancel);
    }
}

TEST(MsgBoxStyles, UnknownStyleChangesNothingAndCallerCaptionsGoByPosition) {
    MsgBoxModel box;
    EXPECT_FALSE(applyStyle(box, 2, "Go", "Stop", "Wait"));
    EXPECT_EQ(box.cmdOK.caption, "&Yes");
    EXPECT_FALSE(box.btnNo);
    EXPECT_FALSE(box.btnCancel);

    // Style 1: the second caption is the Cancel button's; style 3: the third is.
    auto one = shown(1, "", "&Abort");
    EXPECT_EQ(one.cmdOK.caption, "&OK");
    EXPECT_EQ(one.cmdCancel.caption, "&Abort");
    EXPECT_EQ(one.cmdNo.caption, "&No");
    auto three = shown(3, "A", "B", "C");
    EXPECT_EQ(three.cmdOK.caption, "A");
    EXPECT_EQ(three.cmdNo.caption, "B");
    EXPECT_EQ(three.cmdCancel.caption, "C");

    // The picture property follows the argument position, whatever the style.
    EXPECT_EQ(one.cmdOK.PicturePosition, kPictureLeft);
    EXPECT_EQ(one.cmdNo.PicturePosition, kPictureNone);
    EXPECT_EQ(one.cmdCancel.PicturePosition, kPictureLeft);
    EXPECT_EQ(three.cmdCancel.PicturePosition, kPictureNone);
}

TEST(MsgBoxResults, FirstButtonAnswersOneOnlyForExactlyAmpersandOK) {
    EXPECT_EQ(clickResult(shown(0), Button::OK), kResultOk);
    EXPECT_EQ(clickResult(shown(1), Button::OK), kResultOk);
    EXPECT_EQ(clickResult(shown(4, "&OK"), Button::OK), kResultOk);
    EXPECT_EQ(clickResult(shown(0, "&Ok"), Button::OK), kResultYes);
    EXPECT_EQ(clickResult(shown(0, "OK"), Button::OK), kResultYes);
    EXPECT_EQ(clickResult(shown(3), Button::OK), kResultYes);
    EXPECT_EQ(clickResult(shown(16), Button::OK), kResultYes);
    EXPECT_EQ(clickResult(shown(3), Button::No), kResultNo);
    EXPECT_EQ(clickResult(shown(3), Button::Cancel), kResultCancel);
    EXPECT_EQ(clickResult(shown(0), Button::Close), kResultNo);
}

TEST(MsgBoxResults, ReturnValueIsAByteAndANeverShownBoxAnswersNo) {
    MsgBoxModel box;
    EXPECT_EQ(finalResult(box), kResultNo);
    setReturnValue(box, kResultCancel);
    EXPECT_EQ(finalResult(box), kResultCancel);
    setReturnValue(box, 255);
    EXPECT_EQ(box.ReturnValue, 255);
    EXPECT_THROW(setReturnValue(box, 256), CheckerError);
    EXPECT_THROW(setReturnValue(box, -1), CheckerError);
    EXPECT_EQ(box.ReturnValue, 255);
}

TEST(MsgBoxKeys, LettersAnswerOnlyWhenTheirButtonAndCaptionAgree) {
    struct Case {
        std::int32_t style;
        std::string_view caption1;
        Button y, o, n, c;
    } cases[] = {
        {0, "", Button::None, Button::OK, Button::None, Button::None},
        {1, "", Button::None, Button::OK, Button::None, Button::Cancel},
        {3, "", Button::OK, Button::None, Button::No, Button::Cancel},
        {4, "", Button::OK, Button::None, Button::No, Button::None},
        {2, "", Button::OK, Button::None, Button::None, Button::None},
        {16, "", Button::OK, Button::None, Button::None, Button::None},
        // A caller's first caption answers neither Y nor O.
        {3, "&Save", Button::None, Button::None, Button::No, Button::Cancel},
        {0, "&Yes", Button::OK, Button::None, Button::None, Button::None},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE("style " + std::to_string(c.style) + " " + std::string(c.caption1));
        const auto box = shown(c.style, c.caption1);
        EXPECT_EQ(keyTarget(box, kKeyYes), c.y);
        EXPECT_EQ(keyTarget(box, kKeyOk), c.o);
        EXPECT_EQ(keyTarget(box, kKeyNo), c.n);
        EXPECT_EQ(keyTarget(box, kKeyCancel), c.c);
        EXPECT_EQ(keyTarget(box, 'X'), Button::None);
        EXPECT_EQ(keyTarget(box, 0x0D), Button::None);
    }
}

TEST(MsgBoxKeys, AccessKeysComeFromTheFirstSingleAmpersandOfAVisibleButton) {
    EXPECT_EQ(accessKey("&Yes"), 'Y');
    EXPECT_EQ(accessKey("Sa&ve"), 'V');
    EXPECT_EQ(accessKey("Fish && &Chips"), 'C');
    EXPECT_EQ(accessKey("No key"), 0);
    EXPECT_EQ(accessKey("trailing&"), 0);
    EXPECT_EQ(accessKey(""), 0);

    const auto box = shown(1, "&Retry");
    EXPECT_EQ(accessKeyTarget(box, 'R'), Button::OK);
    EXPECT_EQ(accessKeyTarget(box, 'C'), Button::Cancel);
    EXPECT_EQ(accessKeyTarget(box, 'N'), Button::None); // "&No" is hidden in style 1
    EXPECT_EQ(accessKeyTarget(box, 0), Button::None);
}

TEST(MsgBoxLayout, OneLineShrinksByThirtyAndEveryLineGrowsWindowButtonsAndBorder) {
    const auto one = shown(3);
    EXPECT_EQ(one.windowHeight, 1320);
    EXPECT_EQ(one.shapeHeight, 1320);
    EXPECT_EQ(one.shapeWidth, kWindowWidth);
    for (const auto* b : {&one.cmdOK, &one.cmdNo, &one.cmdCancel})
        EXPECT_EQ(b->top, 780);

    const auto three = shown(3, "", "", "", false, 3 * kMsgHeight);
    EXPECT_EQ(three.windowHeight, 1320 + 2 * kMsgHeight);
    EXPECT_EQ(three.shapeHeight, three.windowHeight);
    for (const auto* b : {&three.cmdOK, &three.cmdNo, &three.cmdCancel})
        EXPECT_EQ(b->top, 780 + 2 * kMsgHeight);
}

TEST(MsgBoxLayout, PlacementIsFixedWhateverTheHeight) {
    const auto plain = shown(0);
    EXPECT_EQ(plain.windowLeft, 5000);
    EXPECT_EQ(plain.windowTop, 5000);
    const auto centred = shown(0, "", "", "", true);
    EXPECT_EQ(centred.windowLeft, 4500);
    EXPECT_EQ(centred.windowTop, (9600 - 1320) / 2);
    const auto tall = shown(0, "", "", "", true, 1995);
    EXPECT_EQ(tall.windowTop, (9600 - (1350 + 1995 - 225)) / 2);
}

TEST(MsgBoxLayout, AVeryLongMessageIsCutSoTheButtonsStayOnTheScreen) {
    const int screen = 768 * 15;
    // Short messages are untouched.
    EXPECT_EQ(capMessageHeight(585, screen, false), 585);
    EXPECT_EQ(capMessageHeight(585, screen, true), 585);
    // Not centred: the window's bottom (5000 + height) stays on the screen.
    const int capped = capMessageHeight(100000, screen, false);
    EXPECT_EQ(shown(0, "", "", "", false, capped).windowTop +
                  shown(0, "", "", "", false, capped).windowHeight,
              screen);
    // Centred: neither the top nor the bottom leaves the screen.
    const auto centred = shown(0, "", "", "", true, capMessageHeight(100000, screen, true));
    EXPECT_GE(centred.windowTop, 0);
    EXPECT_LE(centred.windowTop + centred.windowHeight, screen);
    // A tiny screen still leaves one line; an unknown screen no limit.
    EXPECT_EQ(capMessageHeight(100000, 480, false), kMsgHeight);
    EXPECT_EQ(capMessageHeight(100000, 0, true), 100000);
}

TEST(MsgBoxFocus, StartsOnNoWhenShownElseOnTheFirstButton) {
    EXPECT_EQ(focusTarget(shown(0)), Button::OK);
    EXPECT_EQ(focusTarget(shown(1)), Button::OK);
    EXPECT_EQ(focusTarget(shown(3)), Button::No);
    EXPECT_EQ(focusTarget(shown(4)), Button::No);
    EXPECT_EQ(focusTarget(shown(16)), Button::OK);
}
