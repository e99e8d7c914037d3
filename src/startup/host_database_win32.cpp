// Host database access: placeholders until the host database road is built.
#include "tray/frmCheckUpdate_win32.h"

namespace checker {

void frmCheckUpdate::prOpenDatabase() {}
void frmCheckUpdate::prReadSettings() {}
void frmCheckUpdate::prGetVersion() {}
void frmCheckUpdate::prCloseDatabase() {}

} // namespace checker
