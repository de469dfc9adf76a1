// The self-playing player the benchmarks and the soak rely on: it reads the stage's needs, and it can win.
#include <gtest/gtest.h>

#include "shell/startup.h"
#include "tests/fight_helpers.h"
#include "tests/session.h"
#include "tools/autoplay.h"
#include "ui/headless.h"

namespace kr {
namespace {

using namespace testing;

TEST(Autoplay, PrefersWhatTheStageNeedsAndForeseesTheIconsThatFall)
{
    Session s(5, kAllOpenWithSound);
    Enter(s, 1, 0);  // a required enemy
    // Swapping 13 and 14 lines up grey bullets; swapping 23 and 24 lines up brown ones.
    Lay(s, Board({"00300...", "11311..."}));
    const std::optional<SwapChoice> best = BestSwap(s.game);
    ASSERT_TRUE(best);
    EXPECT_TRUE(s.game.Board[static_cast<size_t>(best->from)] == 1 || s.game.Board[static_cast<size_t>(best->to)] == 1)
        << best->from << " " << best->to;

    // Clearing row 3 drops the two bullets of column 1 onto a third: two runs from one move.
    Lay(s, Board({"1.......", "1.......", "55353...", "1......."}));
    BoardCells board = s.game.Board;
    std::swap(board[33], board[34]);
    const MoveYield yield = Foresee(s.game, board, s.game.GreenFlag);
    EXPECT_EQ(yield.healing, 2);
    EXPECT_EQ(yield.damage, 2);
    EXPECT_EQ(yield.cells, 6);
}

TEST(Autoplay, WinsTheFirstMissionsAndSaysHowAGameWasLost)
{
    for (uint32_t seed = 1; seed <= 3; ++seed) {
        TempFolder folder;
        ui::ScriptedMessages messages;
        ui::RecordedSound sound;
        Game g{Host{messages, sound}, folder.File("config.cfg")};
        StartUp(g, seed);
        g.UnlockedMissions = 2;
        const MissionResult result = PlayMission(g, 1);
        EXPECT_EQ(result.ending, Ending::Won) << "seed " << seed;
        EXPECT_GT(result.skills, 0) << "seed " << seed;
    }
    // A fresh hero against the last mission's enemies is shot down; a mission not yet open is not played.
    TempFolder folder;
    ui::ScriptedMessages messages;
    ui::RecordedSound sound;
    Game g{Host{messages, sound}, folder.File("config.cfg")};
    StartUp(g, 1);
    g.UnlockedMissions = 1;
    EXPECT_EQ(PlayMission(g, 9).milliseconds, 0);
    g.UnlockedMissions = 10;
    g.screen.MissionMenuScreen->visible = false;
    g.screen.MainMenuScreen->visible = true;
    EXPECT_EQ(PlayMission(g, 9).ending, Ending::EnemyFire);
}

}  // namespace
}  // namespace kr
