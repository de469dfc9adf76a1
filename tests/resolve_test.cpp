#include <gtest/gtest.h>

#include "board/grid.h"
#include "board/moves.h"
#include "board/resolve.h"
#include "shell/timer_numbers.h"
#include "tests/session.h"

namespace kr {
namespace {

using testing::Session;

// A board with neither a run nor a possible move, using kinds 0..4 only, so kind 5 can be placed freely.
constexpr const char* kStill =
    "23401234\n34012340\n40123401\n01234012\n12340123\n23401234\n34012340\n40123401\n";

BoardCells Parse(const std::string& rows, std::array<bool, 100>* green = nullptr)
{
    BoardCells board;
    board.fill(BORDER);
    for (int r = 0; r < 8; ++r)
        for (int c = 0; c < 8; ++c) {
            const char ch = rows[static_cast<size_t>(r * 9 + c)];
            const size_t cell = static_cast<size_t>((r + 1) * 10 + c + 1);
            board[cell] = ch == 'g' ? kBrownBullet : static_cast<int16_t>(ch - '0');
            if (green) (*green)[cell] = ch == 'g';
        }
    return board;
}

std::string With(std::string rows, std::initializer_list<std::pair<int, char>> cells)
{
    for (const auto& [cell, kind] : cells) rows[static_cast<size_t>((cell / 10 - 1) * 9 + cell % 10 - 1)] = kind;
    return rows;
}

TEST(RunSearch, FindsRowsBeforeColumnsAndCountsASharedCellInBoth)
{
    std::array<bool, 100> green{};
    // A T: row 2, columns 2..4 and column 3, rows 2..5, the shared cell green-tipped.
    const BoardCells board = Parse(With(kStill, {{22, '1'}, {23, 'g'}, {24, '1'}, {33, '1'}, {43, '1'}, {53, '1'}}),
                                   &green);
    const std::vector<kr::Run> runs = FindRuns(board, green);
    ASSERT_EQ(runs.size(), 2u);
    EXPECT_EQ(runs[0].first, 22);
    EXPECT_EQ(runs[0].step, 1);
    EXPECT_EQ(runs[0].power, 2);
    EXPECT_EQ(runs[0].greens, 1);
    EXPECT_EQ(runs[1].first, 23);
    EXPECT_EQ(runs[1].step, 10);
    EXPECT_EQ(runs[1].power, 3);
    EXPECT_EQ(runs[1].greens, 1);

    // Five in a row is one run; a column of four from row 1 is found once, from its top.
    std::array<bool, 100> none{};
    const std::vector<kr::Run> five = FindRuns(Parse(With(kStill, {{64, '5'}, {65, '5'}, {66, '5'}, {67, '5'}, {68, '5'}})), none);
    ASSERT_EQ(five.size(), 1u);
    EXPECT_EQ(five[0].power, 4);
    const std::vector<kr::Run> column = FindRuns(Parse(With(kStill, {{18, '5'}, {28, '5'}, {38, '5'}, {48, '5'}})), none);
    ASSERT_EQ(column.size(), 1u);
    EXPECT_EQ(column[0].first, 18);
    EXPECT_EQ(column[0].power, 3);

    // Cleared cells and the border are never runs.
    BoardCells cleared = Parse(kStill);
    for (int cell = 41; cell <= 48; ++cell) cleared[static_cast<size_t>(cell)] = CLEARED;
    for (int cell = 13; cell <= 83; cell += 10) cleared[static_cast<size_t>(cell)] = CLEARED;
    EXPECT_TRUE(FindRuns(cleared, none).empty());
}

TEST(MoveCheck, FindsEveryKindOfMoveAndNothingOnAStillBoard)
{
    EXPECT_FALSE(HasPossibleMove(Parse(kStill)));
    // The moved icon lands between two of its kind in a column.
    EXPECT_TRUE(HasPossibleMove(Parse(With(kStill, {{34, '5'}, {54, '5'}, {45, '5'}}))));
    // Moving up into a row completed on both sides, with the cell two above also of the kind.
    EXPECT_TRUE(HasPossibleMove(Parse(With(kStill, {{64, '5'}, {53, '5'}, {55, '5'}, {44, '5'}}))));
    // A pair in the corner that only a cell beyond the border could complete.
    EXPECT_FALSE(HasPossibleMove(Parse(With(kStill, {{17, '5'}, {18, '5'}}))));
    // Green and red bullets are one kind: the board holds kind 1 for both.
    std::array<bool, 100> green{};
    EXPECT_TRUE(HasPossibleMove(Parse(With(kStill, {{34, 'g'}, {54, '1'}, {45, 'g'}}), &green)));
}

class BoardPlay : public ::testing::Test {
protected:
    // "Misja 1", stage 0: a terminal and no enemy, Endurance 1 for 38 health.
    Session s{11, " 1 \r\n 1 \r\n 0 \r\n 0 \r\n 0 \r\n 1 \r\n 0 \r\n 0 \r\n"};
    void SetUp() override { s.StartMission(0); }
};

TEST_F(BoardPlay, SelectingDeselectingAndSwappingANeighbour)
{
    ASSERT_TRUE(s.game.InputReady);
    s.SetBoard(With(kStill, {{34, '5'}, {54, '5'}, {45, '5'}}));
    // The return question lies over rows 3..6 and lets presses through to the cells.
    s.Key(27);
    ASSERT_TRUE(s.game.screen.ReturnPrompt->visible);
    s.Press(45);
    EXPECT_TRUE(s.game.screen.SelectionMarker->visible);
    EXPECT_EQ(s.Print("SelectionMarker.Left"), s.Print("Image1(45).Left"));
    s.Key(78);
    s.Press(45);
    EXPECT_FALSE(s.game.screen.SelectionMarker->visible);
    EXPECT_EQ(s.game.SelectedCell, -1);
    s.Press(45);
    s.Press(47);  // not a neighbour: the selection stays
    EXPECT_EQ(s.game.SelectedCell, 45);
    EXPECT_TRUE(s.game.screen.SelectionMarker->visible);
    s.Press(44);
    EXPECT_FALSE(s.game.InputReady);
    EXPECT_FALSE(s.game.screen.SelectionMarker->visible);
    EXPECT_EQ(s.game.SelectedCell, 45) << "the old index stays; the marker tells whether a selection exists";
    const char* frames[] = {"palette 7", "palette 8", "palette 9", "palette 10", "palette 9", "palette 8", "palette 7"};
    for (const char* frame : frames) {
        s.Advance(30);
        EXPECT_EQ(s.Print("Image1(44).Picture"), frame);
        EXPECT_EQ(s.Print("Image1(45).Picture"), frame);
        s.Press(11);  // ignored during the swap
        EXPECT_FALSE(s.game.screen.SelectionMarker->visible);
    }
    s.Advance(30);  // the eighth tick exchanges the icons and finds the column at 34, 44, 54
    EXPECT_EQ(s.game.Board[45], 3);
    EXPECT_EQ(s.game.Board[44], CLEARED);
    EXPECT_EQ(s.Print("Image1(44).Picture"), "palette 11");
    EXPECT_EQ(s.game.Resources[5], 1);
    EXPECT_FALSE(s.game.SwapUnmatched);
    s.Advance(45);
    EXPECT_EQ(s.Print("Image1(34).Picture"), "palette 12");
    s.Advance(45);
    EXPECT_EQ(s.Print("Image1(34).Picture"), "palette 13");
    s.Press(12);
    s.Advance(45);
    EXPECT_EQ(s.Print("Image1(34).Picture"), "palette 10");
    EXPECT_FALSE(s.game.timers[kFallTimer].Enabled());
    s.Advance(45);
    EXPECT_FALSE(s.game.timers[kBlastTimer].Enabled());
    EXPECT_TRUE(s.game.timers[kFallTimer].Enabled());
    // Three gaps in one column: three fall ticks, then one that resolves.
    s.Advance(75);
    EXPECT_EQ(s.game.Board[54], CLEARED);
    EXPECT_NE(s.game.Board[24], CLEARED);
    s.Press(12);
    EXPECT_FALSE(s.game.screen.SelectionMarker->visible) << "presses are ignored during the fall";
    s.Advance(2000);
    EXPECT_TRUE(s.game.InputReady || s.game.screen.NoMovesLabel->visible);
}

TEST_F(BoardPlay, AnUnmatchedSwapStaysAndCostsAThirdOfTheMaximum)
{
    ASSERT_EQ(s.game.MaxHealth, 38);
    s.SetBoard(kStill);
    s.Run("sounds");
    s.TakeOutput();
    s.game.DeadlyBulletsTurns = 2;
    s.Press(11);
    s.Press(12);
    s.Advance(240);
    EXPECT_EQ(s.game.Board[11], 3);
    EXPECT_EQ(s.game.Board[12], 2);
    EXPECT_EQ(s.game.Health, 25);
    EXPECT_EQ(s.Print("Label6.Caption"), "\"25\"");
    EXPECT_TRUE(s.game.SwapUnmatched) << "the flag stays until a later resolution finds a run";
    EXPECT_EQ(s.game.DeadlyBulletsTurns, 1);
    s.Run("sounds");
    EXPECT_EQ(s.TakeOutput(), "sounds: 11\n");
    // The still board has no move left: it is renewed, and the goal check waits for a later turn.
    EXPECT_TRUE(s.game.screen.NoMovesLabel->visible);
    EXPECT_FALSE(s.game.InputReady);
    s.Advance(1919);
    EXPECT_FALSE(s.game.InputReady);
    EXPECT_TRUE(s.game.screen.NoMovesLabel->visible);
    s.Advance(1);
    EXPECT_TRUE(s.game.InputReady) << "the last of 64 fill ticks comes 1920 ms after the renewal";
    EXPECT_TRUE(s.game.screen.NoMovesLabel->visible);
    s.Advance(79);
    EXPECT_TRUE(s.game.screen.NoMovesLabel->visible);
    s.Advance(1);
    EXPECT_FALSE(s.game.screen.NoMovesLabel->visible) << "the label shows for 2 s";
    EXPECT_FALSE(s.game.timers[kNoMovesTimer].Enabled());
    // Three penalties in all take the hero below zero.
    for (int turn = 0; turn < 2; ++turn) {
        s.SetBoard(kStill);
        s.Press(11);
        s.Press(12);
        s.Advance(240);
        s.Advance(2000);
    }
    EXPECT_EQ(s.game.Health, -1);
    EXPECT_TRUE(s.game.screen.MissionFailedLabel->visible);
    EXPECT_FALSE(s.game.InputReady);
}

TEST_F(BoardPlay, ACascadeOfThreeRoundsEndsInOneTurn)
{
    // Column 1 rows 6..8 of grey bullets; as it falls away row 8 lines up grenades, then red crosses.
    const std::string board =
        "34012340\n40123401\n01234012\n12340123\n23401234\n04123401\n05534012\n20251234\n";
    std::array<bool, 100> none{};
    ASSERT_TRUE(FindRuns(Parse(board), none).empty());
    s.SetBoard(board);
    s.game.DeadlyBulletsTurns = 3;
    s.game.Health = 20;
    s.Press(81);
    s.Press(82);
    s.Advance(240);
    EXPECT_EQ(s.game.Resources[0], 1);
    EXPECT_EQ(s.game.Resources[2], 0);
    // Blast 4 x 45 ms, fall 4 x 75 ms, then the grenades.
    s.Advance(4 * 45 + 4 * 75);
    EXPECT_EQ(s.game.Resources[2], 1);
    EXPECT_FALSE(s.game.InputReady);
    EXPECT_EQ(s.game.DeadlyBulletsTurns, 3) << "the turn has not ended yet";
    s.Advance(4 * 45 + 2 * 75);
    EXPECT_EQ(s.game.Resources[5], 1);
    EXPECT_EQ(s.game.Health, 22) << "the red crosses healed 2";
    s.Advance(5000);
    EXPECT_EQ(s.game.DeadlyBulletsTurns, 2) << "one turn end for the whole cascade";
    EXPECT_FALSE(s.game.SwapUnmatched);
    EXPECT_EQ(s.game.Health, 22 + 2 * (s.game.Resources[5] - 1)) << "no penalty; only further red-cross runs heal";
}

}  // namespace
}  // namespace kr
