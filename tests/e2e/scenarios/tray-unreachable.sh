# No update service at the address: the check ends quietly and the checker keeps running.
# Then a real right click on the icon in Wine's tray window opens the menu, and "&Check Update"
# starts the updater maximized and ends the checker.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/../service-lib.sh"
. "$(dirname "$0")/tray-helpers.bash"
e2e_begin tray-unreachable 1024x768
BASE=http://127.0.0.1:$(svc_free_port)
tray_folder
tray_start
e2e_wait_window 30 --class CheckOZProUpdateMain >/dev/null || fail "main window never loaded"
sleep 3
# A shell restart loses the icon; the "TaskbarCreated" broadcast brings it back.
hwnd=$(tray_hwnd)
check "icon in Wine's tray window" [ -n "$(tray_tray_window)" ]
e2e_wine "$WINBIN/traypoke.exe" delete "$hwnd"
sleep 2
check "icon lost with the shell (the tray window hides)" [ -z "$(tray_tray_window)" ]
e2e_wine "$WINBIN/traypoke.exe" created "$hwnd"
sleep 2
check "icon added again on TaskbarCreated" [ -n "$(tray_tray_window)" ]
sleep 100
check "server unreachable at the fifteenth tick: still running" e2e_running
check "no message box" [ -z "$(e2e_msgbox_text)" ]
check "nothing shown" [ "$(e2e_field "$(tray_main)" visible)" = 0 ]

tray=$(tray_tray_window)
if [ -n "$tray" ]; then
    t0=$(date +%s.%N)
    xdotool mousemove --window "$tray" 10 10 click 3
    if tray_wait_menu 10; then
        figure "real tray right-click to menu shown: $(e2e_since "$t0") s (poll of 0.1 s plus the probe's start)"
        e2e_screenshot menu >/dev/null
        pass "right-button release on the tray icon opens the menu"
        xdotool key Down Return
        if e2e_wait_exit 15; then pass "'&Check Update' ends the checker"; else fail "still running after '&Check Update'"; fi
        tray_wait_lines "$APP/started.log" 1 10
        check "'&Check Update' started the updater maximized ($(tray_started))" \
            grep -q '^KtrLiveUpdate.exe|3|' <(tray_started)
    else
        fail "no menu after a right click on the tray icon"
    fi
else
    fail "no 'Wine System Tray' window"
fi
e2e_done
