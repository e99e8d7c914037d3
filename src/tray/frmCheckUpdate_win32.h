// frmCheckUpdate: the checker's one window. Loaded hidden at start-up, it owns the host
// profile, the customer record, the two timers and the check cycle; it slides in when a result
// is shown and carries the tray icon's hook and popup menu.
#pragma once

#include <windows.h>

#include <cstdint>
#include <string>

#include "common/files_win32.h"
#include "common/ports.h"
#include "common/profile_win32.h"
#include "common/unique_win32.h"
#include "common/window_win32.h"
#include "service/dates_win32.h"
#include "service/xmlhttp_win32.h"
#include "startup/customer_record.h"
#include "startup/host_profile.h"
#include "startup/processes_win32.h"
#include "startup/screen_metrics.h"
#include "tray/artwork_win32.h"
#include "tray/check_cycle.h"
#include "tray/network_win32.h"
#include "tray/result_display.h"
#include "tray/slide_in.h"

namespace checker {

class Win32MessagePump final : public MessagePump {
  public:
    void doEvents() override { checker::doEvents(); }
};

class frmCheckUpdate final : private ResultDisplayWindow, private SlideWindow {
  public:
    static constexpr UINT_PTR kTimer1Id = 1;
    static constexpr UINT_PTR kTimer2Id = 2;

    explicit frmCheckUpdate(HINSTANCE instance);
    ~frmCheckUpdate() override;
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

    // ---- timers, result display
    void Timer1_Timer();
    void Timer2_Timer() override;
    void prValidateCheckInfo(const std::string& strCheckInfoString);

    // ---- tray popup menu and the user commands
    void prShowPopupMenu();
    void LblGetUpdate_Click();
    void mnuUpdate_Click();
    void lblCancel_Click();
    void mnuClose_Click();

    // ---- state
    std::string strFolder;
    HostProfile profile;
    CustomerRecord record;
    ScreenMetrics metrics;
    CheckCycle cycle;

  private:
    static LRESULT CALLBACK StaticWndProc(HWND, UINT, WPARAM, LPARAM);
    LRESULT WndProc(UINT message, WPARAM wParam, LPARAM lParam);
    void setCaption(const std::string& caption);
    void Form_Activate();
    void prUnload();
    int pixelsX(int twips) const;
    int pixelsY(int twips) const;

    // ResultDisplayWindow
    void disarmTimer1() override;
    void armTimer2() override;
    void setLabel2(const std::string& strText) override;
    // SlideWindow
    void move(int intLeft, int intTop) override;
    int top() override { return intTop_; }
    void setTop(int intTop) override;
    void show() override;
    void disarmTimer2() override;
    void prSetTopMost() override;
    bool exists() override;

    HINSTANCE instance_;
    HWND hwnd_ = nullptr;
    Picture1 picture1_;
    UniqueMenu mnuPopup_;
    SlideIn slide_;
    int intLeft_ = 0, intTop_ = 0; // twips: the pixel position is derived from them

    Win32ProfilePort profiles_;
    Win32FilesPort files_;
    Win32ProcessesPort processes_;
    Win32NetworkPort network_;
    XmlHttpPort http_{XmlHttpPort::Creation::Msxml30Class};
    XmlHttpPort dateHttp_{XmlHttpPort::Creation::ProgId};
    RegionalDatesPort dates_;
    Win32MessagePump pump_;
};

} // namespace checker
