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
    ok=$(grep -c '^\[       OK \]' "$2" || true)
    bad=$(grep -cE '^\[  FAILED  \] [A-Za-z0-9_]+\.[A-Za-z0-9_/]+' "$2" || true)
    if ! grep -q '^\[  PASSED  \]' "$2" && [ "$bad" -eq 0 ]; then bad=1; fi # crashed before the end
    echo "$1: $ok passed, $bad failed"
    passed=$((passed + ok)); failed=$((failed + bad))
}

echo "== unit tests (native)"
$BUILD/native/tests/unit/unit_tests --gtest_brief=1 >"$OUT/unit-native.log" 2>&1
grep -E '^\[  FAILED  \]|Failure' "$OUT/unit-native.log" | head -20
count_gtest "native" "$OUT/unit-native.log"

. tests/e2e/lib.sh
E2E_FRESH=1 e2e_template_prefix >"$OUT/template.log" 2>&1 || { echo "cannot make the Wine prefix"; cat "$OUT/template.log"; }

echo "== unit tests (Windows build under Wine)"
WINEPREFIX=$E2E_TEMPLATE WINEDEBUG=-all timeout 300 wine $BUILD/windows/tests/unit/unit_tests.exe \
    --gtest_brief=1 >"$OUT/unit-wine.log" 2>&1
WINEPREFIX=$E2E_TEMPLATE wineserver -k 2>/dev/null || true
tr -d '\r' <"$OUT/unit-wine.log" >"$OUT/unit-wine.txt"
grep -E '^\[  FAILED  \]|Failure' "$OUT/unit-wine.txt" | head -20
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
