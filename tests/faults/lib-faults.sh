# Helpers of the fault suite: each case runs the real checker in its own prefix and display,
# observes what a user or the host would see, and prints one row: ROW|case|expected|observed|ok
. "$ROOT/tests/e2e/lib.sh"

fault_begin() { # $1 case name, $2 screen size
    FAULT=$1
    # A read-only case leaves an immutable file behind if it was cut short.
    chattr -i "$BUILD/e2e/fault-$1/app/Update.INI" 2>/dev/null
    e2e_begin "fault-$1" "${2:-1024x768}" >/dev/null
    export HOSTSTANDIN_LOG=$SCEN/hoststandin.log
}

fault_folder() { # hostkit folder options...
    "$NATIVEBIN/hostkit" folder "$APP" "$@" >/dev/null
    cp "$WINBIN/KtrLiveUpdate.exe" "$APP/"
}

fault_server() { # update-server options...
    "$NATIVEBIN/update-server" --port 0 --log "$SCEN/requests.log" "$@" >"$SCEN/server.out" 2>&1 &
    E2E_PIDS+=($!)
    local i
    for i in $(seq 100); do grep -q listening "$SCEN/server.out" 2>/dev/null && break; sleep 0.1; done
    PORT=$(sed -n 's/.*127\.0\.0\.1:\([0-9]*\).*/\1/p' "$SCEN/server.out" | head -n1)
    export CHECKER_UPDATE_SERVER=http://127.0.0.1:$PORT
}

fault_no_server() { # a port nobody listens on
    export CHECKER_UPDATE_SERVER=http://127.0.0.1:9
}

fault_start() {
    touch "$SCEN/.t0"; sleep 1
    e2e_start_checker
}

# Waits for the first check (the first request the service logs, 97.5 s after start-up) and
# then `extra` seconds more; without a service, for the check's time and the extra.
fault_wait_check() { # [extra seconds after the check, default 12]
    local extra=${1:-12} deadline
    deadline=$(($(date +%s) + 200))
    [ -z "${PORT:-}" ] && deadline=$(($(date +%s) + 110 + extra))
    while e2e_running && [ "$(date +%s)" -lt "$deadline" ]; do
        if [ -s "$SCEN/requests.log" ]; then sleep "$extra"; return; fi
        sleep 1
    done
}

# Waits until start-up is over: the checker ended, showed a box, or closed the host database.
fault_wait_startup() {
    local deadline=$(($(date +%s) + ${1:-90}))
    while e2e_running && [ "$(date +%s)" -lt "$deadline" ]; do
        [ -n "$(e2e_msgbox_text)" ] && return 0
        if grep -qE 'Connection#[0-9]+ released' "$HOSTSTANDIN_LOG" 2>/dev/null; then sleep 2; return 0; fi
        sleep 0.5
    done
}

# Answers an error box the way a user would (its OK button) and waits for the end.
fault_answer_box() {
    [ -z "$(e2e_msgbox_text)" ] && return 0
    local line hwnd i
    for i in $(seq 20); do
        line=$(e2e_windows --class '#32770' | head -n1)
        [ -n "$line" ] && break
        sleep 0.5
    done
    hwnd=$(e2e_field "$line" hwnd)
    [ -n "$hwnd" ] && e2e_wine "$WINBIN/wininfo.exe" --post "$hwnd" 0x111 1 0 # WM_COMMAND, IDOK
    e2e_wait_exit 30
}

# Waits up to $1 seconds for the window to stand topmost (the slide-in has ended).
fault_wait_shown() { e2e_follow_slide "$1"; }

# A short description of the state the user and the host see.
fault_state() {
    local s
    if e2e_running; then
        s="running"
        local line
        line=$(e2e_windows --class CheckOZProUpdateMain)
        if [ "$(e2e_field "$line" visible)" = 1 ]; then s="$s, shown"; else s="$s, hidden"; fi
    else
        wait "$CHECKER_PID" 2>/dev/null; s="ended($?)"
    fi
    local box
    box=$(e2e_msgbox_text | head -n1 | sed 's/^L"//; s/"$//; s/\\n\\n/ /' | cut -c1-70)
    [ -n "$box" ] && s="$s, box: $box"
    if [ -d "$APP/Update.INI" ]; then s="$s, Update.INI folder"
    elif [ -f "$APP/Update.INI" ]; then s="$s, Update.INI $(grep -a -o 'CurrDate=[^[:cntrl:]]*' "$APP/Update.INI" | head -n1)"
    else s="$s, no Update.INI"; fi
    local outside
    outside=$(fault_outside_writes)
    [ -n "$outside" ] && s="$s, WROTE OUTSIDE: $outside"
    echo "$s"
}

# Files written since the start anywhere but the checker folder, the harness's own files and
# Wine's own folders.
fault_outside_writes() {
    find "$SCEN" -newer "$SCEN/.t0" -type f \
        ! -path "$APP/*" ! -path "$SCEN/prefix/*.reg" ! -path "$SCEN/prefix/drive_c/users/*" \
        ! -path "$SCEN/prefix/drive_c/windows/*" ! -path "$SCEN/prefix/.update-timestamp" \
        ! -name 'checker.*' ! -name 'requests.log' ! -name 'server.out' ! -name 'hoststandin.log' \
        ! -name 'xvfb.log' ! -name 'display' ! -name '*.png' 2>/dev/null | sed "s|$SCEN/||" | head -n3 | tr '\n' ' '
}

# Prints the row. $1 expected (text), $2 observed, $3 0 when ok.
fault_row() {
    local ok=yes
    [ "$3" -eq 0 ] || ok=NO
    echo "ROW|$FAULT|$1|$2|$ok"
}

# Observed matches every extended regex given.
matches() { local o=$1; shift; local r; for r in "$@"; do grep -qE -- "$r" <<<"$o" || return 1; done; }
