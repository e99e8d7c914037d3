# The message box with awkward input on a small screen: empty and very long messages with line
# breaks, tabs, "&" and non-ASCII text, empty and very long titles, captions longer than a button.
# Each box must show, answer and close, with its answer buttons inside the window and on screen.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/msgbox-helpers.bash"
e2e_begin msgbox-bad-input 800x600
MB_TPP=$(mb_tpp)
SCREEN_H=600 SCREEN_W=800

# Every shown answer button lies inside the window, and the window's bottom on the screen.
buttons_reachable() {
    local wx wy ww wh id x y w h
    wx=$(mb_field "" x) wy=$(mb_field "" y) ww=$(mb_field "" w) wh=$(mb_field "" h)
    [ $((wy + wh)) -le $SCREEN_H ] || return 1
    for id in $MB_OK $MB_NO $MB_CANCEL $MB_CLOSE; do
        [ "$(mb_field $id visible)" = 1 ] || continue
        x=$(mb_field $id x) y=$(mb_field $id y) w=$(mb_field $id w) h=$(mb_field $id h)
        [ "$x" -ge "$wx" ] && [ $((x + w)) -le $((wx + ww)) ] || return 1
        [ "$y" -ge "$wy" ] && [ $((y + h)) -le $((wy + wh)) ] || return 1
    done
}

# case: label, expected answer, how to answer (key:K or click:ID), demo arguments...
# SHOT=name saves a screenshot of the box first.
box_case() {
    local label=$1 want=$2 how=$3; shift 3
    if mb_show "$@"; then
        if [ -n "${SHOT:-}" ]; then sleep 0.5; e2e_screenshot "$SHOT" >/dev/null; fi
        check "$label: answer buttons inside the window and on the screen" buttons_reachable
        case $how in
        key:*) mb_key "${how#key:}" ;;
        click:*) mb_click "${how#click:}" ;;
        esac
        mb_expect "$want" "$label"
    else
        fail "$label: the box did not show"
        mb_answer
    fi
}

# Messages.
box_case "empty message" 1 key:o --style 0 --message ""
check "empty message: the one-line height 1320" [ "$(($(mb_field "" h) * MB_TPP))" -eq 1320 ]
check "not centred: top-left at (5000, 5000) twips on 800x600 as well" \
    [ "$(mb_field "" x),$(mb_field "" y)" = "$(((5000 + MB_TPP / 2) / MB_TPP)),$(((5000 + MB_TPP / 2) / MB_TPP))" ]

odd=$(printf 'Tabs\there\tand & ampersands && more &x\\nGrüße, café, naïve, Ελληνικά, 日本語\\n')
SHOT=odd-text box_case "tabs, ampersands, non-ASCII" 6 key:y --style 3 --message "$odd" --title "Grüße & 日本"

long=$(head -c 10000 < <(yes $'A long message line with words & symbols\t\\n' | tr -d '\n'))
SHOT=long-message box_case "10,000-character message" 7 key:n --style 4 --message "$long"
box_case "10,000-character message, centred" 2 key:c --style 1 --centre --message "$long"
check "centred long message: the window's top stays on the screen" [ "$(mb_field "" y)" -ge 0 ]

one_word=$(head -c 10000 < /dev/zero | tr '\0' 'W')
box_case "10,000 characters without a blank" 7 click:$MB_CLOSE --style 0 --message "$one_word"

# Titles.
box_case "empty title" 7 click:$MB_CLOSE --style 0 --title "" --message "No title"
title=$(head -c 500 < <(yes 'Title & text ' | tr -d '\n'))
SHOT=long-title box_case "500-character title" 7 click:$MB_CLOSE --style 0 --title "$title" --message "Long title"

# Captions longer than a button.
cap="A caption far longer than any button could hold"
SHOT=long-captions box_case "long captions" 6 click:$MB_OK --style 3 --caption1 "$cap" --caption2 "$cap" --caption3 "$cap"
check "long captions read back exactly" [ "$(mb_title_of $MB_OK)" = "$cap" ]
check "long captions leave the button size alone" [ "$(($(mb_field $MB_OK w) * MB_TPP))" -eq 1065 ]
e2e_done
