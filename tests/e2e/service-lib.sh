# Helpers for the service scenarios (sourced after lib.sh and e2e_begin is called after it).
# svc_start [update-server options]: starts update-server on a free port; sets BASE, SVC_LOG.
svc_start() {
    SVC_LOG=$SCEN/requests-$RANDOM.log
    : >"$SVC_LOG"
    local out=$SCEN/server-$RANDOM.out
    "$NATIVEBIN/update-server" --port 0 --log "$SVC_LOG" "$@" >"$out" 2>&1 &
    SVC_PID=$!
    E2E_PIDS+=($SVC_PID)
    local i
    for i in $(seq 50); do grep -q '^listening on ' "$out" 2>/dev/null && break; sleep 0.1; done
    SVC_PORT=$(head -n1 "$out" | sed -n 's/^listening on 127\.0\.0\.1:\([0-9]*\)$/\1/p')
    [ -n "$SVC_PORT" ] || { fail "update-server did not start: $(cat "$out")"; exit 1; }
    BASE=http://127.0.0.1:$SVC_PORT
}
svc_stop() { kill "$SVC_PID" 2>/dev/null; wait "$SVC_PID" 2>/dev/null; }

# svc_probe ARGS...: svcprobe.exe in the scenario's prefix.
svc_probe() { e2e_wine "$WINBIN/svcprobe.exe" "$@"; }

# svc_logged LINE: the service received exactly this request line.
svc_logged() { grep -qxF -e "$1" "$SVC_LOG"; }

# A port nothing listens on.
svc_free_port() { python3 -c 'import socket; s=socket.socket(); s.bind(("127.0.0.1",0)); print(s.getsockname()[1])'; }
