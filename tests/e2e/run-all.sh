#!/usr/bin/env bash
# Runs the end-to-end scenarios side by side (most of them wait on the checker's timers).
# Each prints PASS/FAIL lines (at most 20 minutes each); figures come out as "FIGURE name: value" lines.
#   tests/e2e/run-all.sh [NAME...]   (default: every scenarios/*.sh)
set -uo pipefail
ROOT=${ROOT:-$(cd "$(dirname "$0")/../.." && pwd)}
cd "$ROOT"
export BUILD=${BUILD:-$ROOT/build}
PARALLEL=${E2E_PARALLEL:-6}
if [ $# -gt 0 ]; then
    scenarios=(); for n in "$@"; do scenarios+=("tests/e2e/scenarios/${n%.sh}.sh"); done
else
    # The slowest (a full check and a slide-in) start first, so they overlap the short ones.
    # The slide-ins take their turns: a slide is millions of message-pump calls, each a round
    # trip to the wineserver, and two at once slow each other down many times over.
    scenarios=($(ls tests/e2e/scenarios/tray-slide-*.sh tests/e2e/scenarios/tray-*.sh \
        tests/e2e/scenarios/*.sh | awk '!seen[$0]++'))
fi
mkdir -p "$BUILD/e2e"
printf '%s\n' "${scenarios[@]}" |
    xargs -P "$PARALLEL" -I{} bash -c 'n=$(basename {} .sh); lock=; case $n in tray-slide-*|tray-whole-road) lock="flock $BUILD/e2e/.slide.lock";; esac; $lock timeout 1200 bash {} >$BUILD/e2e/$n.out 2>&1; rc=$?; grep -E "^(PASS|FAIL|FIGURE) " $BUILD/e2e/$n.out; [ $rc -eq 0 ] || grep -qE "^FAIL " $BUILD/e2e/$n.out || echo "FAIL $n: scenario exited $rc (see $BUILD/e2e/$n.out)"'
