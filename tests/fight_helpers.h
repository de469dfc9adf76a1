#pragma once
#include <cstdint>
#include <initializer_list>
#include <string>
#include <vector>

#include "tests/session.h"

namespace kr::testing {

// Ten missions open, sound on, every attribute 0, tutorial off.
inline const std::string kAllOpenWithSound = " 10 \r\n 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n";

// A board with no possible move where swapping 11 and 12 lines up nothing and still leaves none.
inline const std::string kDeadBoard =
    "14530122\n21510520\n00324415\n32105251\n33521234\n12010550\n04024401\n02513124\n";

// A quiet board (grey bullets, grenades and crosshairs in a pattern with no run, and one spare move in the
// bottom row: swapping 83 and 84 lines up three red crosses) with its top rows replaced; '.' keeps the quiet
// icon.
std::string Board(std::vector<std::string> top);

// Row 1 reads a b 3 c: swapping cells 13 and 14 lines up a b c in cells 11..13.
std::string RunOfThree(const char* abc);

int64_t Now(const Session& s);

// Sets a board after checking that it holds no run yet (and, unless told otherwise, a possible move).
void Lay(Session& s, const std::string& rows, bool needsMove = true);

void Swap(Session& s, int a, int b);

// Lays RunOfThree(abc) and makes the move that lines it up.
void StartRun(Session& s, const char* abc);

// The same, on to the swap's last step: the moment the run takes effect, before its icons fall.
void PlayRun(Session& s, const char* abc);

// Sets game variables, each "Name Value".
void Set(Session& s, std::initializer_list<std::string> assignments);

// Until the board is the player's again: nothing animating, no attack, input released.
void Settle(Session& s);

bool Played(const std::vector<int>& sounds, int channel);
bool IsShot(const std::vector<int>& sounds);

// Starts mission `mission` from the menu and moves on to `stage` the way the stage-done pause does.
void Enter(Session& s, int mission, int stage);

}  // namespace kr::testing
