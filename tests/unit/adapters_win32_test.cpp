// The Win32 adapters of the files, profile and processes ports, against the real system
// (Windows build only).
#include <gtest/gtest.h>

#include <windows.h>

#include <fstream>

#include "common/error.h"
#include "common/files_win32.h"
#include "common/profile_win32.h"
#include "startup/processes_win32.h"

using namespace checker;

namespace {
std::string tempFolder() {
    char path[MAX_PATH];
    ::GetTempPathA(MAX_PATH, path);
    std::string folder = std::string(path) + "checker-adapters";
    ::CreateDirectoryA(folder.c_str(), nullptr);
    return folder;
}
std::string ownExe() {
    char path[MAX_PATH];
    ::GetModuleFileNameA(nullptr, path, MAX_PATH);
    return path;
}
} // namespace

TEST(FilesAdapter, PlainSearchSeesOrdinaryFilesOnlyAndMissingVersionsAreErrors) {
    Win32FilesPort files;
    const std::string folder = tempFolder();
    const std::string file = folder + "\\plain.txt";
    std::ofstream(file) << "x";
    EXPECT_TRUE(files.existsPlain(file));
    EXPECT_FALSE(files.existsPlain(folder)); // a folder is no file
    ::SetFileAttributesA(file.c_str(), FILE_ATTRIBUTE_HIDDEN);
    EXPECT_FALSE(files.existsPlain(file));
    EXPECT_TRUE(files.existsAny(file)); // the database test accepts it
    ::SetFileAttributesA(file.c_str(), FILE_ATTRIBUTE_NORMAL);
    EXPECT_FALSE(files.existsAny(folder + "\\missing.txt"));
    EXPECT_EQ(files.fileVersion(ownExe()), ""); // built without a version resource
    try {
        files.fileVersion(folder + "\\missing.exe");
        FAIL() << "a missing file has no version to read";
    } catch (const CheckerError& e) {
        EXPECT_EQ(e.number(), 53);
    }
    ::DeleteFileA(file.c_str());
}

TEST(ProfileAdapter, CutsAtTheBufferAndWritesBack) {
    Win32ProfilePort ini;
    const std::string file = tempFolder() + "\\t.ini";
    ini.write(file, "General", "Application", "  ORVEL ZARN PRO  ");
    EXPECT_EQ(ini.read(file, "General", "Application", "", 50), "ORVEL ZARN PRO");
    EXPECT_EQ(ini.read(file, "General", "Application", "", 6), "ORVEL");
    EXPECT_EQ(ini.read(file, "General", "Missing", "dflt", 50), "dflt");
    EXPECT_EQ(ini.read(file + ".none", "General", "Application", "", 50), "");
    ::DeleteFileA(file.c_str());
}

TEST(ProcessesAdapter, MissingProgramIsFileNotFoundAndTheWalkSeesThisProcess) {
    Win32ProcessesPort processes;
    try {
        processes.start(tempFolder() + "\\no such updater.exe", 3);
        FAIL() << "started a program that does not exist";
    } catch (const CheckerError& e) {
        EXPECT_EQ(e.number(), 53);
        EXPECT_EQ(e.description(), "File not found");
    }
    bool found = false;
    for (const ProcessEntry& entry : processes.snapshot())
        found = found || entry.processId == ::GetCurrentProcessId();
    EXPECT_TRUE(found);
}
