#include <gtest/gtest.h>

#include <string>

#include "ui/timers.h"

namespace kr::ui {
namespace {

struct Recorder {
    TimerBank bank;
    std::string log;

    void Watch(int number)
    {
        bank[number].onTick = [this, number] { log += std::to_string(number) + "@" + std::to_string(bank.Now()) + " "; };
    }
};

TEST(Timers, TicksComeInDeadlineOrderWithTiesByTimerNumber)
{
    Recorder r;
    for (int n : {3, 1, 2}) {
        r.Watch(n);
        r.bank[n].SetInterval(n == 3 ? 20 : n == 1 ? 40 : 20);
        r.bank[n].SetEnabled(true);
    }
    r.bank.Advance(40);
    EXPECT_EQ(r.log, "2@20 3@20 1@40 2@40 3@40 ");
    EXPECT_EQ(r.bank.Now(), 40);
}

TEST(Timers, ALongAdvanceRunsEveryTickAndHandlersMayRetimeThemselves)
{
    Recorder r;
    r.Watch(5);
    r.bank[5].SetInterval(10);
    r.bank[5].SetEnabled(true);
    r.bank.Advance(10000);
    EXPECT_EQ(r.bank.TicksRun(), 1000u);

    // A handler that stops its own timer on the third tick.
    TimerBank bank;
    int ticks = 0;
    bank[1].SetInterval(30);
    bank[1].onTick = [&] {
        if (++ticks == 3) bank[1].SetEnabled(false);
    };
    bank[1].SetEnabled(true);
    bank.Advance(1000);
    EXPECT_EQ(ticks, 3);

    // A handler that starts another timer: its first tick is one interval after the handler ran.
    TimerBank chain;
    std::string log;
    chain[2].SetInterval(100);
    chain[2].onTick = [&] {
        log += "a@" + std::to_string(chain.Now()) + " ";
        chain[2].SetEnabled(false);
        chain[3].SetEnabled(true);
    };
    chain[3].SetInterval(50);
    chain[3].onTick = [&] { log += "b@" + std::to_string(chain.Now()) + " "; };
    chain[2].SetEnabled(true);
    chain.Advance(210);
    EXPECT_EQ(log, "a@100 b@150 b@200 ");
}

TEST(Timers, EnablingSchedulesOneIntervalLaterAndANewIntervalCountsFromTheChange)
{
    Recorder r;
    r.Watch(6);
    r.bank[6].SetInterval(100);
    r.bank.Advance(35);
    r.bank[6].SetEnabled(true);
    r.bank.Advance(99);
    EXPECT_EQ(r.log, "");
    r.bank.Advance(1);
    EXPECT_EQ(r.log, "6@135 ");
    // Enabling a running timer again changes nothing.
    r.bank[6].SetEnabled(true);
    r.bank.Advance(100);
    EXPECT_EQ(r.log, "6@135 6@235 ");
    r.bank.Advance(50);
    r.bank[6].SetInterval(200);
    r.bank.Advance(199);
    EXPECT_EQ(r.log, "6@135 6@235 ");
    r.bank.Advance(1);
    EXPECT_EQ(r.log, "6@135 6@235 6@485 ");
    // Restart pushes the next tick a whole interval away; disabling cancels it.
    r.bank.Advance(150);
    r.bank[6].Restart();
    r.bank.Advance(199);
    EXPECT_EQ(r.log, "6@135 6@235 6@485 ");
    r.bank[6].SetEnabled(false);
    r.bank.Advance(1000);
    EXPECT_EQ(r.log, "6@135 6@235 6@485 ");
    EXPECT_FALSE(r.bank.NextDue().has_value());
}

// A timer no one sees lets the loop sleep past its ticks; they still run in order and at their own moments.
TEST(Timers, UnseenTicksMayWaitForTheNextWakeUpButKeepTheirMoments)
{
    Recorder r;
    r.Watch(1);
    r.Watch(5);
    r.bank[1].SetInterval(30);
    r.bank[5].SetInterval(10);
    r.bank[5].SetEnabled(true);
    EXPECT_EQ(r.bank.NextWake(), 10);
    r.bank[5].unseen = true;
    EXPECT_EQ(r.bank.NextDue(), 10);
    EXPECT_EQ(r.bank.NextWake(), 10 + TimerBank::kUnseenLateness);
    r.bank[1].SetEnabled(true);
    EXPECT_EQ(r.bank.NextWake(), 30) << "a seen tick still wakes the loop on time";
    r.bank.AdvanceTo(30);
    EXPECT_EQ(r.log, "5@10 5@20 1@30 5@30 ");
}

}  // namespace
}  // namespace kr::ui
