#!/usr/bin/env bash
# The checker at work: a demo host folder (stand-alone main product 10.3.0.3 with a customer id),
# the local update service offering 10.4, the real checker under Wine. Waits for the first check
# (97.5 s after start), saves a screenshot of the window that slid in, prints what the service
# received and what the checker wrote, answers "&Get Update" and shows the updater's start.
set -uo pipefail
ROOT=${ROOT:-$(cd "$(dirname "$0")/.." && pwd)}
BUILD=${BUILD:-$ROOT/build}
. "$ROOT/tests/e2e/lib.sh"

DEMO=$BUILD/demo
PIDS=()
cleanup() {
    [ -n "${WINEPREFIX:-}" ] && command -v wineserver >/dev/null && WINEPREFIX=$WINEPREFIX wineserver -k 2>/dev/null
    local p; for p in "${PIDS[@]}"; do kill "$p" 2>/dev/null; done
    wait 2>/dev/null
}
trap cleanup EXIT
trap 'echo; echo "stopped."; exit 130' INT TERM

say() { printf '%s\n' "$*"; }
T0=$(date +%s)
stage() { say "== [$(( $(date +%s) - T0 )) s] $*"; }

stage "packages for the build"
"$ROOT/run" packages build || exit 1
rm -rf "$DEMO"; mkdir -p "$DEMO"
export WINEPREFIX=$DEMO/prefix

# Wine installs and its prefix makes its first start while the checker compiles; on a fresh
# machine both take about as long.
(
    "$ROOT/run" packages runtime --no-update && DISPLAY= e2e_boot_prefix "$WINEPREFIX"
) >"$DEMO/setup.log" 2>&1 &
SETUP=$!
PIDS+=($SETUP)
stage "building the checker and the host stand-ins; Wine is set up beside it (log: $DEMO/setup.log)"
rm -f "$BUILD/build.log"
"$ROOT/run" quiet-build hostkit -- CheckOZProUpdate HostStandIn hoststub hoststub-versioned || exit 1
stage "checker built"
wait "$SETUP" || { say "setting up Wine failed:"; cat "$DEMO/setup.log"; exit 1; }
stage "Wine ready"
e2e_prefix_hooks "$WINEPREFIX" >>"$DEMO/setup.log" 2>&1 || { cat "$DEMO/setup.log"; exit 1; }

stage "preparing the demo host folder and the update service"
APP=$DEMO/OrvelZarnPro
"$NATIVEBIN/hostkit" folder "$APP" --type standalone --version 10.3.0.3 --cust-id X-10042 \
    --application "ORVEL ZARN PRO" >/dev/null
cp "$WINBIN/CheckOZProUpdate.exe" "$APP/"

# The service is first asked 97.5 s after the start, so it builds and starts during that wait;
# the checker is told its address now.
free_port() {
    local p
    for p in $(shuf -i 20000-60000 -n 50); do
        (exec 3<>"/dev/tcp/127.0.0.1/$p") 2>/dev/null || { echo "$p"; return 0; }
    done
    return 1
}
PORT=$(free_port) || { say "no free port on 127.0.0.1"; exit 1; }
say "update service: http://127.0.0.1:$PORT (offers 10.4.0.5 for product 1)"

if [ -n "${DISPLAY:-}" ] && xdpyinfo >/dev/null 2>&1; then
    say "display: $DISPLAY (yours)"
else
    exec 8>"$DEMO/display"
    Xvfb -displayfd 8 -screen 0 1024x768x24 -nolisten tcp >/dev/null 2>&1 &
    PIDS+=($!)
    exec 8>&-
    for i in $(seq 100); do [ -s "$DEMO/display" ] && break; sleep 0.1; done
    export DISPLAY=:$(head -n1 "$DEMO/display")
    say "display: $DISPLAY (virtual, 1024x768)"
fi

stage "starting CheckOZProUpdate.exe in $APP"
(cd "$APP" && CHECKER_UPDATE_SERVER=http://127.0.0.1:$PORT WINEDEBUG=-all exec wine "$APP/CheckOZProUpdate.exe") \
    >"$DEMO/checker.out" 2>&1 &
CHECKER=$!
PIDS+=($CHECKER)
start=$(date +%s)

# The service, the updater and the window probe build during the wait for the first check.
"$ROOT/run" quiet-build update-server -- KtrLiveUpdate wininfo >"$DEMO/late-build.out" 2>&1 &
LATE=$!
PIDS+=($LATE)
SERVER=""
server_ready() {
    [ -n "$SERVER" ] && return 0
    wait "$LATE" || { echo; cat "$DEMO/late-build.out"; exit 1; }
    cp "$WINBIN/KtrLiveUpdate.exe" "$APP/"
    "$NATIVEBIN/update-server" --port "$PORT" --latest 1=10.4.0.5 --log "$DEMO/requests.log" \
        >"$DEMO/server.out" 2>&1 &
    SERVER=$!
    PIDS+=($SERVER)
    for i in $(seq 50); do grep -q listening "$DEMO/server.out" 2>/dev/null && return 0; sleep 0.1; done
    echo; say "the update service did not start:"; cat "$DEMO/server.out"; exit 1
}

# Progress until the window has slid in and stands topmost.
demo_progress() {
    local left
    left=$(awk -v s="$start" -v n="$(date +%s)" 'BEGIN { l = s + 97.5 - n; if (l < 0) l = 0; printf "%d", l }')
    # The service starts once built, and at the latest just before the first check.
    if [ -z "$SERVER" ] && { ! kill -0 "$LATE" 2>/dev/null || [ "$left" -le 5 ]; }; then server_ready; fi
    if [ -n "$SLIDE_TOP" ]; then
        printf '\r  window sliding in: top at %s px ...            ' "$SLIDE_TOP"
    elif [ "$left" -gt 0 ]; then
        printf '\r  first update check in %3d s                    ' "$left"
    else
        printf '\r  checking with the update service ...          '
    fi
}
CHECKER_PID=$CHECKER
if ! E2E_SLIDE_HOOK=demo_progress e2e_follow_slide 600; then
    echo
    if kill -0 "$CHECKER" 2>/dev/null; then say "no window after 600 s"; else say "the checker ended unexpectedly"; fi
    exit 1
fi
line=$SHOWN_LINE
echo
stage "window shown $(( $(date +%s) - start )) s after the start: $line"
SHOT=$DEMO/shown-window.png
import -display "$DISPLAY" -window root "$SHOT" 2>/dev/null
say "screenshot: $SHOT"
say "== requests the update service received"
cat "$DEMO/requests.log"
say "== $APP/Update.INI"
tr -d '\r' <"$APP/Update.INI"

stage "answering \"&Get Update\""
x=$(e2e_field "$line" x); y=$(e2e_field "$line" y)
# The label lies on the left button bar: 120, 1785 twips inside Picture1, 1500 x 255.
# Picture1 sits 120 twips above the client area, so the label spans client y 111-128 px.
xdotool mousemove $((x + 58)) $((y + 119)) sleep 0.3 click 1
for i in $(seq 60); do kill -0 "$CHECKER" 2>/dev/null || break; sleep 0.5; done
if kill -0 "$CHECKER" 2>/dev/null; then say "the checker is still running"; exit 1; fi
say "checker ended"
for i in $(seq 20); do [ -s "$APP/started.log" ] && break; sleep 0.5; done
say "== updater start recorded by KtrLiveUpdate.exe (EXE|SHOW-STATE|COMMAND-LINE; 3 = maximized)"
tr -d '\r' <"$APP/started.log" 2>/dev/null || say "(no started.log)"
say "screenshot of the shown window: $SHOT"
stage "done"
