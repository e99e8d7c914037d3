# The service calls through the real MSXML2.XMLHTTP when the service misbehaves: error statuses,
# empty and large bodies, a refused or dropped connection, and a failed call after a good one.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/../service-lib.sh"
e2e_begin service-http-faults

svc_start --status 404 --answer "<html><body>404 Not Found</body></html>"
out=$(svc_probe check "$BASE" 1 S 10.3 3 K)
check "404: the error page is the answer" \
    grep -qxF "ANSWER [<html><body>404 Not Found</body></html>]" <<<"$out"
check "404: no fields, so the flag is a subscript error" grep -qx "ERROR 9|prValidateCheckInfo|Subscript out of range" <<<"$out"
svc_stop

svc_start --status 500 --answer "x,9.9,y,True"
out=$(svc_probe checknew "$BASE" 1 S 1 10.3 3)
check "500: the body is the answer, status not examined" grep -qx "UPDATE true" <<<"$out"
svc_stop

svc_start --answer ""
out=$(svc_probe check "$BASE" 1 S 10.3 3 K)
check "empty body: empty answer text, no call error" grep -qxF "ANSWER []" <<<"$out"
svc_stop

# A 1 MiB answer with NULs, non-ASCII bytes and 1000 fields comes back whole and is read.
python3 - "$SCEN/big.txt" <<'PY'
import sys
fields = ["f%d\x00\xe9" % i for i in range(1000)]
fields[3] = "False"
body = ",".join(fields).encode("latin-1")
body += b"z" * (1024 * 1024 - len(body))
open(sys.argv[1], "wb").write(body)
PY
svc_start --answer-file "$SCEN/big.txt"
out=$(svc_probe check "$BASE" 1 S 10.3 3 K)
len=$(sed -n 's/^ANSWER \[\(.*\)\]$/\1/p' <<<"$out" | sed 's/\\x[0-9A-F][0-9A-F]/#/g' | tr -d '\n' | wc -c)
figure "1 MiB answer: $len characters read back (a NUL or a non-ASCII byte counts one)"
check "1 MiB answer with NULs and 1000 fields: read whole, flag false" grep -qx "UPDATE false" <<<"$out"
check "1 MiB answer: whole length" [ "$len" -eq $((1024 * 1024)) ]
svc_stop

# Nothing listening: the HTTP layer's error with the operation's name as its source.
BASE=http://127.0.0.1:$(svc_free_port)
for op in "check $BASE 1 S 10.3 3 K|fnGetInfoCheckUpdate" "checknew $BASE 1 S 1 10.3 3|fnGetInfoCheckUpdateNewLicence" \
          "download $BASE 1 S 10.3 3 K H D|fnGetInfoDownload" "downloadnew $BASE 1 S 10.3 3 1 H|fnGetInfoDownloadNewLicence"; do
    # shellcheck disable=SC2086
    out=$(svc_probe ${op%|*})
    check "refused connection: ${op#*|} fails with its own name" grep -qE "^ERROR -?[0-9]+\|${op#*|}\|" <<<"$out"
done
check "refused connection: no answer stored" grep -qxF "LASTANSWER []" <<<"$out"
# Wine's HTTP layer reports a refused connection as 0x800C0008 (Windows: 0x800C0005 or similar).
out=$(svc_probe checknew "$BASE" 1 S 1 10.3 3)
check "refused connection: the HTTP layer's own number is passed on" \
    grep -qE "^ERROR (-2146697208|-2146697211)\|fnGetInfoCheckUpdateNewLicence\|.+" <<<"$out"

svc_start --drop
out=$(svc_probe checknew "$BASE" 1 S 1 10.3 3)
check "dropped connection: an error from fnGetInfoCheckUpdateNewLicence" \
    grep -qE "^ERROR -?[0-9]+\|fnGetInfoCheckUpdateNewLicence\|" <<<"$out"
check "dropped connection: the request was sent" \
    svc_logged "GET /SUPPORT/Downloads/CheckOZProUpdate.asp?Select=1&CustID=1&MajorVersion=10.3&ProdSubId=S&MinorVersion=3"
svc_stop

# A slow service: the call waits for the whole answer (no time-out of the client's own).
svc_start --delay-ms 3000 --latest 1=10.4.0.5
t0=$(date +%s.%N)
out=$(svc_probe check "$BASE" 1 S 10.3 3 K)
took=$(e2e_since "$t0")
figure "call to a service that answers after 3 s: $took s"
check "slow service: the call waits and gets the answer" grep -qx "UPDATE true" <<<"$out"
check "slow service: not before the answer was given" awk -v t="$took" 'BEGIN { exit !(t >= 3) }'
svc_stop

# One instance, two calls: the second fails after the service has gone.
svc_start --latest 1=10.4.0.5
flag=$SCEN/go
e2e_wine "$WINBIN/svcprobe.exe" twice "$BASE" "$(winpath "$flag")" >"$SCEN/twice.out" &
twice=$!
for i in $(seq 100); do grep -q '^WAITING' "$SCEN/twice.out" && break; sleep 0.2; done
svc_stop
touch "$flag"
wait $twice
out=$(cat "$SCEN/twice.out")
check "twice: the first call succeeded" grep -qxF "ANSWER [1,10.4.0.5,10.3.3,True]" <<<"$out"
check "twice: the second call failed with its own name" \
    grep -qE "^ERROR -?[0-9]+\|fnGetInfoCheckUpdateNewLicence\|" <<<"$out"
check "twice: the stored address is the failed call's" \
    grep -qF "ADDRESS [$BASE/SUPPORT/Downloads/CheckOZProUpdate.asp?Select=1&CustID=77&" <<<"$(tail -n2 <<<"$out")"
check "twice: the stored answer is still the first call's" \
    grep -qxF "LASTANSWER [1,10.4.0.5,10.3.3,True]" <<<"$(tail -n1 <<<"$out")"
e2e_done
