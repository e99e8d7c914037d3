#include "tray/tray_icon_win32.h"

#include <shellapi.h>

#include <algorithm>
#include <cstring>

#include "common/constants.h"
#include "common/window_win32.h"
#include "startup/host_profile.h"
#include "tray/frmCheckUpdate_win32.h"

namespace checker {

namespace {
// Module-level state of the hook. The previous procedure is a full pointer: the window
// procedure of a 64-bit program does not fit 32 bits.
WNDPROC lngPrevWndProc = nullptr;
bool blnTrayIconAdded = false; // never set back
NOTIFYICONDATAA nidAdded{};    // kept to add the icon again after a shell restart
UINT uTaskbarCreated = 0;

void fillRecord(NOTIFYICONDATAA& nid, HWND hwnd, UINT flags) {
    nid = NOTIFYICONDATAA{};
    nid.cbSize = NOTIFYICONDATAA_V1_SIZE; // the first and smallest form of the record
    nid.hWnd = hwnd;
    nid.uID = tray::kTrayIconId;
    nid.uFlags = flags;
}
} // namespace

void frmCheckUpdate::prAddTrayIcon() {
    // Each step is tried even when an earlier one failed; nothing is reported.
    fillRecord(nidAdded, hwnd_, tray::kTrayAddFlags);
    nidAdded.uCallbackMessage = tray::kTrayCallbackMessage;
    nidAdded.hIcon = ::LoadIconA(instance_, MAKEINTRESOURCEA(tray::kIconResourceId));
    const std::string_view tip = tipTextFor(profile.blnSecondProduct);
    std::memcpy(nidAdded.szTip, tip.data(), std::min(tip.size(), tray::kTrayTipBytes - 1));
    ::Shell_NotifyIconA(NIM_ADD, &nidAdded);

    uTaskbarCreated = ::RegisterWindowMessageA(std::string(tray::kTaskbarCreatedMessage).c_str());
    lngPrevWndProc = reinterpret_cast<WNDPROC>(
        ::SetWindowLongPtrA(hwnd_, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(&fnTrayWindowProc)));
    blnTrayIconAdded = true;
}

void frmCheckUpdate::prRemoveTrayIcon() {
    NOTIFYICONDATAA nid;
    fillRecord(nid, hwnd_, tray::kTrayDeleteFlags);
    ::Shell_NotifyIconA(NIM_DELETE, &nid);
    if (lngPrevWndProc)
        ::SetWindowLongPtrA(hwnd_, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(lngPrevWndProc));
}

void frmCheckUpdate::prShowPopupMenu() {
    // The window must be in front or the menu does not close when the user clicks elsewhere;
    // the null message afterwards lets the menu's loop end cleanly.
    POINT at{};
    ::GetCursorPos(&at);
    ::SetForegroundWindow(hwnd_);
    const UINT command = static_cast<UINT>(
        ::TrackPopupMenu(mnuPopup_.get(), TPM_RETURNCMD, at.x, at.y, 0, hwnd_, nullptr));
    ::PostMessageA(hwnd_, WM_NULL, 0, 0);
    if (command == tray::kMenuIdCheckUpdate)
        mnuUpdate_Click();
    else if (command == tray::kMenuIdClose)
        mnuClose_Click();
}

LRESULT CALLBACK fnTrayWindowProc(HWND hWnd, UINT uMsg, WPARAM wParam, LPARAM lParam) {
    if (uMsg == tray::kTrayCallbackMessage && lParam == static_cast<LPARAM>(WM_RBUTTONUP) &&
        blnTrayIconAdded) {
        auto* form = reinterpret_cast<frmCheckUpdate*>(::GetWindowLongPtrA(hWnd, GWLP_USERDATA));
        if (form) guarded([&] { form->prShowPopupMenu(); });
    } else if (uMsg == uTaskbarCreated && uTaskbarCreated != 0 && blnTrayIconAdded) {
        // Explorer restarted: the icon went with the old shell.
        ::Shell_NotifyIconA(NIM_ADD, &nidAdded);
    }
    if (!lngPrevWndProc) return ::DefWindowProcA(hWnd, uMsg, wParam, lParam);
    return ::CallWindowProcA(lngPrevWndProc, hWnd, uMsg, wParam, lParam);
}

} // namespace checker
