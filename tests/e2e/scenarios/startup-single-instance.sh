# A second copy ends at once and silently; the first keeps running. Also measures start-up.
. "$(dirname "$0")/../lib.sh"
e2e_begin startup-single-instance
"$NATIVEBIN/hostkit" folder "$APP" --type standalone >/dev/null 2>&1 || { mkdir -p "$APP/data"; : >"$APP/data/Ozp.ACCDB"; }
e2e_start_checker
first=$CHECKER_PID
if line=$(e2e_wait_window 20 --class CheckOZProUpdateMain); then
    loaded=$(date +%s.%N)
    figure "start to hidden window loaded: $(awk -v a=$CHECKER_START -v b=$loaded "BEGIN{printf \"%.2f\", b-a}") s (includes wine start-up and the probe)"
    check "main window loaded hidden" [ "$(e2e_field "$line" visible)" = 0 ]
else
    fail "main window never appeared"
fi
t0=$(date +%s.%N)
e2e_start_checker
if e2e_wait_exit 15; then
    pass "second copy ends by itself ($(e2e_since $t0) s)"
    check "second copy exit code 0" [ "$CHECKER_RC" -eq 0 ]
else
    fail "second copy still running"
fi
check "second copy showed no message" [ -z "$(e2e_msgbox_text)" ]
CHECKER_PID=$first
check "first copy still running" e2e_running
check "first copy still has one main window" [ "$(e2e_windows --class CheckOZProUpdateMain | wc -l)" -eq 1 ]
figure "CheckOZProUpdate.exe size: $(stat -c %s "$WINBIN/CheckOZProUpdate.exe") bytes"
e2e_done
