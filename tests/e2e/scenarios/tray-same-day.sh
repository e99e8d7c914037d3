# Started again on a day already recorded in Update.INI: every check runs, nothing is shown,
# the file is unchanged, and the checks come 15 ticks apart. Then the tray menu: it opens on
# the icon's callback, closes when the user clicks elsewhere, and "&Close" ends the checker
# without the updater.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/../service-lib.sh"
. "$(dirname "$0")/tray-helpers.bash"
e2e_begin tray-same-day 1024x768
svc_start --latest 1=10.4.0.5
tray_folder
printf '[General]\r\nCurrDate=%s\r\n' "$(tray_today)" >"$APP/Update.INI"
before=$(md5sum <"$APP/Update.INI")
tray_start
e2e_wait_window 30 --class CheckOZProUpdateMain >/dev/null
cpu0=$(tray_cpu); idle0=$(date +%s.%N)

tray_wait_lines "$SVC_LOG" 2 150 || fail "no first check within 150 s"
t1=$(e2e_since "$CHECKER_START")
tray_wait_lines "$SVC_LOG" 4 150 || fail "no second check"
t2=$(e2e_since "$CHECKER_START")
check "two checks, each a date query and a customer-id check ($(wc -l <"$SVC_LOG") requests)" \
    [ "$(grep -c '^GET /SUPPORT/Downloads/CheckOZProUpdate.asp?Select=1&CustID=4711&' "$SVC_LOG")" = 2 ]
gap=$(awk -v a="$t1" -v b="$t2" 'BEGIN { printf "%.1f", b - a }')
figure "time between two checks: $gap s (15 ticks of 6.5 s)"
cpu1=$(tray_cpu); idle=$(e2e_since "$idle0")
figure "checker CPU over ${idle} s of ticks (two checks): $(awk -v a="$cpu0" -v b="$cpu1" 'BEGIN{printf "%.2f", b-a}') s; for 10 minutes about $(awk -v a="$cpu0" -v b="$cpu1" -v t="$idle" 'BEGIN{printf "%.2f", (b-a)*600/t}') s"
check "next check 15 ticks later (${gap} s)" awk -v g="$gap" 'BEGIN { exit !(g >= 92 && g <= 106) }'
sleep 3
check "nothing shown" [ "$(e2e_field "$(tray_main)" visible)" = 0 ]
check "Update.INI unchanged" [ "$(md5sum <"$APP/Update.INI")" = "$before" ]
check "still running" e2e_running

# The callback message as the shell sends it for a right-button release.
hwnd=$(tray_hwnd)
t0=$(date +%s.%N)
e2e_windows --post "$hwnd" 1400 0 0x205 >/dev/null
if tray_wait_menu 10; then
    figure "callback to menu shown: $(e2e_since "$t0") s (includes the probe's own start)"
    e2e_screenshot menu >/dev/null
    pass "popup menu opens while the window is hidden"
    xdotool mousemove 600 300 click 1
    sleep 1.5
    check "a click elsewhere closes the menu" tray_menu_closed
    check "the checker keeps running after the menu closed" e2e_running
else
    fail "no popup menu after the callback"
fi
e2e_windows --post "$hwnd" 1400 0 0x202 >/dev/null # a left click: nothing of its own
sleep 1.5
check "a left click opens no menu" tray_menu_closed
e2e_windows --post "$hwnd" 1400 0 0x205 >/dev/null
tray_wait_menu 10 || fail "menu did not open again"
xdotool key Down Down Return
if e2e_wait_exit 15; then pass "'&Close' ends the checker"; else fail "checker still running after '&Close'"; fi
check "no updater started" [ ! -e "$APP/started.log" ]
check "no message box" [ -z "$(e2e_msgbox_text)" ]
e2e_done
