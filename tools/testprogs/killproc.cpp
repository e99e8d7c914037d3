// killproc NAME: ends every process whose image name ends with NAME, as the checker does on exit.
#include <cstdio>

#include "startup/kill_process.h"
#include "startup/processes_win32.h"

int main(int argc, char** argv) {
    checker::Win32ProcessesPort processes;
    checker::KillProcessByName(processes, argc > 1 ? argv[1] : "");
    std::puts("done");
    return 0;
}
