# On 1280x1024 (any size but the two named ones) the slide stops at 6150 twips; "&Cancel" on
# the shown window ends the checker without the updater.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/../service-lib.sh"
. "$(dirname "$0")/tray-helpers.bash"
e2e_begin tray-slide-1280 1280x1024
svc_start --latest 1=10.4.0.5
tray_folder
tray_start
if tray_wait_shown 840; then
    e2e_screenshot 3-shown >/dev/null
    figure "slide-in on 1280x1024 under Wine: $(awk -v a="$SLIDE_BEGAN_AT" -v b="$SHOWN_AT" 'BEGIN{printf "%.1f", b-a}') s"
    check "stops at 6150 twips = 410 px (y=$(e2e_field "$SHOWN_LINE" y))" [ "$(e2e_field "$SHOWN_LINE" y)" = 410 ]
    check "left edge 19200-3435-50 twips = 1048 px (x=$(e2e_field "$SHOWN_LINE" x))" [ "$(e2e_field "$SHOWN_LINE" x)" = 1048 ]
    check "topmost" [ "$(e2e_field "$SHOWN_LINE" topmost)" = 1 ]
else
    fail "window did not slide in"
fi
tray_click_label 202 || fail "no '&Cancel' label"
if e2e_wait_exit 15; then pass "'&Cancel' ends the checker"; else fail "still running after '&Cancel'"; fi
check "no updater started" [ ! -e "$APP/started.log" ]
check "no message box" [ -z "$(e2e_msgbox_text)" ]
sleep 1
check "tray icon gone" [ -z "$(tray_tray_window)" ]
e2e_done
