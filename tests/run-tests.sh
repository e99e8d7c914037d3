#!/usr/bin/env bash
# Runs every test and ends with one summary line: "N passed, N failed".
#   tests/run-tests.sh [--unit-only] [SCENARIO-NAME...]
set -uo pipefail
ROOT=${ROOT:-$(cd "$(dirname "$0")/.." && pwd)}
cd "$ROOT"
BUILD=${BUILD:-$ROOT/build}
OUT=$BUILD/test-results
rm -rf "$OUT"; mkdir -p "$OUT"
passed=0; failed=0

count_gtest() { # $1 label, $2 log
    local ok bad
    # gtest's own closing lines: "[  PASSED  ] N tests." and "[  FAILED  ] N tests, listed below:"
    ok=$(sed -n 's/^\[  PASSED  \] \([0-9]*\) test.*/\1/p' "$2" | tail -n1)
    bad=$(sed -n 's/^\[  FAILED  \] \([0-9]*\) test.*/\1/p' "$2" | tail -n1)
    ok=${ok:-0}; bad=${bad:-0}
    if ! grep -q '^\[==========\] .* ran' "$2"; then bad=$((bad + 1)); fi # crashed before the end
    echo "$1: $ok passed, $bad failed"
    passed=$((passed + ok)); failed=$((failed + bad))
}

echo "== unit tests (native)"
$BUILD/native/tests/unit/unit_tests >"$OUT/unit-native.log" 2>&1
grep -E '^\[  FAILED  \]|: Failure$' "$OUT/unit-native.log" | head -20
count_gtest "native" "$OUT/unit-native.log"

. tests/e2e/lib.sh
E2E_FRESH=1 e2e_template_prefix >"$OUT/template.log" 2>&1 || { echo "cannot make the Wine prefix"; cat "$OUT/template.log"; }

echo "== unit tests (Windows build under Wine)"
WINEPREFIX=$E2E_TEMPLATE WINEDEBUG=-all timeout 300 wine $BUILD/windows/tests/unit/unit_tests.exe \
    >"$OUT/unit-wine.log" 2>&1
WINEPREFIX=$E2E_TEMPLATE wineserver -k 2>/dev/null || true
tr -d '\r' <"$OUT/unit-wine.log" >"$OUT/unit-wine.txt"
grep -E '^\[  FAILED  \]|: Failure$' "$OUT/unit-wine.txt" | head -20
count_gtest "wine" "$OUT/unit-wine.txt"

if [ "${1:-}" != "--unit-only" ]; then
    echo "== end-to-end scenarios (real executable under Wine)"
    tests/e2e/run-all.sh "$@" | tee "$OUT/e2e.log"
    e2e_ok=$(grep -c '^PASS ' "$OUT/e2e.log" || true)
    e2e_bad=$(grep -c '^FAIL ' "$OUT/e2e.log" || true)
    passed=$((passed + e2e_ok)); failed=$((failed + e2e_bad))
fi

echo "$passed passed, $failed failed"
[ "$failed" -eq 0 ]
