#pragma once
#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "board/grid.h"

namespace kr::soak {

// Every swap of two neighbours that lines up a run, in cell order.
std::vector<std::pair<int16_t, int16_t>> MatchingSwaps(const BoardCells& board);

struct Tally {
    uint64_t games = 0;
    uint64_t inputs = 0;  // presses, releases, moves and keys handed to the game
    uint64_t ticks = 0;
    int64_t gameMs = 0;
    uint64_t missionsStarted = 0;
    uint64_t missionsWon = 0;
    uint64_t missionsFailed = 0;

    void Add(const Tally& other);
};

struct Outcome {
    Tally tally;
    std::optional<std::string> failure;  // the broken rule, or a replay that ended elsewhere
    std::string script;                  // the game as recorded, for kruszarka-script
};

// One game from start-up under a random player: legal and illegal swaps, presses on the board, the skills
// and the menus, the three keys, pointer moves and waits long and short. The rules are checked after
// every input and every timer tick; a game that keeps them is then replayed from its recording, which
// must end in the same state. `folder` holds the progress file and is left empty.
Outcome SoakGame(uint32_t seed, uint64_t inputs, const std::filesystem::path& folder);

}  // namespace kr::soak
