# The message box's geometry: growth with the message, the border following it, placement
# (fixed, not centred on the screen), dragging by the title strip, a long title, topmost.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/msgbox-helpers.bash"
e2e_begin msgbox-layout 1280x1024
MB_TPP=$(mb_tpp)

pixel() { # png x y -> "r,g,b"
    convert "$1" -crop "1x1+$2+$3" -depth 8 txt:- 2>/dev/null | sed -n 's/^0,0: *(\([0-9]*,[0-9]*,[0-9]*\).*/\1/p'
}
# Pixels for a position in twips, rounded as the box converts it.
px() { echo $((($1 + MB_TPP / 2) / MB_TPP)); }

# ---- one line, not centred
if mb_show --style 3 --message "One line"; then
    sleep 0.5
    one_h=$(($(mb_field "" h) * MB_TPP))
    line=$(($(mb_field $MB_MSG h) * MB_TPP))
    figure "one fitted line of the message: $line twips"
    check "one line is 195 twips high" [ "$line" -eq 195 ]
    check "one-line window is 1320 high (is $one_h)" [ "$one_h" -eq 1320 ]
    check "one-line buttons at top 780" \
        [ "$(mb_top $MB_OK)|$(mb_top $MB_NO)|$(mb_top $MB_CANCEL)" = "780|780|780" ]
    check "not centred: top-left at (5000, 5000) twips on 1280x1024" \
        [ "$(mb_field "" x),$(mb_field "" y)" = "$(px 5000),$(px 5000)" ]
    check "width 6855" [ "$(($(mb_field "" w) * MB_TPP))" -eq 6855 ]
    check "not topmost unless asked" [ "$(mb_field "" topmost)" = 0 ]
    shot=$(e2e_screenshot one-line)
    x=$(($(mb_field "" x) + 200)) bottom=$(($(mb_field "" y) + $(mb_field "" h) - 1))
    check "the white border runs along the bottom edge" [ "$(pixel "$shot" $x $bottom)" = "255,255,255" ]
    check "inside the border is the cream background" [ "$(pixel "$shot" $x $((bottom - 2)))" = "250,239,201" ]
    mb_key y; mb_expect 6 "one-line box, key y,"
else fail "one-line box did not show"; mb_answer; fi

# ---- three lines: two line heights taller, buttons and border following
if mb_show --style 3 --message 'First line\nSecond line\nThird line'; then
    sleep 0.5
    three=$(($(mb_field $MB_MSG h) * MB_TPP))
    h=$(($(mb_field "" h) * MB_TPP))
    check "three lines fit 3 x 195 twips (is $three)" [ "$three" -eq 585 ]
    check "three-line window is two lines taller: 1710 (is $h)" [ "$h" -eq $((1320 + 2 * 195)) ]
    check "three-line buttons at top 1170" \
        [ "$(mb_top $MB_OK)|$(mb_top $MB_NO)|$(mb_top $MB_CANCEL)" = "1170|1170|1170" ]
    check "the title strip, picture and message stay" \
        [ "$(mb_top $MB_FRAME)|$(mb_top $MB_IMAGE)|$(mb_top $MB_MSG)" = "0|465|435" ]
    shot=$(e2e_screenshot three-lines)
    x=$(($(mb_field "" x) + 200)) bottom=$(($(mb_field "" y) + $(mb_field "" h) - 1))
    check "the border follows the new height" [ "$(pixel "$shot" $x $bottom)" = "255,255,255" ]
    mb_click $MB_CANCEL; mb_expect 2 "three-line box, its Cancel button,"
else fail "three-line box did not show"; mb_answer; fi

# ---- a long line wraps at the message width
if mb_show --style 0 --message "$(printf 'wrapping words %.0s' $(seq 40))"; then
    wrapped=$(($(mb_field $MB_MSG h) * MB_TPP))
    check "a long line wraps into several lines (${wrapped} twips)" [ "$wrapped" -ge 585 ]
    check "the message keeps its width 5955" [ "$(($(mb_field $MB_MSG w) * MB_TPP))" -eq 5955 ]
    check "buttons follow the wrapped text" [ "$(mb_top $MB_OK)" -eq $((810 + wrapped - 225)) ]
    mb_key o; mb_expect 1 "wrapped box, key o,"
else fail "wrapped box did not show"; mb_answer; fi

# ---- centred: left 4500, top (9600 - height) / 2; topmost when asked
if mb_show --style 0 --message "Centred" --centre --topmost; then
    check "centred: left 4500" [ "$(($(mb_field "" x) * MB_TPP))" -eq 4500 ]
    check "centred: top (9600 - 1320) / 2" [ "$(($(mb_field "" y) * MB_TPP))" -eq $(((9600 - 1320) / 2)) ]
    check "topmost when asked" [ "$(mb_field "" topmost)" = 1 ]
    e2e_screenshot centred >/dev/null
    mb_click $MB_OK; mb_expect 1 "centred box, its OK button,"
else fail "centred box did not show"; mb_answer; fi

# ---- dragging by the title strip
if mb_show --style 0 --message "Drag me"; then
    x0=$(mb_field "" x) y0=$(mb_field "" y)
    # A point on the strip, clear of the title text and of the "X".
    gx=$((x0 + 300)) gy=$((y0 + 8))
    xdotool mousemove $gx $gy mousedown 1
    sleep 0.3
    for i in 1 2 3 4 5; do xdotool mousemove $((gx + 20 * i)) $((gy + 10 * i)); sleep 0.1; done
    xdotool mouseup 1
    sleep 0.5
    mb_refresh
    x1=$(mb_field "" x) y1=$(mb_field "" y)
    check "dragging the title strip moves the window by (100, 50) (moved $((x1 - x0)), $((y1 - y0)))" \
        [ "$((x1 - x0)),$((y1 - y0))" = "100,50" ]
    # Pressing on the message does not drag.
    xdotool mousemove $((x1 + 100)) $((y1 + 30)) mousedown 1 mousemove $((x1 + 150)) $((y1 + 60)) mouseup 1
    sleep 0.5; mb_refresh
    check "pressing elsewhere does not move it" [ "$(mb_field "" x),$(mb_field "" y)" = "$x1,$y1" ]
    mb_click $MB_CLOSE; mb_expect 7 "dragged box, its X,"
else fail "drag box did not show"; mb_answer; fi

# ---- a long title widens the title text on one line
if mb_show --style 0 --title "Msg"; then
    short_w=$(mb_field $MB_TITLE w) short_h=$(mb_field $MB_TITLE h)
    mb_click $MB_CLOSE; mb_answer
fi
long="A much longer title than the design width of the title text, on one line"
if mb_show --style 0 --title "$long"; then
    long_w=$(mb_field $MB_TITLE w) long_h=$(mb_field $MB_TITLE h)
    check "a long title widens the title text ($short_w -> $long_w px)" [ "$long_w" -gt $((3 * short_w)) ]
    check "a long title stays on one line" [ "$long_h" -eq "$short_h" ]
    check "the title keeps its left 90" [ "$(mb_left $MB_TITLE)" -eq 90 ]
    check "the title text reads back as given" [ "$(mb_title_of $MB_TITLE)" = "$long" ]
    e2e_screenshot long-title >/dev/null
    mb_click $MB_CLOSE; mb_expect 7 "long-title box, its X,"
else fail "long-title box did not show"; mb_answer; fi
e2e_done
