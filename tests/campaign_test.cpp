// The campaign around the fights: stages in their panels, the pause between them, the won mission, the
// level-up and what reaches config.cfg.
#include <gtest/gtest.h>

#include <functional>
#include <string>

#include "board/resolve.h"
#include "shell/timer_numbers.h"
#include "tests/session.h"

namespace kr {
namespace {

namespace fs = std::filesystem;
using testing::ReadFile;
using testing::Session;

// The progress file's text: unlocked missions, sound, MOC, INTELIGENCJA, ZRĘCZNOŚĆ, WYTRZYMAŁOŚĆ, CELNOŚĆ,
// tutorial.
std::string Progress(std::initializer_list<int> values)
{
    std::string text;
    for (int value : values) text += " " + std::to_string(value) + " \r\n";
    return text;
}

// Row 1 reads k k 3 k over a quiet pattern: swapping cells 13 and 14 lines up three icons of kind k.
std::string RunOfThree(char k)
{
    return std::string{k, k, '3', k} + "2302\n23023023\n30230230\n02302302\n23023023\n30230230\n02302302\n55053023\n";
}

// One real move that lines up three icons of kind k.
void PlayRun(Session& s, char kind)
{
    s.SetBoard(RunOfThree(kind));
    ASSERT_TRUE(FindRuns(s.game.Board, s.game.GreenFlag).empty());
    s.Press(13);
    s.Press(14);
}

// Plays mission m from the mission menu: its last stage is reached as the stage-done pause would reach it,
// and its goal is finished by a real move. Ends on the mission-complete screen.
void WinMission(Session& s, int m, int lastStage)
{
    s.Click("\"Misja " + std::to_string(m + 1) + "\"");
    s.Click("\"Rozpocznij misję ->\"");
    s.Advance(64 * 30);
    s.Run("set MissionStage " + std::to_string(lastStage));
    s.Run("call SetUpStage " + std::to_string(m) + " " + std::to_string(lastStage));
    s.Advance(64 * 30);
    ASSERT_TRUE(s.game.InputReady);
    s.Run("set EnemyHitChance 0\nset EnemyHealth 1\nset TerminalWork 1\nset BombWork 1");
    PlayRun(s, s.game.EnemyRequired ? '1' : '4');
    s.AdvanceUntil([&] { return s.game.screen.MissionCompleteScreen->visible; });
}

std::string Shown(Session& s, const std::string& control) { return s.Print(control + ".Visible"); }

// --- A whole mission ---------------------------------------------------------------------------------------

TEST(CampaignMission1, ANewPlayerWinsMission1AndSpendsTheFirstPoint)
{
    Session s(31, "");  // no progress file yet
    const fs::path config = s.folder().File("config.cfg");
    EXPECT_EQ(s.game.UnlockedMissions, 1);
    s.Click("\"Gra\"");
    s.Click("\"Misja 1\"");
    s.Click("\"Rozpocznij misję ->\"");
    s.Advance(64 * 30);
    ASSERT_TRUE(s.game.InputReady);
    EXPECT_EQ(Shown(s, "GoalPanel(2)"), "True");
    EXPECT_EQ(Shown(s, "GoalPanel(1)"), "False");

    // The door: opened by a real move, then "Zadanie wykonane!" blinks ten times 700 ms apart.
    s.Run("set TerminalWork 1");
    PlayRun(s, '4');
    const int64_t done = s.AdvanceUntil([&] { return s.game.screen.StageDoneLabel->visible; });
    EXPECT_EQ(s.game.timers[kStageDonePause].tag, "10");
    EXPECT_EQ(s.game.timers[kStageDonePause].Interval(), 700);
    EXPECT_EQ(s.Print("DoneFrame(2).Visible"), "True");
    EXPECT_FALSE(s.game.InputReady);
    for (int tick = 1; tick <= 9; ++tick) {
        s.Advance(static_cast<int>(done + 700 * tick - 1 - s.game.timers.Now()));
        EXPECT_EQ(Shown(s, "StageDoneLabel"), tick % 2 == 1 ? "True" : "False") << "before tick " << tick;
        s.Advance(1);
        EXPECT_EQ(Shown(s, "StageDoneLabel"), tick % 2 == 1 ? "False" : "True") << "after tick " << tick;
        EXPECT_EQ(s.game.MissionStage, 0);
    }
    s.Advance(699);
    EXPECT_EQ(s.game.MissionStage, 0);
    s.Advance(1);
    EXPECT_EQ(s.game.MissionStage, 1);
    EXPECT_EQ(Shown(s, "StageDoneLabel"), "False");
    EXPECT_FALSE(s.game.timers[kStageDonePause].Enabled());
    EXPECT_EQ(Shown(s, "GoalPanel(2)"), "False");
    EXPECT_EQ(Shown(s, "GoalPanel(1)"), "True");
    EXPECT_EQ(s.Print("GoalPanel(1).Top"), "0");
    EXPECT_EQ(s.Print("Image9.Picture"), "portrait 0");
    EXPECT_EQ(Shown(s, "RequiredFrame(1)"), "True");
    EXPECT_EQ(s.game.EnemyHealth, 25);
    EXPECT_FALSE(fs::exists(config)) << "nothing is saved between stages";

    // The robot, beaten by a real move; 7 s later the mission is won.
    s.Advance(64 * 30);
    ASSERT_TRUE(s.game.InputReady);
    s.Run("set EnemyHealth 1");
    PlayRun(s, '1');
    const int64_t beaten = s.AdvanceUntil([&] { return s.game.screen.StageDoneLabel->visible; });
    s.Advance(6999);
    EXPECT_EQ(Shown(s, "MissionCompleteScreen"), "False");
    s.Advance(1);
    EXPECT_EQ(s.game.timers.Now(), beaten + 7000);
    EXPECT_EQ(Shown(s, "MenuLayer"), "True");
    EXPECT_EQ(Shown(s, "MissionCompleteScreen"), "True");
    EXPECT_EQ(Shown(s, "Label15"), "True");
    EXPECT_EQ(s.Print("Label15.Caption"), "\"MISJA UKOŃCZONA!\"");
    EXPECT_EQ(s.Print("Command9.Tag"), "\"0\"");
    EXPECT_FALSE(fs::exists(config));

    // "Wymiatam!" opens "Misja 2" and saves at once; then the level-up screen offers all five rows.
    s.Click("\"Wymiatam!\"");
    EXPECT_EQ(ReadFile(config), Progress({2, 0, 0, 0, 0, 0, 0, 0}));
    EXPECT_FALSE(fs::exists(s.folder().File("config.cfg.tmp")));
    EXPECT_EQ(Shown(s, "MissionCompleteScreen"), "False");
    EXPECT_EQ(Shown(s, "LevelUpScreen"), "True");
    for (int r = 0; r < 5; ++r) EXPECT_EQ(Shown(s, "Label10(" + std::to_string(r) + ")"), "True") << r;
    for (int k = 0; k < 10; ++k) EXPECT_EQ(Shown(s, "Shape10(" + std::to_string(k) + ")"), "False") << k;
    EXPECT_EQ(Shown(s, "Command7"), "False");
    EXPECT_EQ(Shown(s, "Label11"), "True");
    EXPECT_EQ(s.Print("Label11.Caption"), "\"\"");

    s.Click("Label10(0)");  // "+" on MOC
    EXPECT_EQ(s.game.Strength, 1);
    EXPECT_EQ(Shown(s, "Shape10(0)"), "True");
    EXPECT_EQ(Shown(s, "Shape10(1)"), "False");
    for (int r = 0; r < 5; ++r) EXPECT_EQ(Shown(s, "Label10(" + std::to_string(r) + ")"), "False") << r;
    EXPECT_EQ(Shown(s, "Label11"), "False");
    EXPECT_EQ(Shown(s, "Command7"), "True");
    EXPECT_EQ(ReadFile(config), Progress({2, 0, 0, 0, 0, 0, 0, 0})) << "the point is saved by OK";

    s.Click("\"OK\"");
    EXPECT_EQ(ReadFile(config), Progress({2, 0, 1, 0, 0, 0, 0, 0}));
    EXPECT_EQ(Shown(s, "LevelUpScreen"), "False");
    EXPECT_EQ(Shown(s, "MissionMenuScreen"), "True");
    EXPECT_EQ(s.Print("Command4(1).Enabled"), "True");
    EXPECT_EQ(s.Print("Command4(2).Enabled"), "False");

    // The new mission opens with the second skill.
    s.Click("\"Misja 2\"");
    s.Click("\"Rozpocznij misję ->\"");
    EXPECT_EQ(s.game.MaxHealth, 40);
    EXPECT_EQ(Shown(s, "SkillFrames(1)"), "True");
    EXPECT_EQ(Shown(s, "SkillFrames(2)"), "False");
}

// --- Level-ups ---------------------------------------------------------------------------------------------

TEST(CampaignLevelUp, WinningAnOlderMissionAgainUnlocksAndSavesNothing)
{
    const std::string saved = Progress({5, 1, 1, 1, 1, 1, 0, 1});  // four points spent
    Session s(32, saved);
    s.Click("\"Gra\"");
    WinMission(s, 0, 1);
    s.Click("\"Wymiatam!\"");
    EXPECT_EQ(Shown(s, "LevelUpScreen"), "False");
    EXPECT_EQ(Shown(s, "MissionMenuScreen"), "True");
    EXPECT_EQ(s.game.UnlockedMissions, 5);
    EXPECT_EQ(s.Print("Command4(4).Enabled"), "True");
    EXPECT_EQ(s.Print("Command4(5).Enabled"), "False");
    EXPECT_EQ(ReadFile(s.folder().File("config.cfg")), saved);
}

TEST(CampaignLevelUp, PipsShowThePointsAndNoPlusIsOfferedFromTwoUp)
{
    {
        Session s(33, Progress({2, 0, 1, 0, 0, 0, 0, 0}));  // MOC 1, one point spent of one
        s.Click("\"Gra\"");
        WinMission(s, 1, 2);
        s.Click("\"Wymiatam!\"");
        EXPECT_EQ(s.game.UnlockedMissions, 3);
        EXPECT_EQ(Shown(s, "LevelUpScreen"), "True");
        EXPECT_EQ(Shown(s, "Shape10(0)"), "True");
        EXPECT_EQ(Shown(s, "Shape10(1)"), "False");
        EXPECT_EQ(Shown(s, "Label10(0)"), "True");
        s.Click("Label10(0)");
        EXPECT_EQ(s.game.Strength, 2);
        EXPECT_EQ(Shown(s, "Shape10(1)"), "True");
        s.Click("\"OK\"");

        // At the next level-up MOC is full: two pips and no "+"; the other rows still offer one.
        WinMission(s, 2, 2);
        s.Click("\"Wymiatam!\"");
        EXPECT_EQ(Shown(s, "LevelUpScreen"), "True");
        EXPECT_EQ(Shown(s, "Label10(0)"), "False");
        EXPECT_EQ(Shown(s, "Shape10(0)"), "True");
        EXPECT_EQ(Shown(s, "Shape10(1)"), "True");
        for (int r = 1; r < 5; ++r) EXPECT_EQ(Shown(s, "Label10(" + std::to_string(r) + ")"), "True") << r;
        s.Click("Label10(2)");  // CELNOŚĆ
        s.Click("\"OK\"");
        EXPECT_EQ(ReadFile(s.folder().File("config.cfg")), Progress({4, 0, 2, 0, 0, 0, 1, 0}));
    }
    {
        // A hand-edited CELNOŚĆ of 3 shows both pips and never gets a "+".
        Session s(34, Progress({5, 0, 0, 0, 0, 0, 3, 0}));
        EXPECT_EQ(s.game.Accuracy, 3);
        s.Click("\"Gra\"");
        WinMission(s, 0, 1);
        s.Click("\"Wymiatam!\"");
        EXPECT_EQ(Shown(s, "LevelUpScreen"), "True");
        EXPECT_EQ(Shown(s, "Label10(2)"), "False");
        EXPECT_EQ(Shown(s, "Shape10(4)"), "True");
        EXPECT_EQ(Shown(s, "Shape10(5)"), "True");
        for (int r : {0, 1, 3, 4}) EXPECT_EQ(Shown(s, "Label10(" + std::to_string(r) + ")"), "True") << r;
    }
}

TEST(CampaignFailure, ALostMissionChangesNoSavedValue)
{
    const std::string saved = Progress({3, 1, 1, 0, 2, 0, 0, 1});
    Session s(35, saved);
    s.Click("\"Gra\"");
    s.Click("\"Misja 3\"");
    s.Click("\"Rozpocznij misję ->\"");
    s.Advance(64 * 30);
    s.Run("set Health 1");
    s.SetBoard(RunOfThree('0').replace(0, 4, "0230"));  // swapping 13 and 14 lines nothing up
    s.Press(13);
    s.Press(14);
    s.AdvanceUntil([&] { return s.game.screen.MissionMenuScreen->visible; });
    EXPECT_EQ(ReadFile(s.folder().File("config.cfg")), saved);
    EXPECT_FALSE(fs::exists(s.folder().File("config.cfg.tmp")));
    EXPECT_EQ(s.game.UnlockedMissions, 3);
    EXPECT_EQ(s.game.Strength, 1);
    EXPECT_EQ(s.game.Dexterity, 2);
    s.Click("\"Misja 3\"");
    EXPECT_EQ(Shown(s, "BriefingScreen"), "True") << "the mission can be chosen again";
}

TEST(CampaignStageEnd, ADoorOpenedOnATurnThatLeavesNoMoveClosesTheStageOnTheNextTurn)
{
    // Swapping 13 and 14 is the only move here (three wrenches in row 1); about a third of the refills
    // leave the board without a move.
    const std::string nearlyDead = "44142231\n31304553\n02403211\n22532002\n44521153\n30340131\n24235025\n01042534\n";
    for (uint32_t seed = 40; seed < 100; ++seed) {
        Session s(seed);
        s.StartMission(0);
        s.Run("set TerminalWork 1");
        s.SetBoard(nearlyDead);
        s.Press(13);
        s.Press(14);
        s.AdvanceUntil([&] { return s.game.screen.NoMovesLabel->visible || s.game.screen.StageDoneLabel->visible; });
        if (!s.game.screen.NoMovesLabel->visible) continue;  // this refill left a move: try another seed

        EXPECT_FALSE(s.game.TerminalRequired);
        EXPECT_EQ(Shown(s, "DoneFrame(2)"), "True");
        EXPECT_EQ(Shown(s, "StageDoneLabel"), "False") << "the renewal replaces the goal check";
        EXPECT_FALSE(s.game.timers[kStageDonePause].Enabled());
        s.Advance(64 * 30);
        ASSERT_TRUE(s.game.InputReady);
        EXPECT_FALSE(s.game.timers[kStageDonePause].Enabled());
        PlayRun(s, '0');
        s.AdvanceUntil([&] { return s.game.screen.StageDoneLabel->visible; });
        s.Advance(7000);
        EXPECT_EQ(s.game.MissionStage, 1);
        return;
    }
    FAIL() << "no seed renewed the board";
}

// --- Every stage's panels ----------------------------------------------------------------------------------

struct StageRow {
    int mission, stage;
    int bombTop, enemyTop, terminalTop;  // -1: panel hidden
    bool bombFramed, enemyFramed, terminalFramed;
    const char* bombPicture;  // what the panels show; "" where the panel is hidden
    const char* enemyPicture;
    const char* terminalPicture;
    int bombWork, bombTicks, enemyHealth, enemyAttack, enemyHitChance, terminalWork;  // of the goals set
};

// Played in this order, so the pictures "Misja 9" leaves alone are those the earlier missions put last.
constexpr StageRow kStages[] = {
    {0, 0, -1, -1, 0, false, false, true, "", "", "object 1", 0, 0, 0, 0, 0, 20},
    {0, 1, -1, 0, -1, false, true, false, "", "portrait 0", "", 0, 0, 25, 2, 25, 0},
    {1, 0, -1, 0, -1, false, true, false, "", "portrait 1", "", 0, 0, 40, 3, 35, 0},
    {1, 1, -1, 0, -1, false, true, false, "", "portrait 1", "", 0, 0, 45, 3, 35, 0},
    {1, 2, -1, 0, -1, false, true, false, "", "portrait 1", "", 0, 0, 45, 4, 35, 0},
    {2, 0, -1, 0, -1, false, true, false, "", "portrait 1", "", 0, 0, 45, 3, 40, 0},
    {2, 1, -1, 0, -1, false, true, false, "", "portrait 1", "", 0, 0, 50, 4, 40, 0},
    {2, 2, 0, -1, -1, true, false, false, "object 0", "", "", 20, 1500, 0, 0, 0, 0},
    {3, 0, -1, -1, 0, false, false, true, "", "", "object 1", 0, 0, 0, 0, 0, 35},
    {3, 1, -1, 0, -1, false, true, false, "", "portrait 1", "", 0, 0, 55, 4, 45, 0},
    {3, 2, -1, 2220, 0, false, false, true, "", "portrait 3", "object 1", 0, 0, 200, 5, 50, 25},
    {4, 0, -1, -1, 0, false, false, true, "", "", "object 1", 0, 0, 0, 0, 0, 25},
    {4, 1, -1, 2220, 0, false, false, true, "", "portrait 3", "object 0", 0, 0, 100, 5, 50, 33},
    {4, 2, 2220, 0, -1, false, true, false, "object 0", "portrait 1", "", 100, 1800, 60, 5, 45, 0},
    {5, 0, -1, 0, 2220, false, true, true, "", "portrait 1", "object 1", 0, 0, 70, 6, 50, 25},
    {5, 1, -1, 0, -1, false, true, false, "", "portrait 3", "", 0, 0, 70, 7, 55, 0},
    {5, 2, -1, 0, -1, false, true, false, "", "portrait 2", "", 0, 0, 110, 10, 25, 0},
    {6, 0, -1, 0, -1, false, true, false, "", "portrait 1", "", 0, 0, 75, 7, 55, 0},
    {6, 1, -1, 0, -1, false, true, false, "", "portrait 3", "", 0, 0, 80, 8, 55, 0},
    {6, 2, -1, 0, -1, false, true, false, "", "portrait 4", "", 0, 0, 130, 12, 35, 0},
    {7, 0, -1, 0, -1, false, true, false, "", "portrait 5", "", 0, 0, 100, 10, 50, 0},
    {7, 1, -1, 0, -1, false, true, false, "", "portrait 5", "", 0, 0, 101, 10, 51, 0},
    {7, 2, -1, 0, -1, false, true, false, "", "portrait 5", "", 0, 0, 95, 12, 40, 0},
    {8, 0, 2220, -1, 0, false, false, true, "object 0", "", "object 1", 100, 900, 0, 0, 0, 30},
    {8, 1, -1, 0, -1, false, true, false, "", "portrait 6", "", 0, 0, 110, 11, 55, 0},
    {8, 2, -1, 2220, 0, false, false, true, "", "portrait 6", "object 1", 0, 0, 220, 13, 55, 40},
    {9, 0, -1, 0, -1, false, true, false, "", "portrait 5", "", 0, 0, 110, 12, 55, 0},
    {9, 1, -1, 0, -1, false, true, false, "", "portrait 6", "", 0, 0, 120, 12, 60, 0},
    {9, 2, -1, 0, 2220, false, true, true, "", "portrait 6", "object 1", 0, 0, 125, 13, 55, 40},
    {9, 3, -1, 0, -1, false, true, false, "", "portrait 7", "", 0, 0, 250, 15, 50, 0},
};

// Leaves the panels as a fight would: bars spent, frames swapped, flags and counters used.
void Scuff(Session& s)
{
    Game& g = s.game;
    for (ui::Control* bar : {g.screen.BombWorkBar, g.screen.BombTimeBar, g.screen.EnemyHealthBar, g.screen.TerminalWorkBar})
        bar->width = 1;
    for (size_t panel = 0; panel < 3; ++panel) {
        g.screen.GoalPanel[panel]->visible = true;
        g.screen.DoneFrame[panel]->visible = true;
        g.screen.RequiredFrame[panel]->visible = true;
    }
    g.Health = 3;
    g.Resources.fill(5);
    g.SwapUnmatched = true;
    g.ImmobilisedTurns = 2;
    g.InputReady = true;
    g.BombPresent = g.EnemyPresent = g.TerminalPresent = true;
    g.BombRequired = g.EnemyRequired = g.TerminalRequired = true;
}

TEST(CampaignStages, EveryStagePlacesItsPanelsMandatoryFirst)
{
    Session s(36, Progress({3, 0, 0, 0, 0, 0, 0, 0}));
    s.StartMission(0);
    const char* const panels[3] = {"GoalPanel(0)", "GoalPanel(1)", "GoalPanel(2)"};
    for (const StageRow& row : kStages) {
        SCOPED_TRACE("mission " + std::to_string(row.mission) + " stage " + std::to_string(row.stage));
        Scuff(s);
        s.Run("call SetUpStage " + std::to_string(row.mission) + " " + std::to_string(row.stage));
        const int tops[3] = {row.bombTop, row.enemyTop, row.terminalTop};
        const bool framed[3] = {row.bombFramed, row.enemyFramed, row.terminalFramed};
        const char* const pictures[3] = {row.bombPicture, row.enemyPicture, row.terminalPicture};
        const char* const images[3] = {"Image8", "Image9", "Image10"};
        for (int p = 0; p < 3; ++p) {
            const std::string k = std::to_string(p);
            EXPECT_EQ(Shown(s, panels[p]), tops[p] >= 0 ? "True" : "False") << panels[p];
            if (tops[p] >= 0) {
                EXPECT_EQ(s.Print(std::string(panels[p]) + ".Top"), std::to_string(tops[p])) << panels[p];
                EXPECT_EQ(s.Print(std::string(panels[p]) + ".Left"), "6840") << panels[p];
                EXPECT_EQ(s.Print(std::string(images[p]) + ".Picture"), pictures[p]) << panels[p];
            }
            EXPECT_EQ(Shown(s, "RequiredFrame(" + k + ")"), framed[p] ? "True" : "False") << panels[p];
            EXPECT_EQ(Shown(s, "DoneFrame(" + k + ")"), "False") << panels[p];
        }
        EXPECT_EQ(s.Print("BombWorkBar.Width"), "735");
        EXPECT_EQ(s.Print("BombTimeBar.Width"), "735");
        EXPECT_EQ(s.Print("EnemyHealthBar.Width"), "1455");
        EXPECT_EQ(s.Print("TerminalWorkBar.Width"), "1455");
        const Game& g = s.game;
        EXPECT_EQ(g.BombPresent, row.bombTop >= 0);
        EXPECT_EQ(g.EnemyPresent, row.enemyTop >= 0);
        EXPECT_EQ(g.TerminalPresent, row.terminalTop >= 0);
        EXPECT_EQ(g.BombRequired, row.bombFramed);
        EXPECT_EQ(g.EnemyRequired, row.enemyFramed);
        EXPECT_EQ(g.TerminalRequired, row.terminalFramed);
        if (row.bombTop >= 0) {
            EXPECT_EQ(g.BombWork, row.bombWork);
            EXPECT_EQ(g.BombTicks, row.bombTicks);
        }
        if (row.enemyTop >= 0) {
            EXPECT_EQ(g.EnemyHealth, row.enemyHealth);
            EXPECT_EQ(g.EnemyAttack, row.enemyAttack);
            EXPECT_EQ(g.EnemyHitChance, row.enemyHitChance);
        }
        if (row.terminalTop >= 0) {
            EXPECT_EQ(g.TerminalWork, row.terminalWork);
        }
        EXPECT_EQ(g.Health, g.MaxHealth);
        EXPECT_EQ(g.Resources, (std::array<int16_t, 6>{}));
        EXPECT_FALSE(g.SwapUnmatched);
        EXPECT_EQ(g.ImmobilisedTurns, 0);
        EXPECT_FALSE(g.InputReady);
        EXPECT_EQ(Shown(s, "MenuLayer"), "False");
        for (int k = 0; k < 7; ++k)
            EXPECT_EQ(Shown(s, "SkillFrames(" + std::to_string(k) + ")"), k < 3 ? "True" : "False") << k;
    }

    // "Misja 9" keeps whatever the door's panel showed last, even the bomb drawn on "Misja 5"'s door.
    s.Run("call SetUpStage 4 1");
    s.Run("call SetUpStage 8 0");
    EXPECT_EQ(s.Print("Image10.Picture"), "object 0");
    s.Run("call SetUpStage 3 0");
    EXPECT_EQ(s.Print("Image10.Picture"), "object 1");

    // One past the last stage: health refilled, panels hidden, the mission-complete screen instead.
    const int stageCounts[10] = {2, 3, 3, 3, 3, 3, 3, 3, 3, 4};
    for (int m = 0; m < 10; ++m) {
        SCOPED_TRACE("mission " + std::to_string(m));
        Scuff(s);
        s.game.screen.MissionCompleteScreen->visible = false;
        s.game.screen.MenuLayer->visible = false;
        s.game.timers[kFillTimer].SetEnabled(false);
        s.Run("call SetUpStage " + std::to_string(m) + " " + std::to_string(stageCounts[m]));
        EXPECT_EQ(Shown(s, "MissionCompleteScreen"), "True");
        EXPECT_EQ(Shown(s, "MenuLayer"), "True");
        EXPECT_EQ(s.Print("Command9.Tag"), "\"" + std::to_string(m) + "\"");
        EXPECT_EQ(s.game.Health, s.game.MaxHealth);
        for (const char* panel : panels) EXPECT_EQ(Shown(s, panel), "False") << panel;
        EXPECT_FALSE(s.game.BombPresent || s.game.EnemyPresent || s.game.TerminalPresent);
        EXPECT_FALSE(s.game.timers[kFillTimer].Enabled()) << "no board for a won mission";
    }
}

}  // namespace
}  // namespace kr
