// frmCheckUpdate: the checker's one window. Loaded hidden at start-up, it owns the host
// profile, the customer record, the two timers and the tick counter.
#pragma once

#include <windows.h>

#include <cstdint>
#include <string>

#include "common/ports.h"
#include "startup/customer_record.h"
#include "startup/host_profile.h"
#include "startup/screen_metrics.h"

namespace checker {

class frmCheckUpdate {
public:
    static constexpr UINT_PTR kTimer1Id = 1;
    static constexpr UINT_PTR kTimer2Id = 2;

    explicit frmCheckUpdate(HINSTANCE instance);
    ~frmCheckUpdate();
    frmCheckUpdate(const frmCheckUpdate&) = delete;
    frmCheckUpdate& operator=(const frmCheckUpdate&) = delete;

    // Creates the window hidden and runs Form_Load. False when start-up ended silently.
    bool Load();
    HWND hwnd() const noexcept { return hwnd_; }

    // ---- start-up (the load event and its steps)
    bool Form_Load();
    void prReadScreenMetrics();
    void prAddTrayIcon();
    void prRemoveTrayIcon();
    void prOpenDatabase();
    void prReadSettings();
    void prGetVersion();
    void prCloseDatabase();

    // ---- timers
    void Timer1_Timer();
    void Timer2_Timer();

    // ---- state
    std::string strFolder;
    HostProfile profile;
    CustomerRecord record;
    ScreenMetrics metrics;
    std::int16_t intTimerTicks = 0;

private:
    static LRESULT CALLBACK StaticWndProc(HWND, UINT, WPARAM, LPARAM);
    LRESULT WndProc(UINT message, WPARAM wParam, LPARAM lParam);
    void setCaption(const std::string& caption);

    HINSTANCE instance_;
    HWND hwnd_ = nullptr;
};

} // namespace checker
