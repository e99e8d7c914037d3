# The whole road on 1024x768: at the fifteenth tick the service gets the date query and the
# customer-id check; Update.INI gets today's date; the window slides in to 8650 twips, topmost,
# with the latest version; "&Get Update" starts the updater maximized and the checker ends.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/../service-lib.sh"
. "$(dirname "$0")/tray-helpers.bash"
e2e_begin tray-whole-road 1024x768
svc_start --latest 1=10.4.0.5
tray_folder
tray_start
e2e_wait_window 30 --class CheckOZProUpdateMain >/dev/null || fail "main window never loaded"
check "tray icon shown while resident" [ -n "$(tray_tray_window)" ]
sleep 5
e2e_screenshot 1-hidden >/dev/null
check "window hidden before the check" [ "$(e2e_field "$(tray_main)" visible)" = 0 ]

# Nothing is asked before the fifteenth tick (97.5 s).
tray_wait_lines "$SVC_LOG" 1 150 || fail "no request within 150 s"
first=$(e2e_since "$CHECKER_START")
check "first request at the fifteenth tick (${first} s after start)" \
    awk -v t="$first" 'BEGIN { exit !(t >= 96 && t <= 125) }'
tray_wait_lines "$SVC_LOG" 2 30
check "date query first" [ "$(sed -n 1p "$SVC_LOG")" = "POST /SUPPORT/Downloads/QVLDATETime.asp" ]
check "customer-id check request, exact" [ "$(sed -n 2p "$SVC_LOG")" = \
    "GET /SUPPORT/Downloads/CheckOZProUpdate.asp?Select=1&CustID=4711&MajorVersion=10.3&ProdSubId=S&MinorVersion=3" ]

if tray_wait_shown 840; then
    e2e_screenshot 3-shown >/dev/null
    figure "slide-in on 1024x768 under Wine: $(awk -v a="$SLIDE_BEGAN_AT" -v b="$SHOWN_AT" 'BEGIN{printf "%.1f", b-a}') s"
    check "stops with its top at 8650 twips = 577 px (y=$(e2e_field "$SHOWN_LINE" y))" [ "$(e2e_field "$SHOWN_LINE" y)" = 577 ]
    check "left edge 15360-3435-50 = 11875 twips = 792 px (x=$(e2e_field "$SHOWN_LINE" x))" [ "$(e2e_field "$SHOWN_LINE" x)" = 792 ]
    check "client area 229 x 142 px ($(e2e_field "$SHOWN_LINE" cx) x $(e2e_field "$SHOWN_LINE" cy))" \
        [ "$(e2e_field "$SHOWN_LINE" cx)x$(e2e_field "$SHOWN_LINE" cy)" = 229x142 ]
    check "topmost and visible" [ "$(e2e_field "$SHOWN_LINE" topmost)$(e2e_field "$SHOWN_LINE" visible)" = 11 ]
    label=$(tray_title "$(tray_label 203)")
    check "Label2 reads 'Latest version available : 10.4.0.5' (got '$label')" [ "$label" = "Latest version available : 10.4.0.5" ]
    check "labels '&Get Update' and '&Cancel'" [ "$(tray_title "$(tray_label 201)")|$(tray_title "$(tray_label 202)")" = "&Get Update|&Cancel" ]
else
    e2e_screenshot 3-not-shown >/dev/null
    fail "window did not slide in and stand topmost"
fi
check "Update.INI holds today's date ($(tray_today))" \
    grep -qx "CurrDate=$(tray_today)" <(tr -d '\r' <"$APP/Update.INI")
check "no message box" [ -z "$(e2e_msgbox_text)" ]

tray_click_label 201 || fail "no '&Get Update' label to click"
if e2e_wait_exit 20; then pass "checker ended after '&Get Update'"; else fail "checker still running after '&Get Update'"; fi
tray_wait_lines "$APP/started.log" 1 10
check "updater started maximized, path quoted ($(tray_started))" \
    [ "$(tray_started)" = "KtrLiveUpdate.exe|3|\"$(winpath "$APP")\\KtrLiveUpdate.exe\"" ]
sleep 1
check "tray icon gone" [ -z "$(tray_tray_window)" ]
e2e_done
