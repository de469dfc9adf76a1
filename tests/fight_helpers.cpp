#include "tests/fight_helpers.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "board/moves.h"
#include "board/resolve.h"
#include "shell/timer_numbers.h"

namespace kr::testing {
namespace {

const char* const kQuiet[8] = {"02302302", "23023023", "30230230", "02302302",
                               "23023023", "30230230", "02302302", "55053023"};

}  // namespace

std::string Board(std::vector<std::string> top)
{
    std::string rows;
    for (size_t r = 0; r < 8; ++r) {
        std::string row = kQuiet[r];
        if (r < top.size())
            for (size_t c = 0; c < std::min<size_t>(8, top[r].size()); ++c)
                if (top[r][c] != '.') row[c] = top[r][c];
        rows += row + "\n";
    }
    return rows;
}

std::string RunOfThree(const char* abc) { return Board({std::string{abc[0], abc[1], '3', abc[2], '.', '.', '.', '.'}}); }

int64_t Now(const Session& s) { return s.game.timers.Now(); }

void Lay(Session& s, const std::string& rows, bool needsMove)
{
    s.SetBoard(rows);
    ASSERT_TRUE(FindRuns(s.game.Board, s.game.GreenFlag).empty()) << rows;
    ASSERT_EQ(HasPossibleMove(s.game.Board), needsMove) << rows;
}

void Swap(Session& s, int a, int b)
{
    s.Press(a);
    s.Press(b);
}

void StartRun(Session& s, const char* abc)
{
    Lay(s, RunOfThree(abc));
    Swap(s, 13, 14);
}

void PlayRun(Session& s, const char* abc)
{
    StartRun(s, abc);
    s.Advance(240);
}

void Set(Session& s, std::initializer_list<std::string> assignments)
{
    for (const std::string& assignment : assignments) ASSERT_EQ(s.Run("set " + assignment), 0) << assignment;
}

void Settle(Session& s)
{
    s.AdvanceUntil([&] { return s.game.InputReady && NothingRunning(s.game.timers); });
}

bool Played(const std::vector<int>& sounds, int channel)
{
    return std::find(sounds.begin(), sounds.end(), channel) != sounds.end();
}

bool IsShot(const std::vector<int>& sounds) { return sounds == std::vector<int>{0} || sounds == std::vector<int>{1}; }

void Enter(Session& s, int mission, int stage)
{
    s.StartMission(mission);
    if (stage == 0) return;
    s.Run("set MissionStage " + std::to_string(stage));
    s.Run("call SetUpStage " + std::to_string(mission) + " " + std::to_string(stage));
    s.Advance(64 * 30);
    ASSERT_TRUE(s.game.InputReady);
}

}  // namespace kr::testing
