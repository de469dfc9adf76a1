#pragma once
#include <array>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>

namespace kr::ui {

class TimerBank;

// One interval timer. Enabling a stopped timer schedules its first tick one interval later;
// a new interval on a running timer counts from the change.
class Timer {
public:
    bool Enabled() const { return enabled_; }
    int Interval() const { return interval_; }
    void SetEnabled(bool enabled);
    void SetInterval(int milliseconds);
    // Stop, then start: the next tick comes a whole interval from now.
    void Restart();

    std::string tag;
    std::function<void()> onTick;
    // Set while the timer's ticks change nothing the player can see (typing into a hidden label): the loop
    // need not wake for them and runs them, still in order and at their own moments, when it wakes for
    // something else, at most kUnseenLateness after they fell due.
    bool unseen = false;

private:
    friend class TimerBank;
    TimerBank* bank_ = nullptr;
    bool enabled_ = false;
    int interval_ = 0;
    int64_t due_ = 0;
};

// The sixteen timers of the window (numbered 1..16) and the clock that drives them.
class TimerBank {
public:
    static constexpr int kCount = 16;

    TimerBank();
    TimerBank(const TimerBank&) = delete;
    TimerBank& operator=(const TimerBank&) = delete;

    Timer& operator[](int number);
    const Timer& operator[](int number) const;

    int64_t Now() const { return now_; }
    static constexpr int64_t kUnseenLateness = 200;

    // The moment of the next tick, if any timer runs.
    std::optional<int64_t> NextDue() const { return Earliest(false); }
    // The latest moment a loop driving the clock should look at the timers again: the next tick, or a
    // little after it when no one would see it run.
    std::optional<int64_t> NextWake() const { return Earliest(true); }

    // Runs every tick that falls due up to `moment`, in deadline order (ties: lower timer number first),
    // moving the clock to each tick's moment before its handler runs, so a handler may stop,
    // restart or re-time any timer, itself included.
    void AdvanceTo(int64_t moment);
    void Advance(int64_t milliseconds) { AdvanceTo(now_ + milliseconds); }

    // Counts every tick handled since construction (for diagnostics and benchmarks).
    uint64_t TicksRun() const { return ticks_; }

private:
    friend class Timer;
    // The earliest tick of a running timer, unseen ones put off by their lateness when `lateness` is set.
    std::optional<int64_t> Earliest(bool lateness) const;
    std::array<Timer, kCount> timers_;
    int64_t now_ = 0;
    uint64_t ticks_ = 0;
};

}  // namespace kr::ui
