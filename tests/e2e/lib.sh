# End-to-end harness: the real executable under Wine, on its own X display, in a fresh checker
# folder and a fresh Wine prefix. Source it from a scenario:
#
#   . "$(dirname "$0")/../lib.sh"
#   e2e_begin my-scenario 1024x768      # folder, prefix, display; cleans up on exit
#   ...make $APP (the checker folder)...
#   e2e_start_checker                   # CheckOZProUpdate.exe in $APP, in the background
#   e2e_wait_exit 10 || fail "did not end"
#   pass "ended by itself"
#
# A scenario reports with pass/fail (one line each, counted by the runner) and figure.

ROOT=${ROOT:-$(cd "$(dirname "${BASH_SOURCE[0]}")/../.." && pwd)}
BUILD=${BUILD:-$ROOT/build}
WINBIN=$BUILD/windows
NATIVEBIN=$BUILD/native
E2E_ROOT=$BUILD/e2e
E2E_TEMPLATE=$E2E_ROOT/template-prefix
ARTEFACTS=$BUILD/artefacts
# No desktop integration, no Mono or Gecko prompts in test prefixes.
export WINEDLLOVERRIDES="winemenubuilder.exe=d;mscoree=d;mshtml=d"
export WINEDEBUG=${WINEDEBUG:--all}

# Makes the template prefix once (again when E2E_FRESH=1), then runs tests/e2e/template.d/*.sh
# in it (registering stand-ins and such). Safe to call from parallel scenarios.
e2e_template_prefix() {
    mkdir -p "$E2E_ROOT"
    (
        flock 9
        if [ "${E2E_FRESH:-0}" = 1 ] || [ ! -f "$E2E_TEMPLATE/.ready" ]; then
            e2e_boot_prefix "$E2E_TEMPLATE"
            e2e_prefix_hooks "$E2E_TEMPLATE" || exit 1
            touch "$E2E_TEMPLATE/.ready"
        fi
    ) 9>"$E2E_ROOT/.template.lock"
    export E2E_TEMPLATE
}

# A new, empty Wine prefix in $1 (the slow part: Wine's first start).
e2e_boot_prefix() {
    WINEPREFIX=$1 wineserver -k 2>/dev/null || true
    rm -rf "$1"
    WINEPREFIX=$1 wineboot -i >/dev/null 2>&1
    WINEPREFIX=$1 wineserver -w
}

# Runs tests/e2e/template.d/*.sh in the prefix $1 (registering stand-ins and such).
e2e_prefix_hooks() {
    local hook
    for hook in "$ROOT"/tests/e2e/template.d/*.sh; do
        [ -f "$hook" ] || continue
        WINEPREFIX=$1 bash "$hook" || { echo "template hook failed: $hook"; return 1; }
    done
    WINEPREFIX=$1 wineserver -w
}

# Copies the template: the large system folders are hard-linked (Wine never writes them).
e2e_new_prefix() { # $1 target
    local t=$E2E_TEMPLATE p=$1
    rm -rf "$p"; mkdir -p "$p"
    (cd "$t" && tar --exclude=./drive_c/windows/system32 --exclude=./drive_c/windows/syswow64 -cf - .) |
        (cd "$p" && tar xf -)
    cp -al "$t/drive_c/windows/system32" "$p/drive_c/windows/"
    [ -d "$t/drive_c/windows/syswow64" ] && cp -al "$t/drive_c/windows/syswow64" "$p/drive_c/windows/"
    return 0
}

E2E_PIDS=()

e2e_begin() { # $1 name, $2 screen size (default 1024x768)
    E2E_NAME=$1
    local size=${2:-1024x768}
    SCEN=$E2E_ROOT/$E2E_NAME
    rm -rf "$SCEN"; mkdir -p "$SCEN" "$ARTEFACTS"
    e2e_template_prefix
    export WINEPREFIX=$SCEN/prefix
    e2e_new_prefix "$WINEPREFIX"
    [ -n "${E2E_LOGPIXELS:-}" ] && e2e_set_logpixels "$E2E_LOGPIXELS"
    exec 8>"$SCEN/display"
    Xvfb -displayfd 8 -screen 0 "${size}x24" -nolisten tcp -nolisten unix >"$SCEN/xvfb.log" 2>&1 &
    E2E_PIDS+=($!)
    exec 8>&-
    local i
    for i in $(seq 100); do [ -s "$SCEN/display" ] && break; sleep 0.1; done
    export DISPLAY=:$(head -n1 "$SCEN/display")
    APP=$SCEN/app
    mkdir -p "$APP"
    cp "$WINBIN/CheckOZProUpdate.exe" "$APP/"
    trap e2e_end EXIT
}

e2e_set_logpixels() { # $1 dpi, in the scenario's own prefix
    wine reg add 'HKCU\Control Panel\Desktop' /v LogPixels /t REG_DWORD /d "$1" /f >/dev/null 2>&1
    wine reg add 'HKLM\System\CurrentControlSet\Hardware Profiles\Current\Software\Fonts' \
        /v LogPixels /t REG_DWORD /d "$1" /f >/dev/null 2>&1
    wineserver -w
}

e2e_end() {
    local rc=$?
    [ -n "${WINEPREFIX:-}" ] && wineserver -k 2>/dev/null
    local p
    for p in "${E2E_PIDS[@]}"; do kill "$p" 2>/dev/null; done
    wait 2>/dev/null
    return $rc
}

# Starts the checker in the background: CHECKER_PID, its output in $SCEN/checker.{out,err}.
# Message-box texts appear in checker.err (trace+msgbox).
e2e_start_checker() { # [exe path, default $APP/CheckOZProUpdate.exe]
    local exe=${1:-$APP/CheckOZProUpdate.exe}
    (cd "$(dirname "$exe")" && WINEDEBUG=-all,trace+msgbox exec wine "$exe") \
        >"$SCEN/checker.out" 2>"$SCEN/checker.err" &
    CHECKER_PID=$!
    E2E_PIDS+=($CHECKER_PID)
    CHECKER_START=$(date +%s.%N)
}

# Waits up to $1 seconds for the checker to end; CHECKER_RC holds its exit code.
e2e_wait_exit() {
    local deadline=$(($(date +%s) + $1))
    while kill -0 "$CHECKER_PID" 2>/dev/null; do
        [ "$(date +%s)" -ge "$deadline" ] && return 1
        sleep 0.2
    done
    wait "$CHECKER_PID"; CHECKER_RC=$?
    return 0
}

e2e_running() { kill -0 "$CHECKER_PID" 2>/dev/null; }

# Runs a Windows program in the scenario's prefix and display.
e2e_wine() { WINEDEBUG=-all wine "$@" 2>/dev/null | tr -d '\r'; }

# wininfo lines for top-level windows (see tools/wininfo); e.g. e2e_windows --title "Orvel Zarn Pro"
e2e_windows() { e2e_wine "$WINBIN/wininfo.exe" "$@"; }

# One field of the first wininfo line: e2e_field "$line" visible
e2e_field() { sed -n "s/.* $2=\([^ ]*\).*/\1/p" <<<" $1" | head -n1; }

# Waits up to $1 seconds until wininfo finds a window for the remaining arguments.
e2e_wait_window() {
    local deadline=$(($(date +%s) + $1)); shift
    local out
    while :; do
        out=$(e2e_windows "$@")
        [ -n "$out" ] && { echo "$out"; return 0; }
        [ "$(date +%s)" -ge "$deadline" ] && return 1
        sleep 0.5
    done
}

# Follows the checker's slide-in from the X side, which costs the sliding checker next to
# nothing (a Wine probe per poll would slow the very slide it watches), and asks Windows' own
# view only once the window has stood still for 1.5 s.
#   e2e_follow_slide SECONDS [EXE-NAME]     (default CheckOZProUpdate.exe)
# Sets SLIDE_SEEN_AT (first on screen: Wine maps no window that lies wholly off the screen),
# SLIDE_MOVED_AT (last move) and SLIDE_BEGAN_AT (when $APP/Update.INI was written, which the
# display does just before the first step) as `date +%s.%N` stamps, SLIDE_TOP (pixels, while
# mapped) and SHOWN_LINE (the wininfo line once it stands topmost).
# Calls the function named in E2E_SLIDE_HOOK after every poll. Returns 1 when the checker has
# ended or the time is up.
e2e_follow_slide() {
    local deadline=$(($(date +%s) + $1)) exe=${2:-CheckOZProUpdate.exe}
    local xwin="" geo last="" now probe_at=0
    exe=$(tr 'A-Z' 'a-z' <<<"${exe//./\\.}")
    SLIDE_SEEN_AT=""; SLIDE_MOVED_AT=""; SLIDE_TOP=""; SHOWN_LINE=""
    while :; do
        e2e_running || return 1
        # Only the main window of the checker is mapped during a slide (Wine names the X
        # window's class after the executable).
        [ -z "$xwin" ] && xwin=$(xdotool search --onlyvisible --classname "^$exe\$" 2>/dev/null | head -n1)
        if [ -n "$xwin" ]; then
            now=$(date +%s.%N)
            [ -z "$SLIDE_SEEN_AT" ] && { SLIDE_SEEN_AT=$now; SLIDE_MOVED_AT=$now; }
            geo=$(xdotool getwindowgeometry --shell "$xwin" 2>/dev/null | tr '\n' ' ')
            SLIDE_TOP=$(sed -n 's/.*Y=\([-0-9]*\).*/\1/p' <<<"$geo")
            if [ "$geo" != "$last" ]; then
                last=$geo; SLIDE_MOVED_AT=$now
            elif awk -v m="$SLIDE_MOVED_AT" -v p="$probe_at" -v n="$now" 'BEGIN { exit !(n - m >= 1.5 && n >= p) }'; then
                e2e_slide_probe && return 0
                probe_at=$(awk -v n="$now" 'BEGIN { printf "%.3f", n + 1.5 }')
            fi
        else
            # A window that stops below the screen's edge (a high dpi on a small screen) is never
            # mapped: ask Windows now and then.
            now=$(date +%s.%N)
            if awk -v p="$probe_at" -v n="$now" 'BEGIN { exit !(n >= p) }'; then
                e2e_slide_probe && return 0
                probe_at=$(awk -v n="$now" 'BEGIN { printf "%.3f", n + 5 }')
            fi
        fi
        [ -n "${E2E_SLIDE_HOOK:-}" ] && "$E2E_SLIDE_HOOK"
        [ "$(date +%s)" -ge "$deadline" ] && return 1
        sleep 0.5
    done
}

# Part of e2e_follow_slide: true when Windows says the main window stands topmost.
e2e_slide_probe() {
    local line
    line=$(e2e_windows --class CheckOZProUpdateMain)
    [ "$(e2e_field "$line" topmost)" = 1 ] || return 1
    SHOWN_LINE=$line
    SLIDE_MOVED_AT=${SLIDE_MOVED_AT:-$(date +%s.%N)}
    SLIDE_BEGAN_AT=$(stat -c %.9Y "$APP/Update.INI" 2>/dev/null || echo "${SLIDE_SEEN_AT:-$SLIDE_MOVED_AT}")
}

e2e_screenshot() { # $1 name -> $ARTEFACTS/<scenario>-<name>.png
    local f=$ARTEFACTS/$E2E_NAME-$1.png
    import -display "$DISPLAY" -window root "$f" 2>/dev/null && echo "$f"
}

# A message-box text the checker showed (trace+msgbox), or nothing.
e2e_msgbox_text() { grep -a 'MSGBOX_OnInit' "$SCEN/checker.err" | sed 's/.*MSGBOX_OnInit //' ; }

pass() { echo "PASS $E2E_NAME: $*"; }
fail() { echo "FAIL $E2E_NAME: $*"; E2E_FAILED=1; }
figure() { echo "FIGURE $E2E_NAME: $*"; }
check() { # check "description" command...
    local what=$1; shift
    if "$@"; then pass "$what"; else fail "$what"; fi
}
e2e_done() { [ -z "${E2E_FAILED:-}" ]; }

# Windows path of a Linux path (Wine maps / to Z:).
winpath() { echo "Z:$(echo "$1" | tr '/' '\\')"; }

# Seconds since a `date +%s.%N` stamp, to 0.01 s.
e2e_since() { awk -v a="$1" -v b="$(date +%s.%N)" 'BEGIN { printf "%.2f", b - a }'; }
