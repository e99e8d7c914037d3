// The once-a-day result display, the slide-in and the user commands' steps.
#include <gtest/gtest.h>

#include "common/constants.h"
#include "fakes.h"
#include "tray/commands.h"
#include "tray/result_display.h"
#include "tray/slide_in.h"

using namespace checker;

namespace {

const std::string kApp = "C:\\app";
const std::string kIni = "C:\\app\\Update.INI";

struct FakeWindow : ResultDisplayWindow {
    std::vector<std::string> steps;
    void disarmTimer1() override { steps.push_back("disarm Timer1"); }
    void armTimer2() override { steps.push_back("arm Timer2"); }
    void setLabel2(const std::string& t) override { steps.push_back("Label2=" + t); }
    void Timer2_Timer() override { steps.push_back("slide"); }
};

struct Display {
    fakes::FakeProfile profiles;
    fakes::FakeFiles files;
    fakes::FakeDates dates; // today 06/12/2026, day first
    FakeWindow window;
    bool run(const std::string& answer) {
        return prValidateCheckInfo({profiles, files, dates}, kApp, answer, window);
    }
    void stored(const std::string& value) {
        files.plain.insert(kIni);
        profiles.set(kIni, "General", "CurrDate", value);
    }
};

} // namespace

TEST(ResultDisplay, FirstRunCreatesTheFileAndShowsInTheFixedOrder) {
    Display d;
    EXPECT_TRUE(d.run("OK,10.4.0.5,x,True"));
    EXPECT_EQ(d.window.steps,
              (std::vector<std::string>{"disarm Timer1", "arm Timer2",
                                        "Label2=Latest version available : 10.4.0.5", "slide"}));
    // Created with today's date, then today's date written again before the display.
    EXPECT_EQ(d.profiles.writes, (std::vector<std::string>{kIni + "|General|CurrDate|06/12/2026",
                                                           kIni + "|General|CurrDate|06/12/2026"}));
}

TEST(ResultDisplay, OncePerCalendarDay) {
    Display today;
    today.stored(" 06/12/2026 ");
    EXPECT_FALSE(today.run("OK,10.4.0.5,x,True"));
    EXPECT_TRUE(today.window.steps.empty());
    EXPECT_TRUE(today.profiles.writes.empty());
    ASSERT_EQ(today.profiles.reads.size(), 1u);
    EXPECT_EQ(today.profiles.reads[0], kIni + "|General|CurrDate|12"); // 11 characters and NUL

    Display yesterday;
    yesterday.stored("05/12/2026");
    EXPECT_TRUE(yesterday.run("OK,10.4.0.5,x,1"));
    EXPECT_EQ(yesterday.profiles.writes,
              std::vector<std::string>{kIni + "|General|CurrDate|06/12/2026"});

    Display longer; // only the first 11 characters count: "06/12/2026 " is today
    longer.stored(std::string("06/12/2026 junk\0", 16));
    EXPECT_FALSE(longer.run("OK,10.4.0.5,x,True"));
}

TEST(ResultDisplay, NoUpdateLeavesEverythingAlone) {
    for (const std::string& answer :
         {std::string("OK,10.4.0.5,x,False"), std::string("OK,10.4.0.5,x,0"),
          // Not check answers at all: error pages, a proxy's login page, short answers.
          std::string("<html><body>Login required</body></html>"), std::string("OK,10.4,x"),
          std::string(""), std::string("a,b,c,<b>yes</b>,e")}) {
        Display d;
        EXPECT_NO_THROW(EXPECT_FALSE(d.run(answer))) << answer;
        EXPECT_TRUE(d.window.steps.empty()) << answer;
        EXPECT_TRUE(d.profiles.writes.empty()) << answer;
        EXPECT_TRUE(d.profiles.reads.empty()) << answer;
    }
    EXPECT_EQ(fnOfferedVersion("a,,b,-1,more"), std::optional<std::string>(""));
}

TEST(ResultDisplay, DamagedStoredDateCountsAsAnotherDay) {
    for (const std::string& value : {std::string(""), std::string("garbage"),
                                    std::string("31/13/2026"), std::string("\0\0", 2)}) {
        Display d;
        d.stored(value);
        EXPECT_NO_THROW(EXPECT_TRUE(d.run("OK,10.4.0.5,x,True"))) << value;
        EXPECT_EQ(d.profiles.writes,
                  std::vector<std::string>{kIni + "|General|CurrDate|06/12/2026"});
    }
}

TEST(ResultDisplay, EmptyFieldOneShowsTheBareLabel) {
    Display d;
    d.run("OK,,x,True");
    EXPECT_EQ(d.window.steps.at(2), "Label2=Latest version available : ");
}

namespace {

struct FakeSlideWindow : SlideWindow {
    int left = -1, topTwips = 0, moves = 0, setTops = 0, firstShownAt = -1, shows = 0;
    bool timer2Armed = true, topmost = false, alive = true, shownEarly = false;
    void move(int l, int t) override {
        left = l;
        topTwips = t;
        ++moves;
    }
    int top() override { return topTwips; }
    void setTop(int t) override {
        topTwips = t;
        ++setTops;
    }
    void show() override {
        if (firstShownAt < 0) firstShownAt = topTwips;
        ++shows;
    }
    void disarmTimer2() override { timer2Armed = false; }
    void prSetTopMost() override { topmost = true; }
    bool exists() override { return alive; }
};

ScreenMetrics screen(int w, int h) {
    return {15, 15, std::int16_t(w), std::int16_t(h)};
}

} // namespace

TEST(SlideIn, PlanPerScreenSize) {
    const auto large = fnSlidePlan(screen(1152, 864), 3435);
    EXPECT_EQ(large.intStopLine, 10150);
    EXPECT_EQ(large.intRunsPerStep, 1000);
    const auto medium = fnSlidePlan(screen(1024, 768), 3435);
    EXPECT_EQ(medium.intStopLine, 8650);
    EXPECT_EQ(medium.intRunsPerStep, 300);
    EXPECT_EQ(medium.intStartTop, 15000);
    EXPECT_EQ(fnSlidePlan(screen(1280, 1024), 3435).intStopLine, 6150);
    EXPECT_EQ(fnSlidePlan(screen(800, 600), 3435).intStopLine, 6150);
    EXPECT_EQ(fnSlidePlan(screen(1024, 864), 3435).intStopLine, 6150); // both sides must match
    EXPECT_EQ(fnSlidePlan(screen(1024, 768), 3435).intLeft, 15360 - 3435 - 50);
    EXPECT_EQ(fnSlidePlan(screen(1024, 768), 3435).intLeft, 11875);
}

TEST(SlideIn, OneTwipStepsCountedRunsVisibleFromTheFirstStepThenTopmost) {
    FakeSlideWindow w;
    fakes::FakePump pump;
    SlideIn slide;
    const SlidePlan plan{11875, 15000, 14990, 300};
    slide.Timer2_Timer(w, pump, plan);
    EXPECT_EQ(w.left, 11875);
    EXPECT_EQ(w.topTwips, 14990);
    EXPECT_EQ(w.setTops, 10);
    EXPECT_EQ(w.shows, 10);
    EXPECT_EQ(w.firstShownAt, 14999);
    EXPECT_EQ(pump.runs, 2 + 10 * 300);
    EXPECT_FALSE(w.timer2Armed);
    EXPECT_TRUE(w.topmost);
    EXPECT_TRUE(slide.done());
}

TEST(SlideIn, ATimer2TickDuringTheSlideDoesNotStartItAgain) {
    FakeSlideWindow w;
    fakes::FakePump pump;
    SlideIn slide;
    const SlidePlan plan{100, 15000, 14995, 2};
    pump.onRun = [&] { slide.Timer2_Timer(w, pump, plan); };
    slide.Timer2_Timer(w, pump, plan);
    EXPECT_EQ(w.moves, 1);
    EXPECT_EQ(w.topTwips, 14995);
    pump.onRun = nullptr;
    slide.Timer2_Timer(w, pump, plan); // after the end too: it slides in once
    EXPECT_EQ(w.moves, 1);
}

TEST(SlideIn, AWindowUnloadedMidSlideStopsTheLoop) {
    FakeSlideWindow w;
    fakes::FakePump pump;
    SlideIn slide;
    pump.onRun = [&] {
        if (pump.runs == 40) w.alive = false;
    };
    slide.Timer2_Timer(w, pump, {0, 15000, 8650, 10});
    EXPECT_LT(w.setTops, 5);
    EXPECT_FALSE(w.topmost);
}

TEST(Commands, StepsInOrderAndOnlyTwoStartTheUpdater) {
    for (UserCommand c : {UserCommand::GetUpdate, UserCommand::CheckUpdate, UserCommand::Cancel,
                          UserCommand::Close}) {
        fakes::FakeProcesses processes;
        processes.running = {
            {7, "CheckOZProUpdate.exe"}, {8, "oldCheckOZProUpdate"}, {9, "CheckODOZUpdate"}};
        std::vector<std::string> order;
        prCommandSteps(c, processes, kApp, false, [&] {
            order.push_back("icon removed, updater started: " +
                            std::to_string(processes.started.size()));
        });
        const bool updater = c == UserCommand::GetUpdate || c == UserCommand::CheckUpdate;
        EXPECT_EQ(order, std::vector<std::string>{"icon removed, updater started: " +
                                                  std::to_string(updater ? 1 : 0)});
        if (updater) {
            EXPECT_EQ(processes.started.at(0), std::make_pair(kApp + "\\KtrLiveUpdate.exe", 3));
        }
        // The title name has no extension: only images ending in it exactly are ended.
        EXPECT_EQ(processes.terminated, std::vector<std::uint32_t>{8});
    }
    fakes::FakeProcesses second;
    second.running = {{9, "CheckODOZUpdate"}};
    prCommandSteps(UserCommand::Close, second, kApp, true, [] {});
    EXPECT_EQ(second.terminated, std::vector<std::uint32_t>{9});
}

TEST(Commands, AnUpdaterThatCannotStartStopsTheCommandBeforeTheIcon) {
    fakes::FakeProcesses processes;
    processes.startFails = true;
    bool removed = false;
    EXPECT_THROW(
        prCommandSteps(UserCommand::GetUpdate, processes, kApp, false, [&] { removed = true; }),
        CheckerError);
    EXPECT_FALSE(removed);
    EXPECT_TRUE(processes.terminated.empty());
}
