# Hostile host data: damaged database files and customer texts that are no customer id each end
# in the error box with the layer's number and text, never in a hang or a made-up identity;
# odd texts that do convert leave the checker running.
. "$(dirname "$0")/../lib.sh"
e2e_begin hostdb-bad-input
export HOSTSTANDIN_LOG=$SCEN/hoststandin.log
DB='$APP/data/Ozp.ACCDB'

# $1 label, $2 number or "running", $3 description, rest: hostkit folder options.
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
    for i in $(seq 40); do
        shown=$(e2e_msgbox_text); [ -n "$shown" ] && break
        e2e_running || break
        grep -q '^Connection#3 released$' "$HOSTSTANDIN_LOG" && break
        sleep 0.5
    done
    if [ "$number" = running ]; then
        check "$label: no error box, the checker runs on" [ -z "$shown" ] && e2e_running
        check "$label: the host deciphered the text as stored" grep -qF -- "-> \"$text\"" "$HOSTSTANDIN_LOG"
        return
    fi
    if [ -z "$shown" ]; then fail "$label: no error box"; return; fi
    check "$label: box shows error $number and \"$text\"" \
        eval 'grep -qF "Run-time error '"'$number'"'" <<<"$shown" && grep -qF "$text" <<<"$shown"'
    local box x y w h
    box=$(e2e_windows --class '#32770' | head -n1)
    x=$(e2e_field "$box" x); y=$(e2e_field "$box" y); w=$(e2e_field "$box" w); h=$(e2e_field "$box" h)
    [ -n "$x" ] && xdotool mousemove $((x + w / 2)) $((y + h - 22)) click 1
    e2e_wait_exit 10 || fail "$label: still running after the box"
}

PREPARE=": >$DB" run_case "empty database file" -2147467259 "Unrecognized database format" --cust-id 4711
PREPARE="truncate -s 120 $DB" run_case "truncated database file" -2147467259 "Unrecognized database format" --cust-id 4711
PREPARE="head -c 4096 /dev/urandom >$DB" run_case "garbage database file" -2147467259 "Unrecognized database format" --cust-id 4711
export HOSTSTANDIN_PLAN='<empty>'
run_case "empty password text from the host" 9 "Subscript out of range" --cust-id 4711
unset HOSTSTANDIN_PLAN

run_case "customer text AB (65AB)" 13 "Type mismatch" --cust-id AB
run_case "customer number beyond 32 bits" 6 "Overflow" --cust-id 2147483648
run_case "customer text 88.1e99 after the rule" 6 "Overflow" --cust-id X.1e99
run_case "empty customer text" 5 "Invalid procedure call or argument" --cust-id ""
run_case "customer text with NULs" 13 "Type mismatch" --cust-id x --no-cust-row --row-hex 14=4100310032
run_case "blanks only (code 32 and blanks)" running "     " --cust-id "     "
run_case "255 characters" running "$(printf 'A%.0s' $(seq 250))12345" --cust-id "$(printf 'A%.0s' $(seq 250))12345"
run_case "non-ASCII first character" running '\xE9-00001' --cust-id x --no-cust-row --row-hex 14=E92D3030303031
e2e_done
