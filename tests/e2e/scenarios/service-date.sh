# The date query through the real MSXML2.XMLHTTP (POST) and the platform's date recognition.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/../service-lib.sh"
e2e_begin service-date

for answer in "12/04/2026" "December 4, 2026" "4 Dec 2026" "2026-12-04" " 12/4/2026 "; do
    svc_start --date "$answer"
    out=$(svc_probe date "$BASE")
    check "date answer '$answer' gives 12/04/2026" grep -qxF "DATE [12/04/2026]" <<<"$out"
    svc_stop
done
check "the query is a POST to the date endpoint" svc_logged "POST /SUPPORT/Downloads/QVLDATETime.asp"

svc_start --status 500 --date "<html><body>Server Error</body></html>"
out=$(svc_probe date "$BASE")
check "an HTML error page comes back unchanged" \
    grep -qxF "DATE [<html><body>Server Error</body></html>]" <<<"$out"
svc_stop

svc_start --date ""
out=$(svc_probe date "$BASE")
check "an empty answer stays empty" grep -qxF "DATE []" <<<"$out"
svc_stop

svc_start --date "13/13/2026"
out=$(svc_probe date "$BASE")
check "an impossible date comes back unchanged" grep -qxF "DATE [13/13/2026]" <<<"$out"
svc_stop

svc_start
out=$(CHECKER_UPDATE_SERVER=$BASE svc_probe date env)
check "the service's own date, at the address from CHECKER_UPDATE_SERVER" \
    grep -qxF "DATE [$(date +%m/%d/%Y)]" <<<"$out"
svc_stop

out=$(svc_probe date "http://127.0.0.1:$(svc_free_port)")
check "an unreachable service gives one of the two failure texts" \
    grep -qxE 'DATE \[(99999|Service provider is unavailable\. Please try later)\]' <<<"$out"
svc_start --drop
out=$(svc_probe date "$BASE")
check "a dropped connection gives one of the two failure texts" \
    grep -qxE 'DATE \[(99999|Service provider is unavailable\. Please try later)\]' <<<"$out"
svc_stop
e2e_done
