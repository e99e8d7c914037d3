// The check cycle: tick counting, the workstation patch pick-up and the update check, with fake
// ports (the service client is the real one, over a scripted HTTP port).
#include <gtest/gtest.h>

#include <algorithm>

#include "common/constants.h"
#include "fakes.h"
#include "tray/check_cycle.h"
#include "tray/patch_pickup.h"

using namespace checker;

namespace {

const std::string kApp = "C:\\app";
const std::string kServer = "\\\\srv\\oz\\";
const std::string kBase = "http://127.0.0.1:8080";
const std::string kUpdateInfo = kServer + "\\UpdateInfo.INI";
const std::string kDateUrl = kBase + "/SUPPORT/Downloads/QVLDATETime.asp";

struct Rig {
    fakes::FakeProfile profiles;
    fakes::FakeFiles files;
    fakes::FakeProcesses processes;
    fakes::FakeNetwork network;
    fakes::FakeHttp http;
    fakes::FakeDates dates;
    fakes::FakePump pump;
    HostProfile profile;
    CustomerRecord record;
    CheckCycle cycle;
    std::vector<std::string> answers; // what prValidateCheckInfo received

    Rig() {
        profile.lngInstallType = startup::kInstallStandAlone;
        record.strMajorVersion = "10.3";
        record.strMinorVersion = "3";
    }
    CheckCyclePorts ports() {
        return {profiles, files, processes, network, http, http, dates, pump};
    }
    TickOutcome tick() {
        return cycle.Timer1_Timer(ports(), kApp, kBase, profile, record,
                                  [this](const std::string& a) { answers.push_back(a); });
    }
    void ticks(int n) {
        for (int i = 0; i < n; ++i)
            tick();
    }
    void serviceAnswers(const std::string& date, const std::string& answer) {
        http.replies.push_back({date, {}});
        http.replies.push_back({answer, {}});
    }
    void networkClient() {
        profile.lngInstallType = startup::kInstallNetworkClient;
        profiles.set(kApp + "\\CLIENT.INI", "General", "ServerPath", " " + kServer + " ");
    }
    void offer(const std::string& baseMajor, const std::string& baseMinor, const std::string& major,
               const std::string& minor, const std::string& name) {
        files.plain.insert(kServer + "\\UpdateInfo.ini");
        profiles.set(kUpdateInfo, "VERSIONINFO", "BaseVersMajor", baseMajor);
        profiles.set(kUpdateInfo, "VERSIONINFO", "BaseVersMinor", baseMinor);
        profiles.set(kUpdateInfo, "VERSIONINFO", "VersMajorAvai", major);
        profiles.set(kUpdateInfo, "VERSIONINFO", "VersMinorAvai", minor);
        profiles.set(kUpdateInfo, "VERSIONINFO", "PatcFileName", name);
        if (!name.empty()) files.plain.insert(kServer + "\\" + name);
    }
};

} // namespace

TEST(CheckCycle, FirstCheckOnTheFifteenthTickAndEveryFifteenthAfter) {
    Rig rig;
    for (int i = 0; i < 3; ++i)
        rig.serviceAnswers("06/12/2026", "x,10.4.0.5,y,True");
    rig.ticks(14);
    EXPECT_TRUE(rig.http.exchanges.empty());
    EXPECT_EQ(rig.cycle.intTimerTicks, 14);
    rig.tick();
    EXPECT_EQ(rig.cycle.intTimerTicks, 0);
    ASSERT_EQ(rig.http.exchanges.size(), 2u);
    EXPECT_EQ(rig.http.exchanges[0].method, "POST");
    EXPECT_EQ(rig.http.exchanges[0].url, kDateUrl);
    rig.ticks(14);
    EXPECT_EQ(rig.http.exchanges.size(), 2u);
    rig.tick();
    EXPECT_EQ(rig.http.exchanges.size(), 4u);
    EXPECT_EQ(rig.answers.size(), 2u);
    EXPECT_EQ(rig.pump.runs, 30); // one message run at the start of every tick
}

TEST(CheckCycle, CustomerIdRequestWinsEvenWithACustomerCode) {
    Rig rig;
    rig.record.blnUseCustID = true;
    rig.record.lngCustID = 40021;
    rig.record.strCustCode = "OZ-77";
    rig.serviceAnswers("06/12/2026", "OK,10.4.0.5,,True");
    rig.ticks(15);
    ASSERT_EQ(rig.http.exchanges.size(), 2u);
    EXPECT_EQ(rig.http.exchanges[1].method, "GET");
    EXPECT_EQ(rig.http.exchanges[1].url,
              kBase + "/SUPPORT/Downloads/CheckOZProUpdate.asp?"
                      "Select=1&CustID=40021&MajorVersion=10.3&ProdSubId=S&MinorVersion=3");
    EXPECT_EQ(rig.cycle.strRequest,
              "Select=1&CustID=40021&MajorVersion=10.3&ProdSubId=S&MinorVersion=3");
    EXPECT_EQ(rig.cycle.strCheckInfo, "OK,10.4.0.5,,True");
    EXPECT_EQ(rig.answers, std::vector<std::string>{"OK,10.4.0.5,,True"});
}

TEST(CheckCycle, CustomerCodeRequestWithoutIdAndProductIdsByInstallType) {
    Rig rig;
    rig.record = {}; // no customer id: versions, code and key stay empty for the run
    rig.serviceAnswers("06/12/2026", "a,b,c,False");
    rig.ticks(15);
    ASSERT_EQ(rig.http.exchanges.size(), 2u);
    EXPECT_EQ(rig.http.exchanges[1].url,
              kBase + "/SUPPORT/Downloads/CheckWebUpdate.asp?"
                      "Select=1&txtCDKey=&MajorVersion=&CustCode=&ProdSubId=S&MinorVersion=");

    Rig second;
    second.record = {};
    second.profile.lngInstallType = startup::kInstallSecondProduct;
    second.serviceAnswers("06/12/2026", "a,b,c,False");
    second.ticks(15);
    EXPECT_NE(second.http.exchanges.at(1).url.find("Select=4&"), std::string::npos);
    EXPECT_NE(second.http.exchanges.at(1).url.find("ProdSubId=S"), std::string::npos);

    Rig client;
    client.record = {};
    client.networkClient();
    client.serviceAnswers("06/12/2026", "a,b,c,False");
    client.ticks(15);
    EXPECT_NE(client.http.exchanges.at(1).url.find("Select=1&"), std::string::npos);
    EXPECT_NE(client.http.exchanges.at(1).url.find("ProdSubId=N"), std::string::npos);
}

TEST(CheckCycle, NoConnectionOrNoDateEndsTheTickQuietlyUntilTheNextFifteenth) {
    Rig offline;
    offline.network.connected = false;
    offline.ticks(15);
    EXPECT_TRUE(offline.http.exchanges.empty());
    EXPECT_EQ(offline.cycle.intTimerTicks, 0);

    Rig html; // the date endpoint answering an error page: no check request at all
    html.http.replies.push_back({"<html>Service Unavailable</html>", {}});
    html.ticks(15);
    EXPECT_EQ(html.http.exchanges.size(), 1u);
    EXPECT_TRUE(html.answers.empty());

    Rig unreachable; // refused connection: GetSystemDate's failure text, not a date
    unreachable.http.replies.push_back({"", CheckerError(-2146697208, "", "refused")});
    unreachable.ticks(15);
    EXPECT_EQ(unreachable.http.exchanges.size(), 1u);
    unreachable.http.replies.push_back({"<html>", {}});
    unreachable.ticks(14);
    EXPECT_EQ(unreachable.http.exchanges.size(), 1u); // no retry before the next fifteenth
    unreachable.tick();
    EXPECT_EQ(unreachable.http.exchanges.size(), 2u);
}

TEST(CheckCycle, CheckRequestFailingAfterTheDateEndsTheTickQuietly) {
    Rig rig;
    rig.http.replies.push_back({"06/12/2026", {}});
    rig.http.replies.push_back({"", CheckerError(-2146697208, "", "connection dropped")});
    EXPECT_NO_THROW(rig.ticks(15));
    EXPECT_TRUE(rig.answers.empty());
    EXPECT_EQ(rig.cycle.intTimerTicks, 0);
    rig.serviceAnswers("06/12/2026", "a,1,b,True");
    rig.ticks(15);
    EXPECT_EQ(rig.answers.size(), 1u);
}

TEST(CheckCycle, ResultDisplayErrorsStillReachTheCaller) {
    Rig rig;
    rig.serviceAnswers("06/12/2026", "a,1,b,True");
    rig.ticks(14);
    EXPECT_THROW(rig.cycle.Timer1_Timer(
                     rig.ports(), kApp, kBase, rig.profile, rig.record,
                     [](const std::string&) { throw CheckerError(5, "prValidateCheckInfo", "x"); }),
                 CheckerError);
}

TEST(CheckCycle, ATickStartedByTheMessageRunsOfAnotherIsSkipped) {
    Rig rig;
    int nested = 0;
    rig.pump.onRun = [&] {
        if (nested++ == 0) {
            EXPECT_EQ(rig.tick(), TickOutcome::Skipped);
        }
    };
    EXPECT_EQ(rig.tick(), TickOutcome::Done);
    EXPECT_EQ(rig.cycle.intTimerTicks, 1);
    rig.pump.onRun = nullptr;
    EXPECT_EQ(rig.tick(), TickOutcome::Done); // the mark is cleared after the tick
    EXPECT_EQ(rig.cycle.intTimerTicks, 2);
}

TEST(PatchPickup, OnlyNetworkClientsReadTheHandOffFilesAndOnEveryTick) {
    Rig standAlone;
    standAlone.ticks(3);
    EXPECT_TRUE(standAlone.profiles.reads.empty());

    Rig client;
    client.networkClient();
    client.offer("10.3", "3", "10.3", "3", "patch.exe"); // nothing newer
    client.ticks(2);
    int clientIniReads = 0;
    for (const auto& r : client.profiles.reads)
        if (r == kApp + "\\CLIENT.INI|General|ServerPath|50") ++clientIniReads;
    EXPECT_EQ(clientIniReads, 2);
    EXPECT_EQ(client.cycle.patch.strServerFolder, kServer);
    // The four version values are read with 10-character buffers, the name with 50.
    EXPECT_NE(std::find(client.profiles.reads.begin(), client.profiles.reads.end(),
                        kUpdateInfo + "|VERSIONINFO|VersMinorAvai|10"),
              client.profiles.reads.end());
    EXPECT_NE(std::find(client.profiles.reads.begin(), client.profiles.reads.end(),
                        kUpdateInfo + "|VERSIONINFO|PatcFileName|50"),
              client.profiles.reads.end());
}

TEST(PatchPickup, CopiesAndStartsANewerPatchForTheInstalledVersion) {
    Rig rig;
    rig.networkClient();
    rig.offer("10.3", "3", "10.3", "5", " patch105.exe ");
    rig.files.plain.insert(kServer + "\\patch105.exe");
    EXPECT_EQ(rig.tick(), TickOutcome::PatchStarted);
    ASSERT_EQ(rig.files.copies.size(), 1u);
    EXPECT_EQ(rig.files.copies[0].first, kServer + "\\patch105.exe");
    EXPECT_EQ(rig.files.copies[0].second, kApp + "\\patch105.exe");
    ASSERT_EQ(rig.processes.started.size(), 1u);
    EXPECT_EQ(rig.processes.started[0], std::make_pair(kApp + "\\patch105.exe", 1));
    EXPECT_EQ(rig.pump.runs, 1 + 3); // the tick's own run and three before the start
    EXPECT_TRUE(rig.http.exchanges.empty());
}

TEST(PatchPickup, VersionRules) {
    const auto offer = [](std::string bMaj, std::string bMin, std::string maj, std::string min) {
        return PatchOffer{bMaj, bMin, maj, min, "p.exe"};
    };
    EXPECT_TRUE(fnPatchApplies("10.3", "3", offer("10.3", "3", "10.3", "5")));
    EXPECT_FALSE(fnPatchApplies("10.3", "3", offer("10.3", "3", "10.3", "3")));
    EXPECT_TRUE(fnPatchApplies("10.3", "3", offer("10.3", "3", "10.4", "0")));
    EXPECT_FALSE(fnPatchApplies("10.3", "3", offer("10.3", "3", "10.2", "9")));
    EXPECT_FALSE(fnPatchApplies("10.3", "4", offer("10.3", "3", "10.4", "0"))); // applied
    EXPECT_TRUE(fnPatchApplies("10.3", "3", offer("10.30", " 3", "11", "")));   // numbers
    EXPECT_FALSE(fnPatchApplies("10.3", "3", offer("", "", "10.4", "0")));      // no file
    EXPECT_TRUE(fnPatchApplies("", "", offer("", "", "1", "0")));               // both read as 0
}

TEST(PatchPickup, MissingOrHostilePatchDoesNothingAndTheCheckStillRuns) {
    for (const std::string& name :
         {std::string("..\\..\\evil.exe"), std::string("sub\\p.exe"), std::string("C:p.exe"),
          std::string("/tmp/p.exe"), std::string("..")}) {
        Rig rig;
        rig.networkClient();
        rig.offer("10.3", "3", "10.4", "0", "");
        rig.profiles.set(kUpdateInfo, "VERSIONINFO", "PatcFileName", name);
        rig.files.plain.insert(kServer + "\\" + name);
        rig.serviceAnswers("06/12/2026", "a,1,b,False");
        for (int i = 0; i < 15; ++i)
            EXPECT_EQ(rig.tick(), TickOutcome::Done) << name;
        EXPECT_TRUE(rig.files.copies.empty()) << name;
        EXPECT_TRUE(rig.processes.started.empty()) << name;
        EXPECT_FALSE(rig.cycle.patch.blnPatchDue) << name;
        EXPECT_EQ(rig.http.exchanges.size(), 2u) << name;
    }
    Rig empty; // an empty name names no file
    empty.networkClient();
    empty.offer("10.3", "3", "10.4", "0", "");
    empty.files.plain.insert(kServer + "\\");
    empty.ticks(3);
    EXPECT_TRUE(empty.processes.started.empty());

    Rig missing; // offered, but the file is not in the server folder
    missing.networkClient();
    missing.offer("10.3", "3", "10.4", "0", "");
    missing.profiles.set(kUpdateInfo, "VERSIONINFO", "PatcFileName", "gone.exe");
    missing.ticks(14);
    EXPECT_TRUE(missing.cycle.patch.blnPatchDue);
    EXPECT_TRUE(missing.processes.started.empty());
    EXPECT_TRUE(fnPatchNameSafe("Patch 10.3.5.exe"));
}

TEST(PatchPickup, CopyFailureGoesToTheCaller) {
    Rig rig;
    rig.networkClient();
    rig.offer("10.3", "3", "10.4", "0", "p.exe");
    rig.files.copyFails = true;
    EXPECT_THROW(rig.tick(), CheckerError);
    EXPECT_TRUE(rig.processes.started.empty());
}
