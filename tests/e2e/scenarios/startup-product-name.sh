# The hidden main window's caption follows Application.INI; without the file start-up goes on.
. "$(dirname "$0")/../lib.sh"
e2e_begin startup-product-name
"$NATIVEBIN/hostkit" folder "$APP" --type standalone >/dev/null

caption_for() { # $1: Application value, or "-" for no file
    wineserver -k 2>/dev/null; wineserver -w 2>/dev/null
    rm -f "$APP/Application.INI"
    [ "$1" != "-" ] && printf '[General]\r\nApplication=%s\r\n' "$1" >"$APP/Application.INI"
    e2e_start_checker
    local line
    line=$(e2e_wait_window 20 --class CheckOZProUpdateMain) || { echo "<no window>"; return; }
    e2e_running || { echo "<ended>"; return; }
    sed -n 's/.* title=//p' <<<"$line"
}

got=$(caption_for " orvel zarn gold ")
check "' orvel zarn gold ' gives 'Orvel Zarn Pro' (got '$got')" [ "$got" = "Orvel Zarn Pro" ]
got=$(caption_for "ORVEL DO ZARN")
check "'ORVEL DO ZARN' gives 'Orvel DO Zarn' (got '$got')" [ "$got" = "Orvel DO Zarn" ]
got=$(caption_for "Orvel Zarn Silver")
check "another name leaves the caption empty (got '$got')" [ -z "$got" ]
got=$(caption_for "-")
check "no Application.INI: empty caption and start-up goes on (got '$got')" [ -z "$got" ]
check "no message shown" [ -z "$(e2e_msgbox_text)" ]
e2e_done
