# KillProcessByName over a real process walk: a tail match, case ignored; an empty name does nothing.
. "$(dirname "$0")/../lib.sh"
e2e_begin startup-kill-process
mkdir -p "$SCEN/progs"
for n in MyApp Other; do cp "$WINBIN/sleeper.exe" "$SCEN/progs/$n.exe"; done
start_prog() { (cd "$SCEN/progs" && exec wine "$1.exe") >/dev/null 2>&1 & E2E_PIDS+=($!); echo $!; }
myapp=$(start_prog MyApp); other=$(start_prog Other)
sleep 3
e2e_wine "$WINBIN/killproc.exe" "" >/dev/null
sleep 1
check "empty name ends nothing" bash -c "kill -0 $myapp && kill -0 $other"
e2e_wine "$WINBIN/killproc.exe" app.exe >/dev/null
for i in $(seq 20); do kill -0 "$myapp" 2>/dev/null || break; sleep 0.25; done
check "app.exe ends MyApp.exe" bash -c "! kill -0 $myapp 2>/dev/null"
check "app.exe leaves Other.exe running" kill -0 "$other"
myapp=$(start_prog MyApp); sleep 3
e2e_wine "$WINBIN/killproc.exe" APP.EXE >/dev/null
for i in $(seq 20); do kill -0 "$myapp" 2>/dev/null || break; sleep 0.25; done
check "the comparison ignores case" bash -c "! kill -0 $myapp 2>/dev/null"
check "Other.exe still running at the end" kill -0 "$other"
e2e_done
