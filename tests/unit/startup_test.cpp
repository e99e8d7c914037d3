// Start-up decisions: value cleaning, product and installation type, paths, screen metrics,
// process-name matching.
#include <gtest/gtest.h>

#include "common/constants.h"
#include "common/text.h"
#include "fakes.h"
#include "startup/host_profile.h"
#include "startup/kill_process.h"
#include "startup/screen_metrics.h"

using namespace checker;

TEST(CleanValue, RemovesEveryNulAndTrimsBlanksOnly) {
    EXPECT_EQ(fnCleanValue(std::string(" orvel\0 zarn\0 ", 14)), "orvel zarn");
    EXPECT_EQ(fnCleanValue(std::string("\0\0\0", 3)), "");
    EXPECT_EQ(fnCleanValue("\tvalue\t"), "\tvalue\t"); // only blanks are trimmed
    EXPECT_EQ(fnCleanValue("   "), "");
}

TEST(SplitFields, EmptyTextHasNoFieldsAndCommasKeepEmptyFields) {
    EXPECT_TRUE(splitFields("", ',').empty());
    EXPECT_EQ(splitFields(",", ',').size(), 2u);
    EXPECT_EQ(splitFields("a,,b", ','), (std::vector<std::string>{"a", "", "b"}));
}

TEST(ProductName, RecognisesTheThreeNamesCleanedAndUpperCased) {
    EXPECT_EQ(*decideProductName("orvel zarn gold").caption, "Orvel Zarn Pro");
    EXPECT_FALSE(decideProductName("ORVEL ZARN PRO").blnSecondProduct);
    const auto second = decideProductName("Orvel Do Zarn");
    EXPECT_EQ(*second.caption, "Orvel DO Zarn");
    EXPECT_TRUE(second.blnSecondProduct);
    EXPECT_FALSE(decideProductName("ORVEL  ZARN PRO").caption); // inner blanks count
    EXPECT_FALSE(decideProductName("").caption);
}

TEST(ProductName, StepReadsApplicationIniWithA50CharacterBuffer) {
    fakes::FakeProfile ini;
    ini.set("C:\\app\\Application.INI", "General", "Application", std::string(" orvel zarn gold\0", 17));
    HostProfile p;
    prReadProductName(ini, "C:\\app", p);
    EXPECT_EQ(p.strCaption, "Orvel Zarn Pro");
    ASSERT_EQ(ini.reads.size(), 1u);
    EXPECT_EQ(ini.reads[0], "C:\\app\\Application.INI|General|Application|50");

    HostProfile untouched;
    fakes::FakeProfile none;
    prReadProductName(none, "C:\\app", untouched);
    EXPECT_EQ(untouched.strCaption, "");
    EXPECT_FALSE(untouched.blnSecondProduct);
}

TEST(InstallType, MarkerFilesInTheirOrder) {
    EXPECT_EQ(decideInstallType({true, false, false, false}), 3);
    EXPECT_EQ(decideInstallType({true, false, true, true}), 3); // network client wins
    EXPECT_EQ(decideInstallType({true, true, true, true}), 4);
    EXPECT_EQ(decideInstallType({true, true, true, false}), 1);
    EXPECT_EQ(decideInstallType({false, false, true, false}), 1);
    EXPECT_EQ(decideInstallType({}), 1);
}

TEST(Initialization, EachTypeFindsItsDatabase) {
    const std::string dir = "C:\\app";
    {
        fakes::FakeProfile ini;
        fakes::FakeFiles files;
        files.plain = {dir + "\\data\\Ozp.ACCDB"};
        HostProfile p;
        EXPECT_TRUE(prIntialization(ini, files, dir, p));
        EXPECT_EQ(p.lngInstallType, 1);
        EXPECT_EQ(p.bytCustPlan, 14);
        EXPECT_TRUE(ini.reads.empty()); // no CLIENT.INI read outside a network client
    }
    {
        fakes::FakeProfile ini;
        ini.set(dir + "\\CLIENT.INI", "General", "ServerPath", "  \\\\srv\\share\\  ");
        fakes::FakeFiles files;
        files.plain = {dir + "\\OZPLICNew.exe"};
        files.special = {"\\\\srv\\share\\data\\Ozp.ACCDB"};
        HostProfile p;
        EXPECT_TRUE(prIntialization(ini, files, dir, p));
        EXPECT_EQ(p.lngInstallType, 3);
        EXPECT_EQ(p.strDatabasePath, "\\\\srv\\share\\data\\Ozp.ACCDB");
    }
    {
        fakes::FakeProfile ini;
        fakes::FakeFiles files;
        files.plain = {dir + "\\OZPLICNew.exe", dir + "\\DATA\\OZPBLANK.ACCDB", dir + "\\OrvelDo.exe",
                       dir + "\\DATA\\ODOZBLANK.MDB", dir + "\\data\\Odoz.Mdb"};
        HostProfile p;
        EXPECT_TRUE(prIntialization(ini, files, dir, p));
        EXPECT_EQ(p.lngInstallType, 4);
        EXPECT_EQ(p.bytCustPlan, 89);
        EXPECT_EQ(p.strDatabasePath, dir + "\\data\\Odoz.Mdb");
    }
}

TEST(Initialization, ServerPathWithoutSeparatorOrMissingDatabaseEndsSilently) {
    const std::string dir = "C:\\app";
    fakes::FakeProfile ini;
    ini.set(dir + "\\CLIENT.INI", "General", "ServerPath", "S:\\server");
    fakes::FakeFiles files;
    files.plain = {dir + "\\OZPLICNew.exe", "S:\\server\\data\\Ozp.ACCDB"};
    HostProfile p;
    EXPECT_FALSE(prIntialization(ini, files, dir, p));
    EXPECT_EQ(p.strDatabasePath, "S:\\serverdata\\Ozp.ACCDB");

    fakes::FakeProfile noClient;
    HostProfile q;
    EXPECT_FALSE(prIntialization(noClient, files, dir, q));
    EXPECT_EQ(q.strDatabasePath, "data\\Ozp.ACCDB");
}

TEST(Initialization, HiddenMarkerFilesDoNotCount) {
    const std::string dir = "C:\\app";
    fakes::FakeProfile ini;
    fakes::FakeFiles files;
    files.special = {dir + "\\OZPLICNew.exe"}; // hidden: a plain search does not find it
    files.plain = {dir + "\\data\\Ozp.ACCDB"};
    HostProfile p;
    EXPECT_TRUE(prIntialization(ini, files, dir, p));
    EXPECT_EQ(p.lngInstallType, 1);
}

TEST(DerivedCodes, ByInstallationTypeAndProduct) {
    EXPECT_EQ(productIdFor(1), 1);
    EXPECT_EQ(productIdFor(3), 1);
    EXPECT_EQ(productIdFor(4), 4);
    EXPECT_EQ(productSubIdFor(3), "N");
    EXPECT_EQ(productSubIdFor(4), "S");
    EXPECT_EQ(hostExePath(4, "D:"), "D:\\OrvelDo.EXE");
    EXPECT_EQ(hostExePath(3, "D:"), "D:\\OZPLICNew.EXE");
    EXPECT_EQ(titleNameFor(true), "CheckODOZUpdate");
    EXPECT_EQ(tipTextFor(false), "OZPro Live Update");
}

TEST(ScreenMetrics, CommonDpisAndSizes) {
    auto m = computeScreenMetrics(96, 96, 1024, 768);
    EXPECT_EQ(m.intTwipsPerPixelX, 15);
    EXPECT_EQ(m.intScreenWidthPx, 1024);
    EXPECT_EQ(m.intScreenHeightPx, 768);
    m = computeScreenMetrics(120, 120, 1280, 1024);
    EXPECT_EQ(m.intTwipsPerPixelY, 12);
    EXPECT_EQ(m.intScreenHeightPx, 1024);
    m = computeScreenMetrics(144, 144, 1152, 864);
    EXPECT_EQ(m.intTwipsPerPixelX, 10);
    EXPECT_EQ(m.intScreenWidthPx, 1152);
    // 1440/110 = 13.09: the rounded factor changes the pixel count the program believes in.
    m = computeScreenMetrics(110, 110, 1000, 1000);
    EXPECT_EQ(m.intTwipsPerPixelX, 13);
    EXPECT_EQ(m.intScreenWidthPx, 1007);
}

TEST(ScreenMetrics, ArithmeticFaultsAreErrors) {
    EXPECT_THROW(computeScreenMetrics(0, 96, 1024, 768), CheckerError);
    EXPECT_THROW(computeScreenMetrics(96, 96, 40000, 768), CheckerError); // past 16 bits
    EXPECT_EQ(roundToInt16(2.5), 2);
    EXPECT_EQ(roundToInt16(3.5), 4);
}

TEST(KillProcessByName, TailMatchCaseIgnoredEmptyNameDoesNothing) {
    fakes::FakeProcesses procs;
    procs.running = {{10, "MyApp.exe"}, {11, "app.exe.bak"}, {12, "APP.EXE"}, {13, "pp.exe"},
                     {14, "CheckOZProUpdate.exe"}};
    KillProcessByName(procs, "app.exe");
    EXPECT_EQ(procs.terminated, (std::vector<std::uint32_t>{10, 12}));
    procs.terminated.clear();
    KillProcessByName(procs, "");
    EXPECT_TRUE(procs.terminated.empty());
    // The title name has no extension, so the checker's own image is not matched.
    KillProcessByName(procs, "CheckOZProUpdate");
    EXPECT_TRUE(procs.terminated.empty());
}
