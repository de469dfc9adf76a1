#include <gtest/gtest.h>

#include "shell/timer_numbers.h"
#include "tests/session.h"
#include "tools/soak.h"
#include "tools/soak_invariants.h"

namespace kr {
namespace {

using soak::Invariants;

std::string Broken(Invariants& rules, const Game& g) { return rules.Check(g).value_or("kept"); }

// Each rule the soak watches, broken on purpose in a game that keeps them all.
TEST(SoakRules, EachBrokenRuleIsNamed)
{
    testing::Session s;
    s.StartMission(0);
    Game& g = s.game;
    Invariants rules;
    ASSERT_EQ(Broken(rules, g), "kept");

    g.Board[9] = 3;
    EXPECT_EQ(Broken(rules, g), "cell 9 of the border ring holds 3");
    g.Board[9] = BORDER;
    g.GreenFlag[45] = true;
    g.Board[45] = 2;
    EXPECT_EQ(Broken(rules, g), "cell 45 has a green flag on 2");
    g.GreenFlag[45] = false;
    g.Board[45] = CLEARED;
    EXPECT_EQ(Broken(rules, g), "cell 45 is still cleared while the board takes input");
    g.InputReady = false;
    EXPECT_EQ(Broken(rules, g), "kept") << "cells are cleared in the middle of a turn";
    g.Board[45] = 2;
    g.InputReady = true;
    g.Resources[3] = 7;
    EXPECT_EQ(Broken(rules, g), "resource 3 is 7");
    g.Resources[3] = 6;
    ASSERT_EQ(Broken(rules, g), "kept");

    // The failure may not start over itself, nor run beside the stage-done pause.
    g.timers[kFailureTimer].tag = "5";
    g.timers[kFailureTimer].SetEnabled(true);
    EXPECT_EQ(Broken(rules, g), "kept");
    g.timers[kFailureTimer].tag = "10";
    EXPECT_EQ(Broken(rules, g), "the failure sequence started again while it ran (step 5 -> 10)");
    g.timers[kStageDonePause].SetEnabled(true);
    EXPECT_EQ(Broken(rules, g), "the stage-done pause and the failure run together");
    g.timers[kStageDonePause].SetEnabled(false);
    g.timers[kFailureTimer].SetEnabled(false);

    // Input that never comes back.
    g.InputReady = false;
    g.timers.Advance(30'000);
    EXPECT_EQ(Broken(rules, g), "kept");
    g.timers.Advance(1);
    EXPECT_EQ(Broken(rules, g), "no input and no menu for 30001 ms");
}

// A short soak keeps every rule and replays to the state it ended in; the same seed plays the same game.
TEST(SoakRules, AShortSoakKeepsTheRulesAndReplays)
{
    testing::TempFolder folder;
    const soak::Outcome first = soak::SoakGame(11, 600, folder.path());
    EXPECT_FALSE(first.failure) << *first.failure;
    EXPECT_GE(first.tally.inputs, 600u);
    EXPECT_GT(first.tally.missionsStarted, 0u);
    const soak::Outcome again = soak::SoakGame(11, 600, folder.path());
    EXPECT_EQ(again.script, first.script);
}

}  // namespace
}  // namespace kr
