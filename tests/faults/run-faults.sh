#!/usr/bin/env bash
# The fault suite: every case against the real executable under Wine, side by side, printed as
#   case | expected | observed | ok
#   tests/faults/run-faults.sh [CASE...]     (names as in the table, e.g. service-404)
set -uo pipefail
ROOT=${ROOT:-$(cd "$(dirname "$0")/../.." && pwd)}
export ROOT BUILD=${BUILD:-$ROOT/build}
cd "$ROOT"
. tests/e2e/lib.sh
. tests/faults/lib-faults.sh
. tests/faults/cases.sh
E2E_FRESH=1 e2e_template_prefix >/dev/null

if [ $# -gt 0 ]; then names=("$@"); else
    mapfile -t names < <(declare -F | sed -n 's/^declare -f case_//p' | tr '_' '-')
fi
OUT=$BUILD/faults; rm -rf "$OUT"; mkdir -p "$OUT"
echo "running ${#names[@]} fault cases side by side (most wait for the first check, ~2-4 minutes)"
printf '%s\n' "${names[@]}" | xargs -P "${FAULT_PARALLEL:-8}" -I{} bash -c '
    n={}; f=$(echo "$n" | tr - _)
    timeout 900 bash -c ". tests/faults/lib-faults.sh; . tests/faults/cases.sh; case_$f" >"'"$OUT"'/$n.out" 2>&1
    grep -q "^ROW|" "'"$OUT"'/$n.out" || echo "ROW|$n|(case ran)|no result: see '"$OUT"'/$n.out|NO" >>"'"$OUT"'/$n.out"'
rows=$(cat "$OUT"/*.out | grep -a '^ROW|' | cut -d'|' -f2- | sort)
{
    echo "case|expected|observed|ok"
    echo "$rows"
} | column -t -s'|' -o ' | '
bad=$(grep -c '|NO$' <<<"$rows")
total=$(grep -c . <<<"$rows")
echo "$((total - bad)) passed, $bad failed"
[ "$bad" -eq 0 ]
