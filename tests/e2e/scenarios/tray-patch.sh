# A network client picks up a patch from its server folder. UpdateInfo.INI is read on every tick,
# so one run walks through the offers: a hostile name, a patch already applied, a patch whose file
# is missing (nothing happens, and the check still runs at the fifteenth tick), then a real offer
# with a blank in its name: copied and started in a normal window within one tick; the checker ends.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/../service-lib.sh"
. "$(dirname "$0")/tray-helpers.bash"
e2e_begin tray-patch 1024x768
svc_start --answer "1,10.4.0.5,10.3.3,False"
SRV=$SCEN/srv/share
mkdir -p "$SRV"
tray_folder --type client --server "$SRV"
offer() { # BASEMAJOR BASEMINOR MAJOR MINOR NAME
    printf '[VERSIONINFO]\r\nBaseVersMajor=%s\r\nBaseVersMinor=%s\r\nVersMajorAvai=%s\r\nVersMinorAvai=%s\r\nPatcFileName=%s\r\n' \
        "$@" >"$SRV/UpdateInfo.INI"
}
cp "$WINBIN/OZProPatch.exe" "$SCEN/srv/evil.exe"
cp "$WINBIN/OZProPatch.exe" "$SRV/applied.exe"
cp "$WINBIN/OZProPatch.exe" "$SRV/OZ Patch 10.3.5.exe"
nothing_started() { ! find "$SCEN" -name started.log | grep -q . && [ ! -e "$SCEN/evil.exe" ] && [ -z "$(ls "$APP" | grep -i -e evil -e applied -e 'OZ Patch')" ]; }

offer 10.3 3 10.3 5 '..\evil.exe'
tray_start
sleep 22
check "hostile name '..\\evil.exe': nothing copied or started" nothing_started
offer 10.3 2 10.3 5 applied.exe
sleep 14
check "patch already applied (base 10.3 / 2): nothing happens" nothing_started
offer 10.3 3 10.3 5 missing.exe
tray_wait_lines "$SVC_LOG" 2 150 || fail "no check at the fifteenth tick"
check "file missing: nothing happens, and the check runs at the fifteenth tick" \
    grep -q '^GET /SUPPORT/Downloads/CheckOZProUpdate.asp?Select=1&CustID=4711&MajorVersion=10.3&ProdSubId=N&MinorVersion=3$' "$SVC_LOG"
check "  ... with nothing started" nothing_started
check "still running" e2e_running

offer 10.3 3 10.3 5 'OZ Patch 10.3.5.exe'
t0=$(date +%s.%N)
if e2e_wait_exit 15; then
    pass "valid offer: the checker ends within one tick ($(e2e_since "$t0") s)"
    check "exit code 0" [ "$CHECKER_RC" = 0 ]
else
    fail "checker still running with a valid offer"
fi
check "patch copied into the checker folder" cmp -s "$SRV/OZ Patch 10.3.5.exe" "$APP/OZ Patch 10.3.5.exe"
tray_wait_lines "$APP/started.log" 1 10
check "patch started from the checker folder in a normal window, path quoted ($(tray_started))" \
    [ "$(tray_started)" = "OZ Patch 10.3.5.exe|1|\"$(winpath "$APP")\\OZ Patch 10.3.5.exe\"" ]
check "no message box" [ -z "$(e2e_msgbox_text)" ]
e2e_done
