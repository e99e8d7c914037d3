// A host executable for test folders: it runs and ends. hostkit copies it, and for a versioned
// copy rewrites the numbers of its fixed version block.
#include <windows.h>

int WINAPI WinMain(HINSTANCE, HINSTANCE, LPSTR, int) {
    return 0;
}
