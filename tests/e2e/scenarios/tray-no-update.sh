# Update flag false: nothing shown and no Update.INI. Then the date endpoint answering an error
# page: no check request at all. The checker keeps running without any message.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/../service-lib.sh"
. "$(dirname "$0")/tray-helpers.bash"
e2e_begin tray-no-update 1024x768
svc_start --latest 1=10.3.0.3
tray_folder
tray_start
tray_wait_lines "$SVC_LOG" 2 150 || fail "no check within 150 s"
sleep 4
check "flag false: check answered ($(sed -n 2p "$SVC_LOG" | cut -c1-60)...)" grep -q '^GET /SUPPORT/Downloads/CheckOZProUpdate.asp?' "$SVC_LOG"
check "flag false: nothing shown" [ "$(e2e_field "$(tray_main)" visible)" = 0 ]
check "flag false: no Update.INI" [ ! -e "$APP/Update.INI" ]

# Same address, now the date endpoint answers HTML.
port=$SVC_PORT
svc_stop
SVC_LOG=$SCEN/requests-html.log; : >"$SVC_LOG"
"$NATIVEBIN/update-server" --port "$port" --log "$SVC_LOG" --latest 1=10.4.0.5 \
    --date "<html><body>Service Unavailable</body></html>" >"$SCEN/server-html.out" 2>&1 &
E2E_PIDS+=($!)
tray_wait_lines "$SVC_LOG" 1 120 || fail "no date query at the second check"
sleep 6
check "date answered with HTML: the date query only ($(tr '\n' ';' <"$SVC_LOG"))" \
    [ "$(cat "$SVC_LOG")" = "POST /SUPPORT/Downloads/QVLDATETime.asp" ]
check "still nothing shown" [ "$(e2e_field "$(tray_main)" visible)" = 0 ]
check "still no Update.INI" [ ! -e "$APP/Update.INI" ]
check "still running" e2e_running
check "no message box" [ -z "$(e2e_msgbox_text)" ]
e2e_done
