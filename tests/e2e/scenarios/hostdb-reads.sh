# The host database road on a stand-alone folder with a customer id: the exact calls the
# database stand-in receives, in order, and the connection closed before the window hides.
. "$(dirname "$0")/../lib.sh"
e2e_begin hostdb-reads
export HOSTSTANDIN_LOG=$SCEN/hoststandin.log
"$NATIVEBIN/hostkit" folder "$APP" --type standalone --cust-id X-10042 >/dev/null
e2e_start_checker
line=$(e2e_wait_window 20 --class CheckOZProUpdateMain) || fail "main window never appeared"
# The window exists from the start; wait until start-up has let go of the database.
for i in $(seq 60); do grep -q '^Connection#3 released$' "$HOSTSTANDIN_LOG" && break; sleep 0.5; done
check "checker keeps running" e2e_running
check "main window hidden" [ "$(e2e_field "$line" visible)" = 0 ]
check "no message shown" [ -z "$(e2e_msgbox_text)" ]
cp "$HOSTSTANDIN_LOG" "$ARTEFACTS/hostdb-reads.log" 2>/dev/null
calls() { grep -v -e '^new ' -e ' released$' "$HOSTSTANDIN_LOG"; }

db=$(winpath "$APP")'\data\Ozp.ACCDB'
conn="Provider=Microsoft.ACE.OLEDB.12.0;Data Source=$db;Persist Security Info=False;Jet OLEDB:Database Password=Zn#27-Orv!Plan"
check "exact connection string, empty user and password, options unspecified" \
    grep -qxF "Connection#3.Open(\"$conn\", \"\", \"\", missing) -> Empty" "$HOSTSTANDIN_LOG"
check "the key and plan code reach the host components" \
    grep -qxF 'clsProtect#2.SecretKey = "Q\x07v\xA7L\x1Fz"' "$HOSTSTANDIN_LOG"
flag=$("$NATIVEBIN/hostkit" encipher 1)
cust=$("$NATIVEBIN/hostkit" encipher X-10042)
# The expected sequence of database calls (object numbers as created).
expected=$(cat <<EXP
Connection#3.State -> 0
Connection#3.Open("$conn", "", "", missing) -> Empty
Recordset#4.Open("Select * from PlanIDs ", <Connection#3>, 3, 1, missing) -> Empty
Recordset#4.Filter = 0
Recordset#4.Filter = "Plan = 999"
Recordset#4.EOF -> False
Recordset#4.Fields -> <Fields#5>
Fields#5.Item("Settings") -> <Field#6>
Field#6.Value -> "$flag"
Recordset#4.Filter = 0
Recordset#4.Filter = "Plan = 14"
Recordset#4.Fields -> <Fields#7>
Fields#7.Item("Settings") -> <Field#8>
Field#8.Value -> "$cust"
Recordset#4.Close() -> Empty
Recordset#10.Open("Select settings,plan from planids", <Connection#3>, 3, 1, missing) -> Empty
Recordset#10.Find("plan = 14", 0, 1, 1) -> Empty
Recordset#10.Fields -> <Fields#11>
Fields#11.Item(0) -> <Field#12>
Field#12.Value -> "$cust"
Recordset#10.State -> 1
Recordset#10.Close() -> Empty
Connection#3.State -> 1
Connection#3.Close() -> Empty
EXP
)
got=$(calls | grep -E '^(Connection|Recordset|Fields|Field)#')
if [ "$got" = "$expected" ]; then pass "database calls in order with the exact SQL, filter and find texts"
else fail "database calls differ:"; diff <(echo "$expected") <(echo "$got") | head -20; fi
check "the connection is closed and released last, nothing touches the database after" \
    [ "$(tail -n 3 "$HOSTSTANDIN_LOG")" = "$(printf '%s\n' 'Connection#3.State -> 1' 'Connection#3.Close() -> Empty' 'Connection#3 released')" ]
check "the customer row text is deciphered by a protection component made for it" \
    [ "$(grep -c '^clsProtect#[0-9]*.DecryptURL("'"$cust"'") -> "X-10042"$' "$HOSTSTANDIN_LOG")" = 2 ]
check "every recordset released" [ "$(grep -c '^Recordset#[0-9]* released$' "$HOSTSTANDIN_LOG")" = 2 ]
e2e_done
