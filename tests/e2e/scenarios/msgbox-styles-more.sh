# The other button sets (4, and 2 and 16 which apply none), then the caller's captions and a
# box closed without a button.
MSGBOX_STYLES="4 2 16" MSGBOX_SCENARIO=msgbox-styles-more . "$(dirname "$0")/msgbox-styles.sh"

# Style 4 with "&OK" as the first caption answers 1; style 0 with another caption answers 6
# and no longer answers O.
if mb_show --style 4 --caption1 "&OK"; then
    mb_click $MB_OK; mb_expect 1 "style 4 with first caption &OK"
else fail "box did not show"; mb_answer; fi
if mb_show --style 0 --caption1 "&Fine"; then
    check "style 0 shows the caller's caption" [ "$(mb_title_of $MB_OK)" = "&Fine" ]
    mb_key o y; sleep 0.5
    check "a caller's first caption answers neither O nor Y" mb_still_open
    mb_key alt+f
    mb_expect 6 "style 0 with caption &Fine, by its access key Alt+F,"
else fail "box did not show"; mb_answer; fi
# Style 1 with a caller's second caption: it is the Cancel button's.
if mb_show --style 1 --caption2 "&Abort"; then
    check "style 1 shows &OK and &Abort" [ "$(mb_title_of $MB_OK)|$(mb_title_of $MB_CANCEL)" = "&OK|&Abort" ]
    mb_click $MB_CANCEL; mb_expect 2 "style 1 with caption2 &Abort, its button"
else fail "box did not show"; mb_answer; fi
# Style 3 with all three captions, answered with Enter on the focused "No" button.
if mb_show --style 3 --caption1 "Save" --caption2 "Discard" --caption3 "Back"; then
    check "style 3 shows the three captions" \
        [ "$(mb_title_of $MB_OK)|$(mb_title_of $MB_NO)|$(mb_title_of $MB_CANCEL)" = "Save|Discard|Back" ]
    mb_key Return; mb_expect 7 "style 3, Enter on the focused second button"
else fail "box did not show"; mb_answer; fi
# Tab walks cmdOK, cmdCancel, cmdNo, then the X; Space presses the focused one.
if mb_show --style 3; then
    mb_key Tab; mb_refresh
    check "Tab from &No goes to the X" [ "$(mb_focus)" = "$MB_CLOSE" ]
    mb_key Tab; mb_refresh
    check "Tab from the X goes to the first button" [ "$(mb_focus)" = "$MB_OK" ]
    mb_key Tab; mb_refresh
    check "Tab from the first button goes to &Cancel" [ "$(mb_focus)" = "$MB_CANCEL" ]
    mb_key space; mb_expect 2 "Space on &Cancel"
else fail "box did not show"; mb_answer; fi
# Closed by the system (Alt+F4): 7.
if mb_show --style 1; then
    mb_key alt+F4; mb_expect 7 "Alt+F4"
else fail "box did not show"; mb_answer; fi
e2e_done
