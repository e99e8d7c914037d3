// The slide-in: the window rises from below the screen, 1 twip per step, paced by counted
// message runs, and ends topmost. Positions in twips.
#pragma once

#include "common/ports.h"
#include "startup/screen_metrics.h"

namespace checker {

struct SlidePlan {
    int intLeft = 0;
    int intStartTop = 0;
    int intStopLine = 0;
    int intRunsPerStep = 0;
};

// Left edge, start and stop line, and the message runs per step for this screen.
SlidePlan fnSlidePlan(const ScreenMetrics& metrics, int intWindowWidth);

class SlideWindow {
  public:
    virtual ~SlideWindow() = default;
    virtual void move(int intLeft, int intTop) = 0;
    virtual int top() = 0;
    virtual void setTop(int intTop) = 0;
    virtual void show() = 0;
    virtual void disarmTimer2() = 0;
    virtual void prSetTopMost() = 0;
    // False once a command has unloaded the window in the middle of the slide.
    virtual bool exists() = 0;
};

// Timer2_Timer. The slide lets messages run between its steps, so Timer2 itself falls due
// inside it: a result display slides in once, and such ticks are ignored.
class SlideIn {
  public:
    void Timer2_Timer(SlideWindow& window, MessagePump& pump, const SlidePlan& plan);
    bool sliding() const noexcept { return state_ == State::Sliding; }
    bool done() const noexcept { return state_ == State::Done; }

  private:
    enum class State { Waiting, Sliding, Done };
    State state_ = State::Waiting;
};

} // namespace checker
