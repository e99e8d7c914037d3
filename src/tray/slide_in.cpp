#include "tray/slide_in.h"

#include "common/constants.h"

namespace checker {

SlidePlan fnSlidePlan(const ScreenMetrics& metrics, int intWindowWidth) {
    SlidePlan plan;
    const int intScreenWidth = int(metrics.intScreenWidthPx) * int(metrics.intTwipsPerPixelX);
    plan.intLeft = intScreenWidth - intWindowWidth - tray::kSlideRightMargin;
    plan.intStartTop = tray::kSlideStartTop;
    if (metrics.intScreenWidthPx == tray::kScreenLargeWidthPx &&
        metrics.intScreenHeightPx == tray::kScreenLargeHeightPx) {
        plan.intStopLine = tray::kStopLineLarge;
        plan.intRunsPerStep = tray::kMessageRunsLarge;
    } else if (metrics.intScreenWidthPx == tray::kScreenMediumWidthPx &&
               metrics.intScreenHeightPx == tray::kScreenMediumHeightPx) {
        plan.intStopLine = tray::kStopLineMedium;
        plan.intRunsPerStep = tray::kMessageRunsOther;
    } else {
        plan.intStopLine = tray::kStopLineOther;
        plan.intRunsPerStep = tray::kMessageRunsOther;
    }
    return plan;
}

void SlideIn::Timer2_Timer(SlideWindow& window, MessagePump& pump, const SlidePlan& plan) {
    if (state_ != State::Waiting) return;
    state_ = State::Sliding;
    window.move(plan.intLeft, plan.intStartTop);
    for (int i = 0; i < tray::kSlideInitialMessageRuns; ++i)
        pump.doEvents();
    if (!window.exists()) return;
    for (;;) {
        const int intTop = window.top();
        if (intTop <= plan.intStopLine) break;
        window.setTop(intTop - tray::kSlideStep);
        for (int i = 0; i < plan.intRunsPerStep; ++i)
            pump.doEvents();
        if (!window.exists()) return; // unloaded by a command between the steps
        window.show();
    }
    window.disarmTimer2();
    window.prSetTopMost();
    state_ = State::Done;
}

} // namespace checker
