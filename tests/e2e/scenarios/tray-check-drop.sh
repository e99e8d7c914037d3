# The service answers the date query, then drops the connection of the check request: the tick
# ends quietly like an unreachable server, and the next check comes 15 ticks later.
. "$(dirname "$0")/../lib.sh"
. "$(dirname "$0")/../service-lib.sh"
. "$(dirname "$0")/tray-helpers.bash"
e2e_begin tray-check-drop 1024x768
SVC_LOG=$SCEN/requests.log; : >"$SVC_LOG"
port=$(svc_free_port)
# A service that dies between the two requests: dates are answered, checks are dropped.
python3 - "$port" "$SVC_LOG" >"$SCEN/server.out" 2>&1 <<'PY' &
import socket, sys, time
port, log = int(sys.argv[1]), sys.argv[2]
s = socket.socket(); s.setsockopt(socket.SOL_SOCKET, socket.SO_REUSEADDR, 1)
s.bind(("127.0.0.1", port)); s.listen(8)
while True:
    c, _ = s.accept()
    data = b""
    while b"\r\n\r\n" not in data:
        chunk = c.recv(4096)
        if not chunk: break
        data += chunk
    line = data.split(b"\r\n", 1)[0].decode("latin-1")
    method, target = (line.split(" ") + ["", ""])[:2]
    with open(log, "a") as f: f.write(f"{method} {target}\n")
    if method == "POST":
        body = time.strftime("%m/%d/%Y").encode()
        c.sendall(b"HTTP/1.1 200 OK\r\nContent-Type: text/plain\r\nContent-Length: %d\r\nConnection: close\r\n\r\n" % len(body) + body)
    c.close()
PY
E2E_PIDS+=($!)
BASE=http://127.0.0.1:$port
tray_folder
tray_start
tray_wait_lines "$SVC_LOG" 2 150 || fail "no check request within 150 s"
t1=$(e2e_since "$CHECKER_START")
sleep 5
check "date answered, then the check request dropped ($(tr '\n' ';' <"$SVC_LOG"))" \
    grep -q '^GET /SUPPORT/Downloads/CheckOZProUpdate.asp?' "$SVC_LOG"
check "the checker keeps running" e2e_running
check "no error box over the dropped request" [ -z "$(e2e_msgbox_text)" ]
check "no Update.INI" [ ! -e "$APP/Update.INI" ]
tray_wait_lines "$SVC_LOG" 3 120 || fail "no next check"
gap=$(awk -v a="$t1" -v b="$(e2e_since "$CHECKER_START")" 'BEGIN { printf "%.1f", b - a }')
check "next check 15 ticks later (${gap} s)" awk -v g="$gap" 'BEGIN { exit !(g >= 90 && g <= 106) }'
e2e_done
