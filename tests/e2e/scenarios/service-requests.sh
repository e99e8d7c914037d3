# The service client's four requests through the real MSXML2.XMLHTTP against update-server:
# the request lines the service receives, byte for byte, and the answers read back.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/../service-lib.sh"
e2e_begin service-requests

svc_start --latest 1=10.4.0.5 --latest 4=9.1.0.2

out=$(svc_probe check "$BASE" 1 S 10.3 3 "K 100" "")
check "customer-code check: worked example on the wire" \
    svc_logged "GET /SUPPORT/Downloads/CheckWebUpdate.asp?Select=1&txtCDKey=&MajorVersion=10.3&CustCode=K+100&ProdSubId=S&MinorVersion=3"
check "customer-code check: answer read, update flag true" \
    grep -qxF -e "ANSWER [1,10.4.0.5,10.3.3,True]" <<<"$out"
check "customer-code check: update flag true" grep -qx "UPDATE true" <<<"$out"

out=$(svc_probe checknew "$BASE" 1 S 1234 10.3 3)
check "customer-id check: worked example on the wire" \
    svc_logged "GET /SUPPORT/Downloads/CheckOZProUpdate.asp?Select=1&CustID=1234&MajorVersion=10.3&ProdSubId=S&MinorVersion=3"
check "customer-id check: update flag true" grep -qx "UPDATE true" <<<"$out"

out=$(svc_probe download "$BASE" 1 S 10.3 3 "K 100" "Plans & Advice" "")
check "customer-code download: worked example on the wire" \
    svc_logged "GET /Support/downloads/UpdateString.asp?Select=1&Setuptype=S&ReportHead=Plans+&+Advice&txtCDKey=&MajorVersion=10.3&UserType=Desktop&CustCode=K+100&Minorversion=3"

out=$(svc_probe downloadnew "$BASE" 1 S 10.3 3 1234 "Plans & Advice")
check "customer-id download: worked example on the wire" \
    svc_logged "GET /Support/downloads/OZProUpdateString.asp?Select=1&Setuptype=S&ReportHead=Plans+~~+Advice&MajorVersion=10.3&CustID=1234&Minorversion=3"
check "customer-id download: answer returned as text" grep -qxF "ANSWER [1,10.4.0.5,10.3.3,True]" <<<"$out"

# Up to date, and the other product.
out=$(svc_probe checknew "$BASE" 1 S 1234 10.4 5)
check "same version: update flag false" grep -qx "UPDATE false" <<<"$out"
out=$(svc_probe check "$BASE" 4 S 9.1 1 C1 "AB CD")
check "second product: CD key with a blank, flag true" \
    svc_logged "GET /SUPPORT/Downloads/CheckWebUpdate.asp?Select=4&txtCDKey=AB+CD&MajorVersion=9.1&CustCode=C1&ProdSubId=S&MinorVersion=1"
check "second product: 9.1.0.2 is newer than 9.1 / 1" grep -qx "UPDATE true" <<<"$out"

# Edge values: negative id, ids 0 and 255, empty values, "&" and "=" in values sent unchanged.
svc_probe checknew "$BASE" 0 S -7 "" "" >/dev/null
check "id 0, negative customer id, empty versions" \
    svc_logged "GET /SUPPORT/Downloads/CheckOZProUpdate.asp?Select=0&CustID=-7&MajorVersion=&ProdSubId=S&MinorVersion="
svc_probe check "$BASE" 255 N "" "" "A&B=C" "" >/dev/null
check "id 255, network client, & and = unchanged" \
    svc_logged "GET /SUPPORT/Downloads/CheckWebUpdate.asp?Select=255&txtCDKey=&MajorVersion=&CustCode=A&B=C&ProdSubId=N&MinorVersion="
svc_probe download "$BASE" 1 S " 10.3" "3 " "  " "a&b" "" >/dev/null
check "download: blanks at the ends and in a row become +, heading & kept" \
    svc_logged "GET /Support/downloads/UpdateString.asp?Select=1&Setuptype=S&ReportHead=a&b&txtCDKey=&MajorVersion=+10.3&UserType=Desktop&CustCode=++&Minorversion=3+"

# The address the checker itself uses comes from CHECKER_UPDATE_SERVER.
out=$(CHECKER_UPDATE_SERVER=$BASE svc_probe checknew env 1 S 5 10.3 3)
check "CHECKER_UPDATE_SERVER sets the service address" grep -qF "ADDRESS [$BASE/SUPPORT/" <<<"$out"
e2e_done
