# Without the host database the checker ends by itself, silently, before any icon.
. "$(dirname "$0")/../lib.sh"
e2e_begin startup-no-database
echo "[General]" >"$APP/Application.INI"
e2e_start_checker
if e2e_wait_exit 30; then
    pass "ends by itself (within 30 s on a loaded machine)"
    check "exit code 0" [ "$CHECKER_RC" -eq 0 ]
else
    fail "still running after 30 s"
fi
check "no message shown" [ -z "$(e2e_msgbox_text)" ]
check "no tray icon added" [ -z "$(xdotool search --name 'Wine System Tray' 2>/dev/null)" ]
e2e_done
