#pragma once
#include <cstdint>
#include <optional>
#include <utility>

#include "board/grid.h"

namespace kr {

class Game;

// The first swap of two neighbours, in cell order, that lines up a run; nothing when there is none.
std::optional<std::pair<int16_t, int16_t>> FirstMatchingSwap(const BoardCells& board);

struct MissionResult {
    bool won = false;
    int moves = 0;
    int64_t milliseconds = 0;  // virtual time from the start button to the outcome
};

// A simple player: from the main menu it starts the mission, then always makes the first swap that
// lines up a run, until the mission is won or lost (or `limit` ms of virtual time pass).
MissionResult PlayMission(Game& g, int mission, int64_t limit = 3'600'000);

}  // namespace kr
