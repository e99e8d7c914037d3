# Helpers of the message-box scenarios (sourced after lib.sh; not a scenario itself).
# One box at a time: mb_show starts msgbox-demo.exe with arguments and waits for the box,
# mb_info/mb_child read its windows, mb_click/mb_key answer it, mb_answer collects the result.

MB_EXE=$WINBIN/msgbox-demo.exe
# Control ids of frmMsgBox's children.
MB_FRAME=1 MB_TITLE=2 MB_CLOSE=3 MB_IMAGE=4 MB_MSG=5 MB_OK=6 MB_NO=7 MB_CANCEL=8
MB_SEQ=0

mb_tpp() { # twips per pixel of the scenario's screen
    local dpi
    dpi=$(e2e_wine "$WINBIN/wininfo.exe" --dpi | sed -n 's/dpi=//p')
    echo $((1440 / ${dpi:-96}))
}

# mb_show ARGS...: the box on screen; MB_PID, MB_OUT, MB_INFO (wininfo lines), MB_XWIN.
mb_show() {
    MB_SEQ=$((MB_SEQ + 1))
    MB_OUT=$SCEN/box$MB_SEQ.out
    (cd "$SCEN" && exec wine "$MB_EXE" "$@") >"$MB_OUT" 2>"$SCEN/box$MB_SEQ.err" &
    MB_PID=$!
    E2E_PIDS+=($MB_PID)
    local deadline=$(($(date +%s) + 30))
    MB_INFO=
    while [ "$(date +%s)" -lt "$deadline" ]; do
        MB_INFO=$(e2e_windows --class frmMsgBox --children)
        # Shown, and the activation has moved the focus onto a button.
        if [ "$(e2e_field "$(head -n1 <<<"$MB_INFO")" visible)" = 1 ] && grep -q '^  .* focus=1 ' <<<"$MB_INFO"; then
            break
        fi
        MB_INFO=
        sleep 0.3
    done
    [ -n "$MB_INFO" ] || return 1
    MB_XWIN=$(xdotool search --onlyvisible --name '^Message$' 2>/dev/null | head -n1)
    return 0
}

mb_refresh() { MB_INFO=$(e2e_windows --class frmMsgBox --children); }

# A field of the window line, or of the child with control id $1 ("" for the window itself).
mb_field() { # id field
    if [ -z "$1" ]; then
        e2e_field "$(head -n1 <<<"$MB_INFO")" "$2"
    else
        e2e_field "$(grep " id=$1 " <<<"$MB_INFO" | grep '^  ' | head -n1)" "$2"
    fi
}
mb_title_of() { grep " id=$1 " <<<"$MB_INFO" | grep '^  ' | head -n1 | sed 's/.* title=//'; }

# Child position relative to the window, in twips.
mb_left() { echo $((($(mb_field "$1" x) - $(mb_field "" x)) * MB_TPP)); }
mb_top() { echo $((($(mb_field "$1" y) - $(mb_field "" y)) * MB_TPP)); }

# The id of the child that holds the focus, or nothing.
mb_focus() { grep '^  ' <<<"$MB_INFO" | grep ' focus=1 ' | sed -n 's/.* id=\([0-9]*\) .*/\1/p' | head -n1; }

mb_click() { # id: a real mouse click in the middle of the child
    local x y w h
    x=$(mb_field "$1" x) y=$(mb_field "$1" y) w=$(mb_field "$1" w) h=$(mb_field "$1" h)
    xdotool mousemove $((x + w / 2)) $((y + h / 2)) click 1
}

mb_key() { # key names for xdotool, pressed one after the other
    [ -n "$MB_XWIN" ] && xdotool windowfocus "$MB_XWIN" 2>/dev/null
    local k
    for k in "$@"; do
        xdotool key "$k"
        sleep 0.2
    done
}

# Waits for the demo to end: MB_RC exit code, MB_RESULT the printed result (or "none").
mb_answer() {
    local deadline=$(($(date +%s) + 30))
    while kill -0 "$MB_PID" 2>/dev/null; do
        if [ "$(date +%s)" -ge "$deadline" ]; then
            # Close the box the way the system would, so that it cannot cover the next one.
            local hwnd
            for hwnd in $(e2e_windows --class frmMsgBox | sed -n 's/^hwnd=\([^ ]*\).*/\1/p'); do
                e2e_wine "$WINBIN/wininfo.exe" --post "$hwnd" 0x10 0 0
            done
            sleep 1
            kill "$MB_PID" 2>/dev/null
            MB_RC=timeout MB_RESULT=none
            return 1
        fi
        sleep 0.2
    done
    wait "$MB_PID"
    MB_RC=$?
    MB_RESULT=$(tr -d '\r' <"$MB_OUT" | sed -n 's/^result=//p')
    [ -n "$MB_RESULT" ] || MB_RESULT=none
    return 0
}

mb_still_open() { kill -0 "$MB_PID" 2>/dev/null && [ -n "$(e2e_windows --class frmMsgBox)" ]; }

# Checks that the answer equals $1 in both the printed result and the exit code.
mb_expect() { # expected description
    mb_answer
    if [ "$MB_RESULT" = "$1" ] && [ "$MB_RC" = "$1" ]; then
        pass "$2 answers $1"
    else
        fail "$2 answers $1 (printed $MB_RESULT, exit $MB_RC)"
    fi
}
