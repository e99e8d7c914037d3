# Helpers of the tray scenarios (sourced after lib.sh and service-lib.sh).

# tray_folder [hostkit folder options]: a stand-alone main product 10.3.0.3 with a customer id
# unless the options say otherwise, and the updater stand-in beside the checker.
tray_folder() {
    "$NATIVEBIN/hostkit" folder "$APP" --type standalone --version 10.3.0.3 --cust-id 4711 \
        --application "ORVEL ZARN PRO" "$@" >"$SCEN/hostkit.out" 2>&1 ||
        { fail "hostkit: $(cat "$SCEN/hostkit.out")"; exit 1; }
    cp "$WINBIN/KtrLiveUpdate.exe" "$APP/"
}

# The checker against the scenario's update service.
tray_start() { CHECKER_UPDATE_SERVER=$BASE e2e_start_checker; }

tray_main() { e2e_windows --class CheckOZProUpdateMain | head -n1; }
tray_hwnd() { e2e_field "$(tray_main)" hwnd; }

# tray_label ID: the wininfo line of the main window's label with that control id.
tray_label() { e2e_windows --class CheckOZProUpdateMain --children | grep -E "^  .* id=$1 " | head -n1; }
tray_title() { sed -n 's/.* title=//p' <<<"$1"; }

# tray_wait_shown SECONDS: waits until the main window stands visible and topmost. Sets
# SHOWN_LINE, SLIDE_BEGAN_AT / SHOWN_AT (date +%s.%N: first step, last move) and takes a
# screenshot while it slides.
tray_wait_shown() {
    TRAY_SHOT=0
    E2E_SLIDE_HOOK=tray_slide_shot e2e_follow_slide "$1" || return 1
    SHOWN_AT=$SLIDE_MOVED_AT
}
tray_slide_shot() {
    if [ $TRAY_SHOT = 0 ] && [ -n "$SLIDE_TOP" ] && [ "$SLIDE_TOP" -lt 740 ]; then
        e2e_screenshot 2-sliding >/dev/null; TRAY_SHOT=1
    fi
}

# tray_wait_lines FILE N SECONDS: until FILE has at least N lines.
tray_wait_lines() {
    local deadline=$(($(date +%s) + $3))
    while [ "$(wc -l <"$1" 2>/dev/null || echo 0)" -lt "$2" ]; do
        [ "$(date +%s)" -ge "$deadline" ] && return 1
        sleep 0.25
    done
}

# tray_click_label ID: a real left click in the middle of the label.
tray_click_label() {
    local line x y w h
    line=$(tray_label "$1")
    x=$(e2e_field "$line" x); y=$(e2e_field "$line" y); w=$(e2e_field "$line" w); h=$(e2e_field "$line" h)
    [ -n "$x" ] || return 1
    xdotool mousemove $((x + w / 2)) $((y + h / 2)) sleep 0.2 click 1
}

# The popup menu, a top-level window of the menu class, when shown.
tray_menu_shown() { e2e_windows --class '#32768' | grep -q ' visible=1 '; }
tray_wait_menu() { # SECONDS
    local deadline=$(($(date +%s) + $1))
    until tray_menu_shown; do
        [ "$(date +%s)" -ge "$deadline" ] && return 1
        sleep 0.1
    done
}

tray_tray_window() { xdotool search --onlyvisible --name 'Wine System Tray' 2>/dev/null | head -n1; }

# Wine's short date of today (en-US: M/D/YYYY).
tray_today() { date +%-m/%-d/%Y; }

tray_started() { tr -d '\r' <"$APP/started.log" 2>/dev/null; }
tray_menu_closed() { ! tray_menu_shown; }

# CPU seconds (user + system) the checker's process has used so far.
tray_cpu() { awk -v hz="$(getconf CLK_TCK)" '{ printf "%.2f", ($14 + $15) / hz }' "/proc/$CHECKER_PID/stat" 2>/dev/null; }
