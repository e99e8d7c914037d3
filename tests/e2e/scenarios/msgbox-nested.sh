# The box is modal (the caller's other windows wait) and there is only one: a second call while
# it waits answers 7 at once and leaves the open box alone.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/msgbox-helpers.bash"
e2e_begin msgbox-nested 1024x768
MB_TPP=$(mb_tpp)
MB_EXE=$WINBIN/msgbox-nested.exe
if mb_show; then
    sleep 1.5 # the second call comes 0.5 s after the box
    check "still exactly one box, and it is the outer one" \
        [ "$(e2e_windows --class frmMsgBox --children | grep -c '^hwnd')|$(mb_title_of $MB_TITLE)" = "1|Nested" ]
    out=$(tr -d '\r' <"$MB_OUT")
    check "the second call answers 7 at once ($out)" grep -q '^inner=7 ' <<<"$out"
    check "the caller's other window is disabled while the box waits" grep -q 'disabled-during=1' <<<"$out"
    mb_key c
    mb_answer
    out=$(tr -d '\r' <"$MB_OUT")
    check "the outer box still answers its own button (exit $MB_RC)" [ "$MB_RC" = 2 ]
    check "the other window is enabled again afterwards" grep -q '^outer=2 enabled-after=1' <<<"$out"
else
    fail "the box did not show"; mb_answer
fi
e2e_done
