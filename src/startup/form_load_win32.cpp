// Form_Load of frmCheckUpdate: the start-up sequence, in its fixed order.
#include <windows.h>
#include <objbase.h>

#include "common/checker_folder.h"
#include "common/profile_win32.h"
#include "common/files_win32.h"
#include "tray/frmCheckUpdate_win32.h"

namespace checker {

void frmCheckUpdate::prReadScreenMetrics() {
    HDC screen = ::GetDC(nullptr);
    const int dpiX = ::GetDeviceCaps(screen, LOGPIXELSX);
    const int dpiY = ::GetDeviceCaps(screen, LOGPIXELSY);
    ::ReleaseDC(nullptr, screen);
    metrics = computeScreenMetrics(dpiX, dpiY, ::GetSystemMetrics(SM_CXSCREEN),
                                   ::GetSystemMetrics(SM_CYSCREEN));
}

// Returns false when start-up ends silently; errors go to the caller's last-resort handler.
bool frmCheckUpdate::Form_Load() {
    Win32ProfilePort profiles;
    Win32FilesPort files;
    strFolder = checkerFolder();

    // 1. Screen metrics.
    prReadScreenMetrics();
    // 2. Host product name.
    prReadProductName(profiles, strFolder, profile);
    setCaption(profile.strCaption);
    // 3. Installation type, database path, customer plan row; silent end without a database.
    if (!prIntialization(profiles, files, strFolder, profile)) return false;
    // 4. The notification-area icon.
    prAddTrayIcon();
    // 5. The host database connection.
    prOpenDatabase();
    // 6. The settings read: blnUseCustID and lngCustID.
    prReadSettings();
    // 7. Installed version and customer code, only with a customer id; silent end without a version.
    if (record.blnUseCustID) prGetVersion();
    // 8. Nothing after start-up uses the host database.
    prCloseDatabase();
    // The database provider and the host's components stay unused for the rest of the run:
    // let their libraries go now instead of keeping them resident beside the tray icon.
    ::CoFreeUnusedLibrariesEx(0, 0);
    // 9. Stay loaded and hidden.
    ::ShowWindow(hwnd_, SW_HIDE);
    return true;
}

} // namespace checker
