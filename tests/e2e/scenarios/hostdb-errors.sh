# Each failure of the host database road reaches the last-resort box with the number and text
# the failing layer reported, and the checker ends once the box is answered.
. "$(dirname "$0")/../lib.sh"
e2e_begin hostdb-errors
export HOSTSTANDIN_LOG=$SCEN/hoststandin.log

# $1 label, $2 number, $3 description (fixed text), rest: hostkit folder options.
# PREPARE (a command) runs after the folder is made.
run_case() {
    local label=$1 number=$2 text=$3; shift 3
    wineserver -k 2>/dev/null; wineserver -w 2>/dev/null
    rm -rf "$APP"; mkdir -p "$APP"; cp "$WINBIN/CheckOZProUpdate.exe" "$APP/"
    "$NATIVEBIN/hostkit" folder "$APP" --type standalone "$@" >/dev/null || { fail "$label: hostkit"; return; }
    [ -n "${PREPARE:-}" ] && eval "$PREPARE"
    : >"$HOSTSTANDIN_LOG"
    e2e_start_checker
    local i shown=""
    for i in $(seq 60); do shown=$(e2e_msgbox_text); [ -n "$shown" ] && break; sleep 0.5; done
    if [ -z "$shown" ]; then fail "$label: no error box"; return; fi
    check "$label: box shows error $number" grep -qF "Run-time error '$number'" <<<"$shown"
    check "$label: box shows \"$text\"" grep -qF "$text" <<<"$shown"
    # Answer the box with a click on its one button, centred near the bottom edge.
    local box x y w h
    box=$(e2e_windows --class '#32770' | head -n1)
    x=$(e2e_field "$box" x); y=$(e2e_field "$box" y); w=$(e2e_field "$box" w); h=$(e2e_field "$box" h)
    [ -n "$x" ] && xdotool mousemove $((x + w / 2)) $((y + h - 22)) click 1
    if e2e_wait_exit 10; then pass "$label: ends after the box"; else fail "$label: still running after the box"; fi
}

run_case "wrong password" -2147217843 "Not a valid password." --cust-id 4711 --password not-the-one
check "  ... the provider refused the host's password" grep -q 'Connection#3.Open(.*Database Password=Zn#27-Orv!Plan", "", "", missing) -> error 0x80040E4D Not a valid password.$' "$HOSTSTANDIN_LOG"
run_case "no PlanIDs table" -2147217865 \
    "cannot find the input table or query 'PlanIDs'" --cust-id 4711 --no-table
run_case "no Plan column" -2146825023 "Item cannot be found in the collection" --cust-id 4711 --columns Settings
run_case "no Settings column" -2146825023 "Item cannot be found in the collection" --cust-id 4711 --columns Plan
run_case "missing customer row" -2146825267 "Either BOF or EOF is True" --cust-id 4711 --no-cust-row
run_case "null customer Settings" 94 "Invalid use of Null" --cust-id 4711 --cust-null
run_case "host executable missing" 53 "File not found" --cust-id 4711 --no-exe
PREPARE='WINEDEBUG=-all wine regsvr32 /u /s "$WINBIN/HostStandIn.dll"; wineserver -w' \
    run_case "host components not registered" 429 "ActiveX component can't create object" --cust-id 4711
e2e_done
