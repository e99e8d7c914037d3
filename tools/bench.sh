#!/usr/bin/env bash
# Figures of the checker against a baseline tray program (tools/baseline), under the same Wine,
# in one run. A bench-only build shortens the check tick so that many ticks pass quickly.
set -uo pipefail
ROOT=${ROOT:-$(cd "$(dirname "$0")/.." && pwd)}
BUILD=${BUILD:-$ROOT/build}
. "$ROOT/tests/e2e/lib.sh"
STARTS=${BENCH_STARTS:-10}
TICK_MS=${BENCH_TICK_MS:-65}
IDLE_TICKS=${BENCH_IDLE_TICKS:-150}

echo "== bench build (Timer1 = $TICK_MS ms; the product keeps 6500 ms)"
cmake -S "$ROOT" -B "$BUILD/bench-windows" -DCMAKE_BUILD_TYPE=Release \
    -DCMAKE_TOOLCHAIN_FILE="$ROOT/cmake/mingw-w64-x86_64.cmake" -DCHECKER_BENCH_TIMER1_MS="$TICK_MS" >/dev/null
cmake --build "$BUILD/bench-windows" -j2 --target CheckOZProUpdate >/dev/null || exit 1
BENCH_EXE=$BUILD/bench-windows/CheckOZProUpdate.exe

e2e_template_prefix >/dev/null
E2E_NAME=bench
SCEN=$E2E_ROOT/bench
rm -rf "$SCEN"; mkdir -p "$SCEN"
export WINEPREFIX=$SCEN/prefix
e2e_new_prefix "$WINEPREFIX"
exec 8>"$SCEN/display"
Xvfb -displayfd 8 -screen 0 1024x768x24 -nolisten tcp >/dev/null 2>&1 &
E2E_PIDS=($!)
exec 8>&-
for i in $(seq 100); do [ -s "$SCEN/display" ] && break; sleep 0.1; done
export DISPLAY=:$(head -n1 "$SCEN/display")
trap e2e_end EXIT

APP=$SCEN/app
"$NATIVEBIN/hostkit" folder "$APP" --type standalone --version 10.3.0.3 --cust-id X-10042 >/dev/null
cp "$WINBIN/CheckOZProUpdate.exe" "$APP/"
cp "$BENCH_EXE" "$APP/CheckOZProUpdate-bench.exe"
cp "$WINBIN/baseline-tray.exe" "$APP/"

server() { # update-server options; sets PORT
    [ -n "${SERVER_PID:-}" ] && kill "$SERVER_PID" 2>/dev/null
    "$NATIVEBIN/update-server" --port 0 --log "$SCEN/requests.log" "$@" >"$SCEN/server.out" 2>&1 &
    SERVER_PID=$!; E2E_PIDS+=($SERVER_PID)
    for i in $(seq 100); do grep -q listening "$SCEN/server.out" 2>/dev/null && break; sleep 0.1; done
    PORT=$(sed -n 's/.*127\.0\.0\.1:\([0-9]*\).*/\1/p' "$SCEN/server.out" | head -n1)
    export CHECKER_UPDATE_SERVER=http://127.0.0.1:$PORT
}

launch() { # exe [env...]; sets PID
    wineserver -k 2>/dev/null; wineserver -w 2>/dev/null
    (cd "$APP" && exec env "${@:2}" wine "$APP/$1") >/dev/null 2>&1 &
    PID=$!; E2E_PIDS+=($PID)
    T0=$(date +%s.%N)
}

# Seconds from start until Wine's tray window shows an icon.
time_to_icon() {
    local i
    for i in $(seq 1500); do
        xdotool search --name 'Wine System Tray' >/dev/null 2>&1 && { e2e_since "$T0"; return 0; }
        sleep 0.02
    done
    echo NaN
}

median() { sort -g | awk '{ a[NR] = $1 } END { if (NR % 2) print a[(NR + 1) / 2]; else printf "%g\n", (a[NR / 2] + a[NR / 2 + 1]) / 2 }'; }
private_kib() { awk '/^Private_(Clean|Dirty)/ { s += $2 } END { print s }' "/proc/$1/smaps_rollup" 2>/dev/null; }
# CPU time of all the process's threads in nanoseconds (the scheduler's own count).
cpu_ns() { cat /proc/"$1"/task/*/schedstat 2>/dev/null | awk '{ s += $1 } END { printf "%.0f", s }'; }
ms_per_tick() { awk -v a="$1" -v b="$2" -v n="$3" 'BEGIN { printf "%.4f", (b - a) / 1e6 / n }'; }

server --latest 1=10.3.0.3 --date '<html>not a date</html>'   # no update: nothing shown

echo "== start-up to icon, $STARTS starts each"
declare -A startup memory cpu
for prog in CheckOZProUpdate.exe baseline-tray.exe; do
    : >"$SCEN/times"
    for n in $(seq "$STARTS"); do
        launch "$prog"
        time_to_icon >>"$SCEN/times"
        echo >>"$SCEN/times"
        sleep 3 # start-up over
        private_kib "$PID" >>"$SCEN/memory"
    done
    startup[$prog]=$(grep . "$SCEN/times" | median)
    memory[$prog]=$(median <"$SCEN/memory"); rm -f "$SCEN/memory"
done

echo "== CPU per tick: $IDLE_TICKS ticks of $TICK_MS ms; idle ticks measured between checks"
declare -A idle
for prog in CheckOZProUpdate-bench.exe baseline-tray.exe; do
    : >"$SCEN/requests.log"
    launch "$prog" BASELINE_TICK_MS="$TICK_MS"
    time_to_icon >/dev/null; sleep 1
    c0=$(cpu_ns "$PID")
    sleep "$(awk -v n="$IDLE_TICKS" -v t="$TICK_MS" 'BEGIN { print n * t / 1000 }')"
    c1=$(cpu_ns "$PID")
    cpu[$prog]=$(ms_per_tick "$c0" "$c1" "$IDLE_TICKS")
    # Idle ticks alone: windows of 10 ticks that start just after a check (each check ends at
    # the date query here) and end before the next one.
    sum=0; ticks=0
    for k in $(seq 12); do
        n0=$(grep -c . "$SCEN/requests.log")
        if [ "$prog" = CheckOZProUpdate-bench.exe ]; then
            for i in $(seq 100); do [ "$(grep -c . "$SCEN/requests.log")" -gt "$n0" ] && break; sleep 0.02; done
        fi
        sleep 0.15
        a=$(cpu_ns "$PID")
        sleep "$(awk -v t="$TICK_MS" 'BEGIN { print 10 * t / 1000 }')"
        b=$(cpu_ns "$PID")
        sum=$((sum + b - a)); ticks=$((ticks + 10))
    done
    idle[$prog]=$(ms_per_tick 0 "$sum" "$ticks")
done

echo "== one check that finds an update: requests and slide-in (1024x768)"
: >"$SCEN/requests.log"
server --latest 1=10.4.0.5
rm -f "$APP/Update.INI"
launch CheckOZProUpdate-bench.exe
# From the first step to the last move, followed on the X side so that the probe does not slow
# the slide it measures (to the half-second poll).
slide=NaN
CHECKER_PID=$PID
if e2e_follow_slide 900 CheckOZProUpdate-bench.exe; then
    slide=$(awk -v a="$SLIDE_BEGAN_AT" -v b="$SLIDE_MOVED_AT" 'BEGIN { printf "%.1f", b - a }')
fi
requests=$(grep -c . "$SCEN/requests.log")

size() { stat -c %s "$1"; }
imports() { x86_64-w64-mingw32-objdump -p "$1" | sed -n 's/.*DLL Name: //p' | tr 'A-Z' 'a-z' | sort -u | tr '\n' ' '; }
ratio() { awk -v a="$1" -v b="$2" 'BEGIN { if (b + 0 == 0) print "-"; else printf "%.2f", a / b }'; }

echo
{
    echo "figure|checker|baseline|ratio"
    echo "start to icon, median of $STARTS (s)|${startup[CheckOZProUpdate.exe]}|${startup[baseline-tray.exe]}|$(ratio "${startup[CheckOZProUpdate.exe]}" "${startup[baseline-tray.exe]}")"
    echo "private memory 3 s after the icon, median (KiB)|${memory[CheckOZProUpdate.exe]}|${memory[baseline-tray.exe]}|$(ratio "${memory[CheckOZProUpdate.exe]}" "${memory[baseline-tray.exe]}")"
    echo "CPU per idle tick, 120 ticks (ms)|${idle[CheckOZProUpdate-bench.exe]}|${idle[baseline-tray.exe]}|$(ratio "${idle[CheckOZProUpdate-bench.exe]}" "${idle[baseline-tray.exe]}")"
    echo "CPU per tick with a date query every 15th, $IDLE_TICKS ticks (ms)|${cpu[CheckOZProUpdate-bench.exe]}|${cpu[baseline-tray.exe]}|$(ratio "${cpu[CheckOZProUpdate-bench.exe]}" "${cpu[baseline-tray.exe]}")"
    echo "slide-in, 1024x768 (s)|$slide|-|-"
    echo "HTTP requests per check|${requests:-NaN}|-|-"
    echo "executable size (bytes)|$(size "$WINBIN/CheckOZProUpdate.exe")|$(size "$WINBIN/baseline-tray.exe")|$(ratio "$(size "$WINBIN/CheckOZProUpdate.exe")" "$(size "$WINBIN/baseline-tray.exe")")"
} | column -t -s'|' -o ' | '
echo "imported DLLs, checker:  $(imports "$WINBIN/CheckOZProUpdate.exe")"
echo "imported DLLs, baseline: $(imports "$WINBIN/baseline-tray.exe")"
