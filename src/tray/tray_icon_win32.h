// The notification-area icon of frmCheckUpdate and the window-procedure hook through which its
// mouse messages arrive. prAddTrayIcon / prRemoveTrayIcon are members of frmCheckUpdate.
#pragma once

#include <windows.h>

namespace checker {

// Put in front of the main window's own procedure while the icon is there: a right-button
// release on the icon opens the popup menu; the shell's restart adds the icon again. Every
// message then goes on to the window's own procedure.
LRESULT CALLBACK fnTrayWindowProc(HWND hWnd, UINT uMsg, WPARAM wParam, LPARAM lParam);

} // namespace checker
