#include <gtest/gtest.h>

#include <set>

#include "board/grid.h"
#include "board/moves.h"
#include "board/resolve.h"
#include "shell/timer_numbers.h"
#include "tests/session.h"

namespace kr {
namespace {

using testing::Session;

bool HasRunOfThree(const BoardCells& board)
{
    for (int cell = 11; cell <= 88; ++cell) {
        const int16_t kind = board[static_cast<size_t>(cell)];
        if (!IsGem(kind)) continue;
        if (board[static_cast<size_t>(cell + 1)] == kind && board[static_cast<size_t>(cell + 2)] == kind) return true;
        if (cell + 20 < 100 && board[static_cast<size_t>(cell + 10)] == kind &&
            board[static_cast<size_t>(cell + 20)] == kind)
            return true;
    }
    return false;
}

TEST(BoardFill, OneCellPerTickBottomRightFirstThenInput)
{
    Session s;
    s.StartMission(0);  // let a first fill run so every cell holds a gem
    s.game.Board.fill(0);
    s.Run("call MarkBorderRing");
    s.game.InputReady = false;
    s.Run("call StartBoardFill");
    EXPECT_EQ(s.Print("Image1(88).Picture"), "palette 10");
    s.Advance(29);
    EXPECT_EQ(s.Print("Image1(88).Picture"), "palette 10");
    s.Advance(1);
    EXPECT_NE(s.Print("Image1(88).Picture"), "palette 10");
    EXPECT_EQ(s.Print("Image1(87).Picture"), "palette 10");
    EXPECT_EQ(s.game.FillCounter, 87);
    // Ticks 2..8 finish the bottom row; the ninth skips the border and takes cell 78.
    s.Advance(8 * 30);
    EXPECT_NE(s.Print("Image1(78).Picture"), "palette 10");
    EXPECT_EQ(s.Print("Image1(77).Picture"), "palette 10");
    s.Advance(54 * 30);
    EXPECT_EQ(s.Print("Image1(11).Picture"), "palette 10");
    EXPECT_FALSE(s.game.InputReady);
    EXPECT_TRUE(s.game.timers[kFillTimer].Enabled());
    s.Advance(30);
    EXPECT_NE(s.Print("Image1(11).Picture"), "palette 10");
    EXPECT_EQ(s.game.FillCounter, 10);
    EXPECT_FALSE(s.game.timers[kFillTimer].Enabled());
    EXPECT_TRUE(s.game.InputReady);
    EXPECT_FALSE(s.game.timers[kBombClock].Enabled()) << "no bomb in the stage: the bomb clock stays off";
}

TEST(BoardFill, NoReadyMadeRunsAndTheBorderHoldsOverManySeeds)
{
    std::set<int> borders;
    for (int cell = 0; cell < 100; ++cell)
        if (IsBorderRing(cell)) borders.insert(cell);
    ASSERT_EQ(borders.size(), 36u);
    int greens = 0;
    for (uint32_t seed = 1; seed <= 60; ++seed) {
        Session s(seed);
        s.StartMission(0);
        for (int cell : borders) {
            ASSERT_EQ(s.game.Board[static_cast<size_t>(cell)], BORDER) << cell;
            ASSERT_EQ(s.Print("Image1(" + std::to_string(cell) + ").Picture"), "palette 14");
            ASSERT_FALSE(s.game.screen.Cells[static_cast<size_t>(cell)]->enabled);
        }
        for (int cell = 11; cell <= 88; ++cell)
            if (IsPlayable(cell)) {
                ASSERT_TRUE(IsGem(s.game.Board[static_cast<size_t>(cell)]));
                greens += s.game.GreenFlag[static_cast<size_t>(cell)];
            }
        // Green and red bullets are one kind for runs.
        ASSERT_FALSE(HasRunOfThree(s.game.Board)) << "seed " << seed;
        ASSERT_TRUE(FindRuns(s.game.Board, s.game.GreenFlag).empty());
    }
    EXPECT_GT(greens, 0) << "0.5 % of 3840 cells should give some green-tipped bullets";
}

}  // namespace
}  // namespace kr
