// lockfile PATH: opens PATH with no sharing and holds it until ended, as another program that
// has the file in use would.
#include <windows.h>

int main(int argc, char** argv) {
    if (argc < 2) return 2;
    HANDLE h = ::CreateFileA(argv[1], GENERIC_READ | GENERIC_WRITE, 0, nullptr, OPEN_EXISTING,
                             FILE_ATTRIBUTE_NORMAL, nullptr);
    if (h == INVALID_HANDLE_VALUE) return 1;
    ::Sleep(INFINITE);
    ::CloseHandle(h);
    return 0;
}
