// The fight as a player meets it: runs turned into shots, engineering and healing, the enemy's answer,
// the bomb's countdown, and the ways a mission ends early (death, explosion, the key T).
#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <sstream>
#include <vector>

#include "board/moves.h"
#include "board/resolve.h"
#include "shell/timer_numbers.h"
#include "tests/fight_helpers.h"
#include "tests/session.h"

namespace kr {
namespace {

using testing::Session;
using namespace testing;

// --- Shots -------------------------------------------------------------------------------------------------

TEST(FightShots, DamageGrowsWithLengthGreenTipsAccuracyAndDeadlyBulletsAndTheBarKeepsProportion)
{
    Session s(11, kAllOpenWithSound);
    Enter(s, 1, 0);  // "Misja 2": an enemy of 40 health
    s.Run("set EnemyHitChance 0");
    s.Sounds();

    // Three brown bullets, one green-tipped, Accuracy 0: (2 + 0) x 2 = 4. A full bar gets no marker.
    PlayRun(s, "1g1");
    EXPECT_EQ(s.game.EnemyHealth, 36);
    EXPECT_EQ(s.Print("EnemyHealthBar.Width"), "1309.5");
    EXPECT_EQ(s.Print("HitMarker.Visible"), "False");
    EXPECT_FALSE(s.game.timers[kMarkerTimer].Enabled());
    EXPECT_TRUE(IsShot(s.Sounds()));
    // The hero's frame lights up and the (hidden) number starts its rise from the health label.
    EXPECT_EQ(s.Print("HeroShotFrame.Visible"), "True");
    EXPECT_EQ(s.Print("DamageLabel.Top"), "385");
    EXPECT_EQ(s.Print("DamageLabel.Visible"), "False");
    s.Advance(400);
    EXPECT_EQ(s.Print("HeroShotFrame.Visible"), "True");
    EXPECT_EQ(s.Print("DamageLabel.Top"), "225");
    s.Advance(100);  // 5th rise tick
    EXPECT_EQ(s.Print("HeroShotFrame.Visible"), "False");
    s.Advance(300);
    EXPECT_TRUE(s.game.timers[kRiseTimer].Enabled());
    s.Advance(100);  // 9th rise tick
    EXPECT_FALSE(s.game.timers[kRiseTimer].Enabled());
    EXPECT_EQ(s.Print("DamageLabel.Top"), "25");
    Settle(s);  // the enemy's (missed) shot

    // Five in a row with two green tips and Accuracy 2: (4 + 2) x 3 = 18. The bar had been hit, so the
    // marker goes to where the bar ended before this hit.
    Set(s, {"Accuracy 2", "ImmobilisedTurns 2"});  // no enemy turns between the next two hits
    Lay(s, Board({"..1.....", "g131g..."}));
    const int64_t second = Now(s);
    Swap(s, 13, 23);
    s.Advance(240);
    EXPECT_EQ(s.game.EnemyHealth, 18);
    EXPECT_EQ(s.Print("EnemyHealthBar.Width"), "654.75");
    EXPECT_EQ(s.Print("HitMarker.Visible"), "True");
    EXPECT_EQ(s.Print("HitMarker.Left"), "1429.5");

    // The next move, with deadly bullets, Strength 1 and Accuracy 1: amount (1 + 2) x 2 = 6, damage 7.
    Settle(s);
    const int64_t third = Now(s);
    ASSERT_LT(third + 240, second + 240 + 800) << "the third hit must land while the marker still shows";
    Set(s, {"Strength 1", "Accuracy 1", "DeadlyBulletsTurns 3"});
    PlayRun(s, "111");
    EXPECT_EQ(s.game.EnemyHealth, 11);
    EXPECT_EQ(s.Print("EnemyHealthBar.Width"), "400.125");
    EXPECT_EQ(s.Print("HitMarker.Left"), "1429.5") << "a marker still showing keeps its place";
    // The marker goes 800 ms after the latest hit, not after the one that placed it.
    s.Advance(static_cast<int>(second + 240 + 800 - Now(s)));
    EXPECT_EQ(s.Print("HitMarker.Visible"), "True");
    s.Advance(static_cast<int>(third + 240 + 799 - Now(s)));
    EXPECT_EQ(s.Print("HitMarker.Visible"), "True");
    s.Advance(1);
    EXPECT_EQ(s.Print("HitMarker.Visible"), "False");
    EXPECT_FALSE(s.game.timers[kMarkerTimer].Enabled());
    Settle(s);
    EXPECT_EQ(s.game.DeadlyBulletsTurns, 2) << "one move used up";
    EXPECT_EQ(s.game.EnemyHealth, 11) << "no stray cascade hit the enemy";
}

TEST(FightShots, AnOverkillShotFinishesTheEnemyAndItNeverShootsBack)
{
    Session s(3, kAllOpenWithSound);
    Enter(s, 0, 1);  // "Misja 1", the training robot with 25 health
    Set(s, {"Strength 2", "Accuracy 2", "DeadlyBulletsTurns 1", "EnemyHitChance 101"});
    // Two green tips in a run of three under deadly bullets: ((2 + 2) x 2 + 2) x 3 = 30.
    PlayRun(s, "gg1");
    EXPECT_EQ(s.game.EnemyHealth, -5);
    EXPECT_FALSE(s.game.EnemyPresent);
    EXPECT_FALSE(s.game.EnemyRequired);
    EXPECT_EQ(s.Print("DoneFrame(1).Visible"), "True");
    EXPECT_EQ(s.Print("RequiredFrame(1).Visible"), "False");
    EXPECT_EQ(s.Print("EnemyHealthBar.Width"), "1");
    EXPECT_EQ(s.Print("HitMarker.Visible"), "False");

    s.AdvanceUntil([&] { return s.game.screen.StageDoneLabel->visible; });
    EXPECT_FALSE(s.game.timers[kAttackTimer].Enabled()) << "a dead enemy takes no turn";
    EXPECT_EQ(s.game.Health, 30);
    EXPECT_EQ(s.game.DeadlyBulletsTurns, 0);
    s.Advance(7000);  // the robot was the last goal of "Misja 1"
    EXPECT_EQ(s.Print("MissionCompleteScreen.Visible"), "True");
}

TEST(FightShots, BulletsWithNoEnemyOnlyMakeAnImpactSound)
{
    Session s(5, kAllOpenWithSound);
    Enter(s, 0, 0);  // "Misja 1", stage 0: a door, no enemy
    s.Sounds();
    PlayRun(s, "1g1");
    EXPECT_EQ(s.Sounds(), std::vector<int>{3});
    EXPECT_EQ(s.Print("HeroShotFrame.Visible"), "False");
    EXPECT_FALSE(s.game.timers[kRiseTimer].Enabled());
    EXPECT_EQ(s.game.TerminalWork, 20);
    EXPECT_EQ(s.game.Resources[1], 0);
}

// --- Engineering and healing -------------------------------------------------------------------------------

TEST(FightEngineering, PointsGoWholeToTheFirstGoalInNeedAndSurplusIsLost)
{
    {
        // A required bomb beside a required terminal: the bomb takes everything.
        Session s(2, kAllOpenWithSound);
        Enter(s, 2, 2);  // "Misja 3", stage 2: the bomb
        Set(s, {"TerminalPresent True", "TerminalRequired True", "TerminalWork 20", "BombWork 2", "Dexterity 1"});
        s.Sounds();
        PlayRun(s, "444");
        EXPECT_EQ(s.game.BombWork, -1);
        EXPECT_FALSE(s.game.BombPresent);
        EXPECT_FALSE(s.game.BombRequired);
        EXPECT_EQ(s.Print("BombWorkBar.Width"), "1");
        EXPECT_EQ(s.Print("DoneFrame(0).Visible"), "True");
        EXPECT_EQ(s.Print("RequiredFrame(0).Visible"), "False");
        EXPECT_EQ(s.game.TerminalWork, 20) << "the surplus point is lost, not passed on";
        EXPECT_EQ(s.Print("TerminalWorkBar.Width"), "1455");
        EXPECT_EQ(s.Sounds(), std::vector<int>{5});
        EXPECT_EQ(s.game.Resources[4], 1);
        Settle(s);
        EXPECT_FALSE(s.game.screen.StageDoneLabel->visible) << "the terminal is still required";
        EXPECT_TRUE(s.game.timers[kBombClock].Enabled());

        // Next, the required terminal.
        PlayRun(s, "444");
        EXPECT_EQ(s.game.TerminalWork, 17);
        EXPECT_EQ(s.Print("TerminalWorkBar.Width"), "1236.75");
    }
    {
        // "Misja 9", stage 0: the door comes before the optional bomb, which is never touched.
        Session s(4, kAllOpenWithSound);
        Enter(s, 8, 0);
        PlayRun(s, "444");
        EXPECT_EQ(s.game.TerminalWork, 28);
        EXPECT_EQ(s.game.BombWork, 100);
        EXPECT_EQ(s.Print("TerminalWorkBar.Width"), "1358");
        EXPECT_EQ(s.Print("BombWorkBar.Width"), "735");
        Settle(s);
        s.Run("set TerminalWork 1");
        StartRun(s, "444");
        s.AdvanceUntil([&] { return s.game.screen.StageDoneLabel->visible; });
        EXPECT_EQ(s.game.BombWork, 100);
        EXPECT_TRUE(s.game.BombPresent);
        const int16_t ticks = s.game.BombTicks;
        EXPECT_FALSE(s.game.timers[kBombClock].Enabled()) << "the stage's end stops the optional bomb's clock";
        s.Advance(3000);
        EXPECT_EQ(s.game.BombTicks, ticks);
    }
    {
        // "Misja 5", stage 2: with only the enemy required, wrenches go to the optional bomb; disarming it
        // does not stop its clock.
        Session s(6, kAllOpenWithSound);
        Enter(s, 4, 2);
        Set(s, {"EnemyHitChance 0", "BombWork 2"});
        PlayRun(s, "444");
        EXPECT_FALSE(s.game.BombPresent);
        EXPECT_EQ(s.Print("DoneFrame(0).Visible"), "True");
        EXPECT_EQ(s.Print("BombWorkBar.Width"), "1");
        Settle(s);
        const int16_t ticks = s.game.BombTicks;
        s.Advance(1000);
        EXPECT_TRUE(s.game.timers[kBombClock].Enabled());
        EXPECT_EQ(s.game.BombTicks, ticks - 10);
        EXPECT_FALSE(s.game.screen.StageDoneLabel->visible);
    }
    {
        // No door, terminal or bomb: an impact, but the wrench still pays its resource point.
        Session s(8, kAllOpenWithSound);
        Enter(s, 1, 0);
        s.Sounds();
        PlayRun(s, "444");
        EXPECT_EQ(s.Sounds(), std::vector<int>{3});
        EXPECT_EQ(s.game.Resources[4], 1);
    }
}

TEST(FightHealing, RedCrossesHealUpToTheMaximumAndClinkAtFullHealth)
{
    Session s(9, kAllOpenWithSound);
    Enter(s, 0, 0);
    s.Sounds();
    PlayRun(s, "555");
    EXPECT_EQ(s.Sounds(), std::vector<int>{3});
    EXPECT_EQ(s.game.Health, 30);
    EXPECT_EQ(s.game.Resources[5], 1);
    Settle(s);

    Set(s, {"Health 29", "Intelligence 2"});
    s.Sounds();
    PlayRun(s, "555");
    EXPECT_EQ(s.Sounds(), std::vector<int>{6});
    EXPECT_EQ(s.game.Health, 30) << "29 + 2 + 2 stops at the maximum";
}

// --- The enemy's answer ------------------------------------------------------------------------------------

TEST(FightEnemyTurn, AMandatoryEnemyBlinksFourTimesShootsAtOneSecondAndHandsTheBoardBack)
{
    Session s(12, kAllOpenWithSound);
    Enter(s, 0, 1);  // the robot: attack 2
    s.Run("set EnemyHitChance 101");
    StartRun(s, "000");
    const int64_t turnEnd = s.AdvanceUntil([&] { return s.game.timers[kAttackTimer].Enabled(); });
    EXPECT_EQ(s.Print("Pointer"), "EnemyTurnCursor");
    EXPECT_FALSE(s.game.InputReady);

    const char* const frame[4] = {"False", "True", "False", "True"};
    for (int blink = 0; blink < 4; ++blink) {
        EXPECT_EQ(s.Print("RequiredFrame(1).Visible"), blink % 2 == 0 ? "True" : "False");
        s.Advance(static_cast<int>(turnEnd + 200 * (blink + 1) - Now(s)));
        EXPECT_EQ(s.Print("RequiredFrame(1).Visible"), frame[blink]) << "blink " << blink + 1;
        EXPECT_EQ(s.Print("Pointer"), "EnemyTurnCursor");
    }
    s.Press(45);  // ignored: the board is locked while the enemy acts
    EXPECT_EQ(s.Print("SelectionMarker.Visible"), "False");
    s.Advance(199);
    EXPECT_EQ(s.game.Health, 30);
    s.Sounds();
    s.Advance(1);  // one second after the turn: the shot
    EXPECT_EQ(s.game.Health, 28);
    EXPECT_EQ(s.Print("Label6.Caption"), "\"28\"");
    EXPECT_TRUE(IsShot(s.Sounds()));
    EXPECT_EQ(s.Print("DamageLabel.Visible"), "True");
    EXPECT_EQ(s.Print("DamageLabel.Caption"), "\"2\"");
    EXPECT_EQ(s.Print("HeroShotFrame.Visible"), "False");
    EXPECT_EQ(s.Print("RequiredFrame(1).Visible"), "True");
    EXPECT_EQ(s.Print("Pointer"), "NormalCursor");
    EXPECT_TRUE(s.game.InputReady);
    EXPECT_FALSE(s.game.timers[kAttackTimer].Enabled());
    s.Advance(899);
    EXPECT_EQ(s.Print("DamageLabel.Visible"), "True");
    s.Advance(1);
    EXPECT_EQ(s.Print("DamageLabel.Visible"), "False");

    // A miss: the miss sound, no number, the board handed back all the same.
    Settle(s);
    s.Run("set EnemyHitChance 0");
    StartRun(s, "000");
    s.AdvanceUntil([&] { return s.game.timers[kAttackTimer].Enabled(); });
    s.Advance(999);
    s.Sounds();
    s.Advance(1);
    EXPECT_EQ(s.Sounds(), std::vector<int>{2});
    EXPECT_EQ(s.game.Health, 28);
    EXPECT_EQ(s.Print("DamageLabel.Visible"), "False");
    EXPECT_EQ(s.Print("Pointer"), "NormalCursor");
    EXPECT_TRUE(s.game.InputReady);
}

TEST(FightEnemyTurn, AnOptionalEnemyBlinksWithoutAFrameAndAStageEndCutsItsShotOff)
{
    Session s(14, kAllOpenWithSound);
    Enter(s, 4, 1);  // "Misja 5", stage 1: a required door and an optional enemy
    s.Run("set EnemyHitChance 0");
    EXPECT_EQ(s.Print("RequiredFrame(1).Visible"), "False");
    StartRun(s, "000");
    const int64_t turnEnd = s.AdvanceUntil([&] { return s.game.timers[kAttackTimer].Enabled(); });
    const char* const frame[5] = {"True", "False", "True", "False", "False"};
    for (int tick = 0; tick < 5; ++tick) {
        s.Advance(static_cast<int>(turnEnd + 200 * (tick + 1) - Now(s)));
        EXPECT_EQ(s.Print("RequiredFrame(1).Visible"), frame[tick]) << "tick " << tick + 1;
    }
    EXPECT_FALSE(s.game.timers[kAttackTimer].Enabled());
    s.Advance(1000);
    EXPECT_EQ(s.Print("RequiredFrame(1).Visible"), "False");

    // The move that opens the door: the enemy's attack starts and the stage end stops it before it fires.
    Settle(s);
    Set(s, {"TerminalWork 1", "EnemyHitChance 101"});
    const int16_t health = s.game.Health;
    Lay(s, RunOfThree("444"));
    s.Sounds();
    Swap(s, 13, 14);
    s.AdvanceUntil([&] { return s.game.screen.StageDoneLabel->visible; });
    EXPECT_FALSE(s.game.timers[kAttackTimer].Enabled());
    EXPECT_EQ(s.Print("Pointer"), "NormalCursor");
    EXPECT_FALSE(s.game.InputReady);
    s.Advance(2000);
    const std::vector<int> sounds = s.Sounds();
    EXPECT_TRUE(Played(sounds, 7));
    EXPECT_FALSE(Played(sounds, 0) || Played(sounds, 1) || Played(sounds, 2)) << "the enemy never fired";
    EXPECT_EQ(s.game.Health, health);
    EXPECT_EQ(s.Print("RequiredFrame(1).Visible"), "False");
}

TEST(FightEnemyTurn, HitDamageSpreadsTwentyPercentAroundTheAttack)
{
    int lowest = 100, highest = 0, always2 = 0, hits = 0;
    for (uint32_t seed = 1; seed <= 30; ++seed) {
        Session s(seed, kAllOpenWithSound);
        s.StartMission(0);
        s.Run("set EnemyHitChance 101");
        for (int attack = 0; attack < 8; ++attack) {
            const bool small = attack % 2 == 0;
            s.Run(small ? "set EnemyAttack 2" : "set EnemyAttack 15");
            s.Run("set Health 1000");
            s.Run("call StartEnemyAttack");
            s.Advance(1000);
            ASSERT_FALSE(s.game.timers[kAttackTimer].Enabled());
            const int damage = 1000 - s.game.Health;
            ASSERT_EQ(s.Print("DamageLabel.Caption"), "\"" + std::to_string(damage) + "\"");
            ++hits;
            if (small) {
                always2 += damage == 2;
                continue;
            }
            lowest = std::min(lowest, damage);
            highest = std::max(highest, damage);
        }
    }
    EXPECT_EQ(always2, hits / 2);
    EXPECT_EQ(lowest, 12);
    EXPECT_EQ(highest, 18);
}

// --- The bomb ----------------------------------------------------------------------------------------------

TEST(FightBomb, TheClockStartsWhenTheBoardHasFilledAndTheBarFollowsTheTicks)
{
    Session s(15, kAllOpenWithSound);
    s.StartMission(2);
    s.Run("call SetUpStage 2 2");  // "Misja 3", stage 2: the bomb, 1500 ticks
    s.Advance(64 * 30 - 1);
    EXPECT_FALSE(s.game.timers[kBombClock].Enabled()) << "nothing counts while the board fills";
    EXPECT_EQ(s.game.BombTicks, 1500);
    s.Advance(1);
    EXPECT_TRUE(s.game.timers[kBombClock].Enabled());
    EXPECT_EQ(s.game.timers[kBombClock].Interval(), 100);
    s.Advance(99);
    EXPECT_EQ(s.game.BombTicks, 1500);
    s.Advance(1);
    EXPECT_EQ(s.game.BombTicks, 1499);
    EXPECT_NEAR(s.game.screen.BombTimeBar->width, 735.0 * 1499 / 1500, 0.001);
    s.Advance(900);
    EXPECT_EQ(s.game.BombTicks, 1490);
    EXPECT_NEAR(s.game.screen.BombTimeBar->width, 735.0 * 1490 / 1500, 0.01);

    // A new stage's board fills with the clock stopped, whatever the last stage left running.
    s.Run("call SetUpStage 2 2");
    s.Advance(64 * 30 - 1);
    EXPECT_EQ(s.game.BombTicks, 1500);
    EXPECT_FALSE(s.game.timers[kBombClock].Enabled());
    s.Advance(1);
    EXPECT_TRUE(s.game.timers[kBombClock].Enabled());
}

TEST(FightBomb, AnExpiredBombFailsTheMissionAndFreezesTheBoardMidSwap)
{
    Session s(16, kAllOpenWithSound);
    Enter(s, 2, 2);
    s.Run("set BombTicks 2");
    Lay(s, RunOfThree("444"));
    s.Sounds();
    Swap(s, 13, 14);
    s.Advance(100);
    EXPECT_EQ(s.game.BombTicks, 1);
    EXPECT_EQ(s.Print("MissionFailedLabel.Visible"), "False");
    s.Advance(100);  // the bomb goes off halfway through the swap
    EXPECT_EQ(s.Print("MissionFailedLabel.Visible"), "True");
    EXPECT_EQ(s.game.timers[kFailureTimer].tag, "10");
    EXPECT_TRUE(s.game.timers[kFailureTimer].Enabled());
    EXPECT_EQ(s.Sounds(), (std::vector<int>{8, 9}));
    for (int timer = 1; timer <= 6; ++timer) EXPECT_FALSE(s.game.timers[timer].Enabled()) << "Timer" << timer;
    EXPECT_EQ(s.game.timers[kBombClock].Interval(), 100);
    EXPECT_FALSE(s.game.InputReady);
    EXPECT_EQ(s.game.Board[13], 3) << "the swap never finished";
    EXPECT_EQ(s.game.BombWork, 20);

    s.Advance(6999);
    EXPECT_EQ(s.Print("MissionMenuScreen.Visible"), "False");
    s.Advance(1);
    EXPECT_EQ(s.Print("MenuLayer.Visible"), "True");
    EXPECT_EQ(s.Print("MissionMenuScreen.Visible"), "True");
    EXPECT_EQ(s.Print("MissionFailedLabel.Visible"), "False");
    EXPECT_FALSE(s.game.timers[kFailureTimer].Enabled());
    s.Advance(10000);
    EXPECT_TRUE(s.Sounds().empty()) << "no second failure";
}

TEST(FightBomb, AShotThatKillsAfterTheBombWentOffStartsNoSecondFailure)
{
    Session s(24, kAllOpenWithSound);
    Enter(s, 4, 2);  // "Misja 5", stage 2: an enemy and a bomb
    Set(s, {"EnemyHitChance 101", "Health 1"});
    StartRun(s, "000");
    const int64_t turnEnd = s.AdvanceUntil([&] { return s.game.timers[kAttackTimer].Enabled(); });
    s.Run("set BombTicks 3");
    s.Sounds();
    const int64_t boom = s.AdvanceUntil([&] { return s.game.timers[kFailureTimer].Enabled(); });
    EXPECT_LT(boom, turnEnd + 1000);
    EXPECT_EQ(s.Sounds(), (std::vector<int>{8, 9}));
    s.Advance(static_cast<int>(turnEnd + 1000 - Now(s)));
    EXPECT_LE(s.game.Health, 0) << "the enemy's shot still lands";
    EXPECT_TRUE(IsShot(s.Sounds())) << "and no second defeat sounds";
    EXPECT_FALSE(s.game.InputReady);
    s.Advance(static_cast<int>(boom + 7000 - 1 - Now(s)));
    EXPECT_EQ(s.Print("MissionMenuScreen.Visible"), "False");
    s.Advance(1);
    EXPECT_EQ(s.Print("MissionMenuScreen.Visible"), "True") << "7 s after the explosion, not after the death";
    s.Advance(10000);
    EXPECT_TRUE(s.Sounds().empty());
}

// --- Death and leaving -------------------------------------------------------------------------------------

TEST(FightEndings, DyingWhileTheBoardRenewsKeepsItLockedUntilTheMissionList)
{
    {
        // First a renewal the hero survives: the attack ends while the board still fills, so the board
        // opens at the fill's end and not before.
        Session s(17, kAllOpenWithSound);
        Enter(s, 0, 1);
        s.Run("set EnemyHitChance 0");
        Lay(s, kDeadBoard, false);
        Swap(s, 11, 12);
        const int64_t turnEnd = s.AdvanceUntil([&] { return s.game.timers[kAttackTimer].Enabled(); });
        EXPECT_EQ(s.game.Health, 20) << "the swap lined up nothing";
        EXPECT_EQ(s.Print("NoMovesLabel.Visible"), "True");
        s.Advance(1000);
        EXPECT_FALSE(s.game.timers[kAttackTimer].Enabled());
        EXPECT_FALSE(s.game.InputReady) << "the new board is still filling";
        s.Advance(static_cast<int>(turnEnd + 64 * 30 - 1 - Now(s)));
        EXPECT_FALSE(s.game.InputReady);
        s.Advance(1);
        EXPECT_TRUE(s.game.InputReady);
    }
    {
        // The enemy's shot kills the hero during the renewal.
        Session s(18, kAllOpenWithSound);
        Enter(s, 0, 1);
        Set(s, {"EnemyHitChance 101", "Health 11"});
        Lay(s, kDeadBoard, false);
        s.Sounds();
        Swap(s, 11, 12);
        const int64_t turnEnd = s.AdvanceUntil([&] { return s.game.timers[kAttackTimer].Enabled(); });
        EXPECT_EQ(s.game.Health, 1);
        s.Advance(1000);
        EXPECT_EQ(s.game.Health, -1);
        EXPECT_EQ(s.Print("MissionFailedLabel.Visible"), "True");
        EXPECT_FALSE(s.game.InputReady);
        s.Advance(static_cast<int>(turnEnd + 64 * 30 - Now(s)));
        EXPECT_FALSE(s.game.timers[kFillTimer].Enabled()) << "the new board has filled";
        EXPECT_FALSE(s.game.InputReady) << "a dead hero gets no board";
        s.Press(45);
        EXPECT_EQ(s.Print("SelectionMarker.Visible"), "False");
        s.Advance(static_cast<int>(turnEnd + 1000 + 7000 - 1 - Now(s)));
        EXPECT_EQ(s.Print("MissionMenuScreen.Visible"), "False");
        s.Advance(1);
        EXPECT_EQ(s.Print("MissionMenuScreen.Visible"), "True");
        const std::vector<int> sounds = s.Sounds();
        EXPECT_EQ(std::count(sounds.begin(), sounds.end(), 8), 1) << "one defeat";
    }
    {
        // On the bomb's stage the penalty itself kills: the failure stops the clock, and the renewal's end
        // neither restarts it nor opens the board.
        Session s(19, kAllOpenWithSound);
        Enter(s, 2, 2);
        s.Run("set Health 17");  // a third of 50 is 17
        Lay(s, kDeadBoard, false);
        s.Sounds();
        Swap(s, 11, 12);
        const int64_t death = s.AdvanceUntil([&] { return s.game.timers[kFailureTimer].Enabled(); });
        EXPECT_EQ(s.game.Health, 0);
        EXPECT_FALSE(s.game.timers[kBombClock].Enabled());
        EXPECT_EQ(s.Sounds(), (std::vector<int>{11, 8}));
        const int16_t ticks = s.game.BombTicks;
        s.Advance(64 * 30);
        EXPECT_FALSE(s.game.timers[kFillTimer].Enabled());
        EXPECT_FALSE(s.game.InputReady);
        EXPECT_FALSE(s.game.timers[kBombClock].Enabled()) << "a new board under the failure starts no clock";
        s.Advance(1000);
        EXPECT_EQ(s.game.BombTicks, ticks);
        s.Advance(static_cast<int>(death + 7000 - Now(s)));
        EXPECT_EQ(s.Print("MissionMenuScreen.Visible"), "True");
        s.Advance(10000);
        EXPECT_TRUE(s.Sounds().empty());
    }
}

TEST(FightEndings, AHeroWhoDiesHasLostEvenWhenNoMandatoryGoalIsLeft)
{
    // The door was opened on a turn whose board then renewed, so its stage was not closed yet; the next
    // move lines up nothing and the penalty kills.
    Session s(23, kAllOpenWithSound);
    Enter(s, 0, 0);
    Set(s, {"TerminalPresent False", "TerminalRequired False", "Health 10"});
    Lay(s, Board({}));
    s.Sounds();
    Swap(s, 11, 12);
    const int64_t death = s.AdvanceUntil([&] { return s.game.timers[kFailureTimer].Enabled(); });
    EXPECT_FALSE(s.game.timers[kStageDonePause].Enabled());
    EXPECT_EQ(s.Print("StageDoneLabel.Visible"), "False");
    EXPECT_EQ(s.Sounds(), (std::vector<int>{11, 8}));
    s.Advance(static_cast<int>(death + 7000 - Now(s)));
    EXPECT_EQ(s.Print("MissionMenuScreen.Visible"), "True");
    EXPECT_EQ(s.game.MissionStage, 0);
    EXPECT_FALSE(s.game.timers[kFillTimer].Enabled()) << "no next stage is set up";
}

// Back on the main menu, and nothing of the mission left behind carries on under it.
void ExpectLeftForGood(Session& s, int16_t stage, int16_t health)
{
    EXPECT_EQ(s.Print("MenuLayer.Visible"), "True");
    EXPECT_EQ(s.Print("MainMenuScreen.Visible"), "True");
    EXPECT_EQ(s.Print("StageDoneLabel.Visible"), "False");
    EXPECT_EQ(s.Print("MissionFailedLabel.Visible"), "False");
    EXPECT_EQ(s.Print("Pointer"), "NormalCursor");
    s.Sounds();
    s.Advance(10000);
    EXPECT_EQ(s.Print("MainMenuScreen.Visible"), "True");
    EXPECT_EQ(s.Print("MissionMenuScreen.Visible"), "False");
    EXPECT_EQ(s.Print("MissionCompleteScreen.Visible"), "False");
    EXPECT_EQ(s.game.MissionStage, stage);
    EXPECT_EQ(s.game.Health, health);
    for (int timer : {1, 2, 3, 4, 6, 7, 9, 11}) EXPECT_FALSE(s.game.timers[timer].Enabled()) << "Timer" << timer;
    EXPECT_TRUE(s.Sounds().empty());
}

TEST(FightEndings, KeyTLeavesDuringTheStagePauseTheFailureOrTheEnemyTurn)
{
    {
        Session s(20, kAllOpenWithSound);
        Enter(s, 0, 0);
        s.Run("set TerminalWork 1");
        StartRun(s, "444");
        s.AdvanceUntil([&] { return s.game.screen.StageDoneLabel->visible; });
        s.Advance(1000);
        s.Key(84);
        ExpectLeftForGood(s, 0, 30);
    }
    {
        Session s(21, kAllOpenWithSound);
        Enter(s, 1, 0);
        s.Run("set Health 1");
        Lay(s, Board({}));  // swapping 11 and 12 lines nothing up
        Swap(s, 11, 12);
        s.AdvanceUntil([&] { return s.game.timers[kFailureTimer].Enabled(); });
        s.Advance(1000);
        s.Key(84);
        ExpectLeftForGood(s, 0, -12);
    }
    {
        Session s(22, kAllOpenWithSound);
        Enter(s, 1, 0);
        s.Run("set EnemyHitChance 101");
        StartRun(s, "000");
        s.AdvanceUntil([&] { return s.game.timers[kAttackTimer].Enabled(); });
        s.Advance(500);
        s.Key(84);
        ExpectLeftForGood(s, 0, 40);

        // The next mission starts clean: the half-blinked frame is back and the board opens after its fill.
        s.StartMission(1);
        EXPECT_EQ(s.Print("RequiredFrame(1).Visible"), "True");
        EXPECT_TRUE(s.game.InputReady);
    }
}

}  // namespace
}  // namespace kr
