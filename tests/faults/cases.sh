# The fault cases. Each function runs one case and prints its row (see lib-faults.sh).
# Expected texts say what a user would see; "box" is the error box that the design keeps.

judge() { # expected observed must-regex [forbidden-regex]
    local rc=0
    matches "$2" "$3" || rc=1
    [ -n "${4:-}" ] && matches "$2" "$4" && rc=1
    fault_row "$1" "$2" $rc
}
CLEAN='box|OUTSIDE'

startup_case() { # name, expected, must, forbidden, hostkit options...; then edits by $EDIT
    local name=$1 expected=$2 must=$3 forbidden=$4; shift 4
    fault_begin "$name"
    fault_folder "$@"
    [ -n "${EDIT:-}" ] && eval "$EDIT"
    fault_start
    fault_wait_startup
    fault_answer_box
    judge "$expected" "$(fault_state)" "$must" "$forbidden"
}

# ---- INI files at start-up
case_application_ini_missing() { startup_case application-ini-missing "runs hidden" '^running, hidden' "$CLEAN" --type standalone --cust-id 4711; }
case_application_ini_empty() { EDIT=': >"$APP/Application.INI"' startup_case application-ini-empty "runs hidden" '^running, hidden' "$CLEAN" --type standalone --cust-id 4711; }
case_application_ini_oversized() { EDIT='{ printf "[General]\r\nApplication=ORVEL ZARN PRO%0200000d\r\n" 0; } >"$APP/Application.INI"' startup_case application-ini-oversized "runs hidden, value cut" '^running, hidden' "$CLEAN" --type standalone --cust-id 4711; }
case_application_ini_non_ascii() { EDIT='printf "\xef\xbb\xbf[General]\r\nApplication=\xc3\x96rvel Z\xe4rn \xff\x00Pro\r\n" >"$APP/Application.INI"' startup_case application-ini-non-ascii "runs hidden" '^running, hidden' "$CLEAN" --type standalone --cust-id 4711; }
case_application_ini_folder() { EDIT='mkdir -p "$APP/Application.INI"' startup_case application-ini-folder "runs hidden" '^running, hidden' "$CLEAN" --type standalone --cust-id 4711; }
case_client_ini_missing() { EDIT='rm -f "$APP/CLIENT.INI"' startup_case client-ini-missing "silent end, no box" '^ended\(0\)' "$CLEAN" --type client --server "$SCEN/server" --cust-id 4711; }
case_client_ini_folder() { EDIT='rm -f "$APP/CLIENT.INI"; mkdir "$APP/CLIENT.INI"' startup_case client-ini-folder "silent end, no box" '^ended\(0\)' "$CLEAN" --type client --server "$SCEN/server" --cust-id 4711; }
case_client_ini_oversized() { EDIT='printf "[General]\r\nServerPath=%s\\\\\r\n" "$(winpath "$SCEN/server")$(printf "%060d" 0)" >"$APP/CLIENT.INI"' startup_case client-ini-oversized "silent end (path cut at 49), no box" '^ended\(0\)' "$CLEAN" --type client --server "$SCEN/server" --cust-id 4711; }

# ---- the host database and executable
case_database_missing() { startup_case database-missing "silent end, no box" '^ended\(0\)' "$CLEAN" --type standalone --cust-id 4711 --no-db; }
case_database_garbage() { EDIT='head -c 4096 /dev/urandom >"$APP/data/Ozp.ACCDB"' startup_case database-garbage "box with number and description, end" '^ended.*box: .+' 'OUTSIDE' --type standalone --cust-id 4711; }
case_database_empty() { EDIT=': >"$APP/data/Ozp.ACCDB"' startup_case database-empty "box with number and description, end" '^ended.*box: .+' 'OUTSIDE' --type standalone --cust-id 4711; }
case_database_wrong_password() { EDIT='"$NATIVEBIN/hostkit" db "$APP/data/Ozp.ACCDB" --password wrong --row 999=1 --row 14=4711 >/dev/null' startup_case database-wrong-password "box 'Not a valid password.', end" '^ended.*box: .*Not a valid password' 'OUTSIDE' --type standalone --cust-id 4711; }
case_database_locked() {
    fault_begin database-locked
    fault_folder --type standalone --cust-id 4711
    (cd "$APP" && exec wine "$WINBIN/lockfile.exe" "$(winpath "$APP/data/Ozp.ACCDB")") >/dev/null 2>&1 &
    E2E_PIDS+=($!); sleep 3
    fault_start; fault_wait_startup; fault_answer_box
    judge "box with number and description, end" "$(fault_state)" '^ended.*box: .+' 'OUTSIDE'
}
case_host_exe_missing() { startup_case host-exe-missing "box (file not found), end" '^ended.*box: .+' 'OUTSIDE' --type standalone --cust-id 4711 --no-exe; }
case_host_exe_no_version() { startup_case host-exe-no-version "silent end, no box" '^ended\(0\)' "$CLEAN" --type standalone --cust-id 4711 --no-version; }

# ---- the update service at the first check
service_case() { # name, expected, must, forbidden, server options (or "none")
    local name=$1 expected=$2 must=$3 forbidden=$4; shift 4
    fault_begin "$name"
    fault_folder --type standalone --cust-id X-10042 --version 10.3.0.3
    if [ "$1" = none ]; then fault_no_server; else fault_server "$@"; fi
    fault_start
    fault_wait_check 15
    if matches "$must" shown; then fault_wait_shown 600; fi
    judge "$expected" "$(fault_state)" "$must" "$forbidden"
}
NOSHOW='^running, hidden, no Update.INI$'
case_service_down() { service_case service-down "keeps running, nothing shown" "$NOSHOW" "$CLEAN" none; }
case_service_slow() { service_case service-slow "shown after the delays (8 s > one tick)" '^running, shown, Update.INI CurrDate=.+' "$CLEAN" --latest 1=10.4.0.5 --delay-ms 8000; }
case_service_404() { service_case service-404 "nothing shown" "$NOSHOW" "$CLEAN" --latest 1=10.4.0.5 --status 404 --answer '<html><body>404 Not Found</body></html>'; }
case_service_500() { service_case service-500 "nothing shown" "$NOSHOW" "$CLEAN" --latest 1=10.4.0.5 --status 500 --answer '<html><body>Internal Server Error</body></html>'; }
case_service_html() { service_case service-html "nothing shown" "$NOSHOW" "$CLEAN" --latest 1=10.4.0.5 --answer '<html><head><title>Login</title></head><body>proxy login, please</body></html>'; }
case_service_empty_body() { service_case service-empty-body "nothing shown" "$NOSHOW" "$CLEAN" --latest 1=10.4.0.5 --answer ''; }
case_service_1mib() { service_case service-1mib "nothing shown" "$NOSHOW" "$CLEAN" --latest 1=10.4.0.5 --answer "$(head -c 1048576 /dev/zero | tr '\0' 'x')"; }
case_service_three_fields() { service_case service-three-fields "nothing shown" "$NOSHOW" "$CLEAN" --latest 1=10.4.0.5 --answer 'a,10.4,b'; }
case_service_non_truth_flag() { service_case service-non-truth-flag "nothing shown" "$NOSHOW" "$CLEAN" --latest 1=10.4.0.5 --answer 'a,10.4,b,maybe'; }
case_service_drop() { service_case service-drop "keeps running, nothing shown" "$NOSHOW" "$CLEAN" --latest 1=10.4.0.5 --drop; }
case_service_date_html() { service_case service-date-html "no check, nothing shown" "$NOSHOW" "$CLEAN" --latest 1=10.4.0.5 --date '<html>maintenance</html>'; }

# ---- Update.INI
update_ini_case() { # name, expected, must, forbidden, preparation
    local name=$1 expected=$2 must=$3 forbidden=$4 prep=$5
    fault_begin "$name"
    fault_folder --type standalone --cust-id X-10042 --version 10.3.0.3
    fault_server --latest 1=10.4.0.5
    eval "$prep"
    fault_start
    fault_wait_check 15
    fault_wait_shown 600
    judge "$expected" "$(fault_state)" "$must" "$forbidden"
}
case_update_ini_empty() { update_ini_case update-ini-empty "shown, today's date written" '^running, shown, Update.INI CurrDate=.+' "$CLEAN" ': >"$APP/Update.INI"'; }
case_update_ini_damaged() { update_ini_case update-ini-damaged "shown, today's date written" '^running, shown, Update.INI CurrDate=[0-9]' "$CLEAN" 'printf "[General]\r\nCurrDate=\xff\xfe##garbage##\r\n" >"$APP/Update.INI"'; }
# Immutable, since root may write a file whatever its mode.
case_update_ini_read_only() {
    update_ini_case update-ini-read-only "shown, file unchanged" '^running, shown, Update.INI CurrDate=01/01/2001' "$CLEAN" 'printf "[General]\r\nCurrDate=01/01/2001\r\n" >"$APP/Update.INI"; chattr +i "$APP/Update.INI"'
    chattr -i "$APP/Update.INI"
}
case_update_ini_folder() { update_ini_case update-ini-folder "shown, folder kept" '^running, shown, Update.INI folder' "$CLEAN" 'mkdir "$APP/Update.INI"; touch "$APP/Update.INI/keep"'; }

# ---- UpdateInfo.INI on a network client
patch_case() { # name, expected, must, forbidden, UpdateInfo.INI body, [patch file name to place]
    local name=$1 expected=$2 must=$3 forbidden=$4 body=$5 place=${6:-}
    fault_begin "$name"
    fault_folder --type client --server "$SCEN/server" --cust-id X-10042 --version 10.3.0.3
    fault_server --latest 1=10.4.0.5 --answer 'a,10.4.0.5,b,False'
    printf "[VERSIONINFO]\r\n%b" "$body" >"$SCEN/server/UpdateInfo.INI"
    [ -n "$place" ] && cp "$WINBIN/OZProPatch.exe" "$SCEN/server/$place"
    fault_start
    fault_wait_check 10
    local o
    o="$(fault_state), $(grep -c 'CheckOZProUpdate.asp' "$SCEN/requests.log" 2>/dev/null) check(s)"
    [ -f "$APP/started.log" ] && o="$o, started: $(tr -d '\r' <"$APP/started.log" | head -n1)"
    judge "$expected" "$o" "$must" "$forbidden"
}
PATCH_NONE='^running, hidden, no Update.INI, 1 check'
case_patch_missing_keys() { patch_case patch-missing-keys "nothing started, check runs" "$PATCH_NONE" "$CLEAN|started" 'BaseVersMajor=10.3\r\n' Patch.exe; }
case_patch_non_numeric() { patch_case patch-non-numeric "nothing started, check runs" "$PATCH_NONE" "$CLEAN|started" 'BaseVersMajor=ten\r\nBaseVersMinor=three\r\nVersMajorAvai=x\r\nVersMinorAvai=y\r\nPatcFileName=Patch.exe\r\n' Patch.exe; }
case_patch_hostile_name() { patch_case patch-hostile-name "refused, nothing written or started" "$PATCH_NONE" "$CLEAN|started" 'BaseVersMajor=10.3\r\nBaseVersMinor=3\r\nVersMajorAvai=10.3\r\nVersMinorAvai=5\r\nPatcFileName=..\\\\Patch.exe\r\n' Patch.exe; }
case_patch_file_missing() { patch_case patch-file-missing "nothing started, check runs" "$PATCH_NONE" "$CLEAN|started" 'BaseVersMajor=10.3\r\nBaseVersMinor=3\r\nVersMajorAvai=10.3\r\nVersMinorAvai=5\r\nPatcFileName=Patch.exe\r\n'; }
case_patch_in_use() {
    fault_begin patch-in-use
    fault_folder --type client --server "$SCEN/server" --cust-id X-10042 --version 10.3.0.3
    fault_server --latest 1=10.4.0.5
    printf '[VERSIONINFO]\r\nBaseVersMajor=10.3\r\nBaseVersMinor=3\r\nVersMajorAvai=10.3\r\nVersMinorAvai=5\r\nPatcFileName=Patch.exe\r\n' >"$SCEN/server/UpdateInfo.INI"
    cp "$WINBIN/OZProPatch.exe" "$SCEN/server/Patch.exe"
    cp "$WINBIN/OZProPatch.exe" "$APP/Patch.exe"
    (cd "$APP" && exec wine "$WINBIN/lockfile.exe" "$(winpath "$APP/Patch.exe")") >/dev/null 2>&1 &
    E2E_PIDS+=($!); sleep 3
    fault_start
    local i
    for i in $(seq 60); do [ -n "$(e2e_msgbox_text)" ] && break; e2e_running || break; sleep 1; done
    fault_answer_box
    judge "box (copy fails), end; nothing started" "$(fault_state)" '^ended.*box: .+' 'OUTSIDE'
}

# ---- the updater and the folder
case_updater_missing() {
    fault_begin updater-missing
    fault_folder --type standalone --cust-id X-10042 --version 10.3.0.3
    rm -f "$APP/KtrLiveUpdate.exe"
    fault_server --latest 1=10.4.0.5
    fault_start; fault_wait_check 15; fault_wait_shown 600
    local x y
    x=$(e2e_field "$SHOWN_LINE" x); y=$(e2e_field "$SHOWN_LINE" y)
    xdotool mousemove $((x + 58)) $((y + 119)) sleep 0.3 click 1
    local i
    for i in $(seq 30); do [ -n "$(e2e_msgbox_text)" ] && break; e2e_running || break; sleep 1; done
    fault_answer_box
    judge "box 53 File not found, end" "$(fault_state)" "^ended.*box: .*'53'.*File not found" 'OUTSIDE'
}
case_folder_blanks_non_ascii() {
    fault_begin folder-blanks-non-ascii
    local old=$APP
    APP="$SCEN/Orvel Zarn Pro été"  # é is in the ANSI code page the checker's paths use
    mkdir -p "$APP"; mv "$old/CheckOZProUpdate.exe" "$APP/"; rmdir "$old"
    fault_folder --type standalone --cust-id X-10042 --version 10.3.0.3
    fault_server --latest 1=10.4.0.5
    fault_start; fault_wait_check 15; fault_wait_shown 600
    judge "shown, today's date written in that folder" "$(fault_state)" '^running, shown, Update.INI CurrDate=.+' "$CLEAN"
}
dpi_case() { # name, dpi
    E2E_LOGPIXELS=$2 fault_begin "$1"
    fault_folder --type standalone --cust-id X-10042 --version 10.3.0.3
    fault_server --latest 1=10.4.0.5
    fault_start; fault_wait_check 15
    local o tpp cx cy y
    if fault_wait_shown 600; then
        tpp=$(awk -v d="$2" 'BEGIN { printf "%d", 1440 / d + 0.5 }')
        cx=$(e2e_field "$SHOWN_LINE" cx); cy=$(e2e_field "$SHOWN_LINE" cy); y=$(e2e_field "$SHOWN_LINE" y)
        o="$(fault_state), client $((cx * tpp))x$((cy * tpp)) twips, top $((y * tpp)) twips"
        local ok=0
        awk -v a=$((cx * tpp)) -v b=$((cy * tpp)) -v t=$((y * tpp)) -v p="$tpp" \
            'BEGIN { exit !((a - 3435) ^ 2 <= p * p && (b - 2130) ^ 2 <= p * p && (t - 8650) ^ 2 <= p * p) }' || ok=1
        matches "$o" '^running, shown' && ! matches "$o" "$CLEAN" || ok=1
        fault_row "client 3435x2130 and top 8650 twips (within a pixel)" "$o" $ok
    else
        fault_row "client 3435x2130 and top 8650 twips (within a pixel)" "$(fault_state), not shown" 1
    fi
}
case_screen_120dpi() { dpi_case screen-120dpi 120; }
case_screen_144dpi() { dpi_case screen-144dpi 144; }
