# Which reads happen: without a customer id flag the customer row is never read and the version
# is never asked for; a host executable without a version ends start-up silently; the password
# is the first "~" field of what the host components yield.
. "$(dirname "$0")/../lib.sh"
e2e_begin hostdb-flow
export HOSTSTANDIN_LOG=$SCEN/hoststandin.log

# $1 label, rest: hostkit folder options. Sets r to "running" or "ended".
run_type() {
    local label=$1; shift
    wineserver -k 2>/dev/null; wineserver -w 2>/dev/null
    rm -rf "$APP"; mkdir -p "$APP"; cp "$WINBIN/CheckOZProUpdate.exe" "$APP/"
    "$NATIVEBIN/hostkit" folder "$APP" "$@" >/dev/null || fail "$label: hostkit"
    : >"$HOSTSTANDIN_LOG"
    e2e_start_checker
    if e2e_wait_exit 10; then r=ended; else r=running; fi
    # On a loaded machine start-up may still be reading: wait for the connection to go.
    local i
    for i in $(seq 60); do
        [ "$r" = ended ] || grep -q '^Connection#3 released$' "$HOSTSTANDIN_LOG" && break
        sleep 0.5
    done
    cp "$HOSTSTANDIN_LOG" "$ARTEFACTS/hostdb-flow-$label.log"
}
has() { grep -qF -- "$1" "$HOSTSTANDIN_LOG"; }
hasnt() { ! grep -qF -- "$1" "$HOSTSTANDIN_LOG"; }
closed() { [ "$(tail -n 2 "$HOSTSTANDIN_LOG")" = "$(printf '%s\n' 'Connection#3.Close() -> Empty' 'Connection#3 released')" ]; }

# An executable without a version would end the checker if prGetVersion ran.
run_type no-flag --type standalone --no-version
check "no row 999: start-up completes" [ "$r" = running ]
check "  ... row 999 looked for" has 'Recordset#4.Filter = "Plan = 999"'
check "  ... the customer row is not read" hasnt '"Plan = 14"'
check "  ... nor the version's customer-row read" hasnt 'Select settings,plan from planids'
check "  ... the connection closed and released" closed

run_type flag-null --type standalone --flag-null --cust-id X-10042 --no-version
check "null Settings in row 999: start-up completes" [ "$r" = running ]
check "  ... the customer row is not read" hasnt '"Plan = 14"'
check "  ... nor the version's customer-row read" hasnt 'Select settings,plan from planids'
check "  ... the connection closed and released" closed

run_type no-version --type standalone --cust-id 4711 --no-version
check "host executable without a version: silent end" [ "$r" = ended ]
check "  ... exit code 0" [ "${CHECKER_RC:-x}" = 0 ]
check "  ... after the settings read" has 'Recordset#4.Filter = "Plan = 14"'
check "  ... before the customer-row read" hasnt 'Select settings,plan from planids'
check "  ... no message" [ -z "$(e2e_msgbox_text)" ]

run_type second --type second --cust-id " 4711 "
check "second product with a customer id: start-up completes" [ "$r" = running ]
check "  ... filters its own row 89" has 'Recordset#4.Filter = "Plan = 89"'
check "  ... finds its own row 89" has 'Recordset#10.Find("plan = 89", 0, 1, 1) -> Empty'
check "  ... the stored text comes back untrimmed from the host" has '.DecryptURL("'"$("$NATIVEBIN/hostkit" encipher " 4711 ")"'") -> " 4711 "'

export HOSTSTANDIN_PLAN='Zn#27-Orv!Plan'
run_type plan-without-tilde --type standalone --cust-id 4711
check "plan text without \"~\": the whole text is the password" [ "$r" = running ]
export HOSTSTANDIN_PLAN='first~second~third'
run_type plan-with-tildes --type standalone --cust-id 4711 --password first
check "plan text with several \"~\": the first field is the password" [ "$r" = running ]
check "  ... and only it" has 'Jet OLEDB:Database Password=first", "", "", missing) -> Empty'
unset HOSTSTANDIN_PLAN
e2e_done
