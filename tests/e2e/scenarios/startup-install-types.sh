# Each installation type finds its database where its marker files say; a ServerPath without
# its trailing separator names no database and the checker ends silently.
. "$(dirname "$0")/../lib.sh"
e2e_begin startup-install-types
export HOSTSTANDIN_LOG=$SCEN/hoststandin.log

# $1 label, rest: hostkit folder options. Sets r to "running" or "ended".
run_type() {
    local label=$1; shift
    wineserver -k 2>/dev/null; wineserver -w 2>/dev/null
    rm -rf "$APP" "$SCEN/server"; mkdir -p "$APP"; cp "$WINBIN/CheckOZProUpdate.exe" "$APP/"
    "$NATIVEBIN/hostkit" folder "$APP" "$@" >/dev/null
    [ -n "${EDIT_CLIENT_INI:-}" ] && sed -i 's/\\\r$/\r/; s/\\$//' "$APP/CLIENT.INI"
    : >"$HOSTSTANDIN_LOG"
    e2e_start_checker
    if e2e_wait_exit 20; then r=ended; else r=running; fi
}

opened() { grep -a -o 'Data Source=[^;]*' "$HOSTSTANDIN_LOG" 2>/dev/null | head -n1 | sed 's/Data Source=//'; }

run_type standalone --type standalone
check "stand-alone keeps running" [ "$r" = running ]
check "stand-alone opens <folder>\\data\\Ozp.ACCDB ($(opened))" [ "$(opened)" = "$(winpath "$APP")\\data\\Ozp.ACCDB" ]

run_type client --type client --server "$SCEN/server"
check "network client keeps running" [ "$r" = running ]
# hostkit keeps ServerPath short (a link to the server folder): it must fit the 49-character read.
serverpath=$(tr -d '\r' <"$APP/CLIENT.INI" | sed -n 's/^ServerPath=//p')
check "network client opens <ServerPath>data\\Ozp.ACCDB ($(opened))" [ "$(opened)" = "${serverpath}data\\Ozp.ACCDB" ]

run_type second --type second
check "second product keeps running" [ "$r" = running ]
check "second product opens <folder>\\data\\Odoz.Mdb ($(opened))" [ "$(opened)" = "$(winpath "$APP")\\data\\Odoz.Mdb" ]

EDIT_CLIENT_INI=1 run_type client-no-separator --type client --server "$SCEN/server"
check "ServerPath without its trailing separator: silent end" [ "$r" = ended ]
check "  ... with exit code 0" [ "${CHECKER_RC:-x}" = 0 ] 
check "no message shown in any case" [ -z "$(e2e_msgbox_text)" ]
e2e_done
