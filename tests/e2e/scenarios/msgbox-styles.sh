# The message box's button sets: for each style the buttons shown, their slots and captions,
# where the focus starts, and the answer of every button, every key and the "X".
# MSGBOX_STYLES picks the styles (the runner uses two files to share the work).
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/msgbox-helpers.bash"
e2e_begin "${MSGBOX_SCENARIO:-msgbox-styles}" 1024x768
MB_TPP=$(mb_tpp)
STYLES=${MSGBOX_STYLES:-0 1 3}

# Per style: "id:left:caption" of the visible answer buttons, the focused id, the answers of the
# buttons ("id=result"), of the keys ("key=result"), and the keys that must do nothing.
declare -A SHOWN FOCUS CLICKS KEYS IDLE
SHOWN[0]="$MB_OK:5700:&OK"
FOCUS[0]=$MB_OK; CLICKS[0]="$MB_OK=1"; KEYS[0]="o=1"; IDLE[0]="y n c"
SHOWN[1]="$MB_OK:4575:&OK $MB_CANCEL:5700:&Cancel"
FOCUS[1]=$MB_OK; CLICKS[1]="$MB_OK=1 $MB_CANCEL=2"; KEYS[1]="o=1 c=2"; IDLE[1]="y n"
SHOWN[3]="$MB_OK:3450:&Yes $MB_NO:4575:&No $MB_CANCEL:5700:&Cancel"
FOCUS[3]=$MB_NO; CLICKS[3]="$MB_OK=6 $MB_NO=7 $MB_CANCEL=2"; KEYS[3]="y=6 n=7 c=2"; IDLE[3]="o"
SHOWN[4]="$MB_OK:4575:&Yes $MB_NO:5700:&No"
FOCUS[4]=$MB_NO; CLICKS[4]="$MB_OK=6 $MB_NO=7"; KEYS[4]="y=6 Y=6 n=7"; IDLE[4]="o c"
for s in 2 16; do
    SHOWN[$s]="$MB_OK:3450:&Yes"
    FOCUS[$s]=$MB_OK; CLICKS[$s]="$MB_OK=6"; KEYS[$s]="y=6"; IDLE[$s]="o n c"
done

visible_buttons() { # "id:left:caption" of the shown answer buttons, in id order
    local id
    for id in $MB_OK $MB_NO $MB_CANCEL; do
        [ "$(mb_field $id visible)" = 1 ] && printf '%s ' "$id:$(mb_left $id):$(mb_title_of $id)"
    done
}

for style in $STYLES; do
    # What the box shows, with the "X" as its answer.
    if mb_show --style "$style" --message "Style $style"; then
        sleep 0.5
        e2e_screenshot "style$style" >/dev/null
        got=$(visible_buttons)
        check "style $style shows ${SHOWN[$style]}" [ "${got% }" = "${SHOWN[$style]}" ]
        check "style $style starts with the focus on button $(mb_title_of ${FOCUS[$style]})" \
            [ "$(mb_focus)" = "${FOCUS[$style]}" ]
        # Keys that answer nothing here, then the "X".
        mb_key ${IDLE[$style]}
        sleep 0.5
        check "style $style: keys ${IDLE[$style]} do nothing" mb_still_open
        mb_refresh
        mb_click $MB_CLOSE
        mb_expect 7 "style $style: the X"
    else
        fail "style $style: the box did not show"
        mb_answer
        continue
    fi
    for c in ${CLICKS[$style]}; do
        id=${c%=*} want=${c#*=}
        if mb_show --style "$style" --message "Style $style"; then
            name=$(mb_title_of "$id")
            mb_click "$id"
            mb_expect "$want" "style $style: clicking $name"
        else
            fail "style $style: the box did not show"; mb_answer
        fi
    done
    for k in ${KEYS[$style]}; do
        key=${k%=*} want=${k#*=}
        if mb_show --style "$style" --message "Style $style"; then
            mb_key "$key"
            mb_expect "$want" "style $style: key $key"
        else
            fail "style $style: the box did not show"; mb_answer
        fi
    done
done
e2e_done
