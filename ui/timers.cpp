#include "ui/timers.h"

#include <stdexcept>
#include <string>

namespace kr::ui {

void Timer::SetEnabled(bool enabled)
{
    if (enabled == enabled_) return;
    enabled_ = enabled;
    if (enabled) due_ = bank_->now_ + interval_;
}

void Timer::SetInterval(int milliseconds)
{
    interval_ = milliseconds;
    if (enabled_) due_ = bank_->now_ + interval_;
}

void Timer::Restart()
{
    SetEnabled(false);
    SetEnabled(true);
}

TimerBank::TimerBank()
{
    for (Timer& timer : timers_) timer.bank_ = this;
}

Timer& TimerBank::operator[](int number)
{
    if (number < 1 || number > kCount) throw std::out_of_range("TimerBank: no Timer" + std::to_string(number));
    return timers_[static_cast<size_t>(number - 1)];
}

const Timer& TimerBank::operator[](int number) const
{
    if (number < 1 || number > kCount) throw std::out_of_range("TimerBank: no Timer" + std::to_string(number));
    return timers_[static_cast<size_t>(number - 1)];
}

std::optional<int64_t> TimerBank::Earliest(bool lateness) const
{
    std::optional<int64_t> next;
    for (const Timer& timer : timers_) {
        if (!timer.enabled_ || timer.interval_ <= 0) continue;
        const int64_t moment = timer.due_ + (lateness && timer.unseen ? kUnseenLateness : 0);
        if (!next || moment < *next) next = moment;
    }
    return next;
}

void TimerBank::AdvanceTo(int64_t moment)
{
    for (;;) {
        Timer* next = nullptr;
        for (Timer& timer : timers_)
            if (timer.enabled_ && timer.interval_ > 0 && timer.due_ <= moment && (!next || timer.due_ < next->due_))
                next = &timer;
        if (!next) break;
        now_ = next->due_;
        // Scheduled from the deadline, not from when the handler ran, so ticks never drift.
        next->due_ += next->interval_;
        ++ticks_;
        if (next->onTick) next->onTick();
    }
    if (moment > now_) now_ = moment;
}

}  // namespace kr::ui
