# Registers the host components and the ADO stand-in (HostStandIn.dll) in the template prefix,
# so every scenario's prefix has them. Runs with WINEPREFIX set to the template.
set -eu
ROOT=${ROOT:-$(cd "$(dirname "$0")/../../.." && pwd)}
BUILD=${BUILD:-$ROOT/build}
DLL=$BUILD/windows/HostStandIn.dll
[ -f "$DLL" ] || { echo "missing $DLL (build first)"; exit 1; }
WINEDEBUG=-all wine regsvr32 /s "$DLL"
wineserver -w
# Proof that the identifiers now lead to this DLL.
WINEDEBUG=-all wine reg query 'HKCR\ADODB.Connection\CLSID' 2>/dev/null | tr -d '\r' |
    grep -qi 'DBD94800-2023-476D-91AE-ABE92FEA3399' || { echo "ADODB.Connection not redirected"; exit 1; }
