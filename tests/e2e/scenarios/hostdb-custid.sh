# The customer id the update service receives, derived from the host's customer row: three
# installations side by side (each in its own Wine prefix), one service, the first check each.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/../service-lib.sh"
e2e_begin hostdb-custid
svc_start --latest 1=10.3.0.3
export CHECKER_UPDATE_SERVER=$BASE

EXTRA_PREFIXES=()
hostdb_end() {
    local p
    for p in "${EXTRA_PREFIXES[@]}"; do WINEPREFIX=$p wineserver -k 2>/dev/null; done
    e2e_end
}
trap hostdb_end EXIT

# $1 index, $2 customer text: a folder and a prefix of its own, checker started.
start_install() {
    local app=$SCEN/app$1 prefix=$SCEN/prefix$1
    mkdir -p "$app"; cp "$WINBIN/CheckOZProUpdate.exe" "$app/"
    "$NATIVEBIN/hostkit" folder "$app" --type standalone --version 10.3.0.3 --cust-id "$2" >/dev/null
    e2e_new_prefix "$prefix"
    EXTRA_PREFIXES+=("$prefix")
    WINEPREFIX=$prefix e2e_start_checker "$app/CheckOZProUpdate.exe"
}
start_install 1 "X-10042"
start_install 2 " 4711 "
start_install 3 "4712.5"
start_install 4 "-3.5"

deadline=$(($(date +%s) + 200))
while [ "$(grep -c 'CheckOZProUpdate.asp?' "$SVC_LOG")" -lt 4 ] && [ "$(date +%s)" -lt "$deadline" ]; do sleep 2; done
cp "$SVC_LOG" "$ARTEFACTS/hostdb-custid-requests.log"
checked() { grep 'CheckOZProUpdate.asp?' "$SVC_LOG" | grep -q -- "CustID=$1&\|CustID=$1\$"; }
check "X-10042 gives the customer id 8810042" checked 8810042
check "\" 4711 \" gives 4711" checked 4711
check "4712.5 rounds half to even: 4712" checked 4712
check "-3.5 rounds half to even: -4" checked -4
check "the installed version goes with it" grep -q 'MajorVersion=10.3&.*MinorVersion=3' "$SVC_LOG"
e2e_done
