# The message box on a 120 dpi screen: its twips are converted with the measured 12 twips per
# pixel, so the window, the slots, the growth and the placement keep their design in twips.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/msgbox-helpers.bash"
E2E_LOGPIXELS=120 e2e_begin msgbox-dpi 1024x768
MB_TPP=$(mb_tpp)
check "the screen measures 12 twips per pixel" [ "$MB_TPP" -eq 12 ]
px() { echo $((($1 + MB_TPP / 2) / MB_TPP)); }
rel_x() { echo $(($(mb_field "$1" x) - $(mb_field "" x))); }
rel_y() { echo $(($(mb_field "$1" y) - $(mb_field "" y))); }

if mb_show --style 3 --message 'Line one\nLine two'; then
    e2e_screenshot style3 >/dev/null
    m=$(mb_field $MB_MSG h) # the fitted message, in pixels
    figure "two message lines at 120 dpi: $m px"
    check "window 6855 twips wide" [ "$(mb_field "" w)" -eq "$(px 6855)" ]
    check "window at (5000, 5000) twips" [ "$(mb_field "" x),$(mb_field "" y)" = "$(px 5000),$(px 5000)" ]
    check "slots at 3450, 4575, 5700 twips" \
        [ "$(rel_x $MB_OK),$(rel_x $MB_NO),$(rel_x $MB_CANCEL)" = "$(px 3450),$(px 4575),$(px 5700)" ]
    check "window grows by the fitted text: 1350 + $((m * MB_TPP)) - 225 twips" \
        [ "$(mb_field "" h)" -eq "$(px $((1350 + m * MB_TPP - 225)))" ]
    check "buttons follow: 810 + $((m * MB_TPP)) - 225 twips" \
        [ "$(rel_y $MB_OK)" -eq "$(px $((810 + m * MB_TPP - 225)))" ]
    check "buttons 1065 x 435 twips" \
        [ "$(mb_field $MB_OK w)x$(mb_field $MB_OK h)" = "$(($(px 4515) - $(px 3450)))x$(($(px 1245) - $(px 810)))" ]
    mb_key c; mb_expect 2 "the 120 dpi box, key c,"
else fail "the box did not show at 120 dpi"; mb_answer; fi
e2e_done
