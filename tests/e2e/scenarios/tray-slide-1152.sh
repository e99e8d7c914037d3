# On 1152x864 the slide stops at 10150 twips (1000 message runs per step); the tray menu works
# on the shown window, and "&Close" ends the checker without the updater.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/../service-lib.sh"
. "$(dirname "$0")/tray-helpers.bash"
e2e_begin tray-slide-1152 1152x864
svc_start --latest 1=10.4.0.5
tray_folder
tray_start
# Paced by 4.85 million message-pump calls: on a loaded 2-core machine this takes minutes.
if tray_wait_shown 840; then
    e2e_screenshot 3-shown >/dev/null
    figure "slide-in on 1152x864 under Wine: $(awk -v a="$SLIDE_BEGAN_AT" -v b="$SHOWN_AT" 'BEGIN{printf "%.1f", b-a}') s"
    check "stops at 10150 twips = 677 px (y=$(e2e_field "$SHOWN_LINE" y))" [ "$(e2e_field "$SHOWN_LINE" y)" = 677 ]
    check "left edge 17280-3435-50 twips = 920 px (x=$(e2e_field "$SHOWN_LINE" x))" [ "$(e2e_field "$SHOWN_LINE" x)" = 920 ]
    check "topmost" [ "$(e2e_field "$SHOWN_LINE" topmost)" = 1 ]
else
    fail "window did not slide in"
fi
e2e_windows --post "$(tray_hwnd)" 1400 0 0x205 >/dev/null
if tray_wait_menu 10; then
    pass "menu opens while the window is shown"
    xdotool key Down Down Return
    if e2e_wait_exit 15; then pass "'&Close' ends the checker"; else fail "still running after '&Close'"; fi
else
    fail "no menu on the shown window"
fi
check "no updater started" [ ! -e "$APP/started.log" ]
check "no message box" [ -z "$(e2e_msgbox_text)" ]
e2e_done
