#pragma once
#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace kr {

class Game;

// The eight values of the progress file, in file order.
struct Progress {
    int16_t UnlockedMissions = 0;
    int16_t SoundOn = 0;
    int16_t Strength = 0;
    int16_t Intelligence = 0;
    int16_t Dexterity = 0;
    int16_t Endurance = 0;
    int16_t Accuracy = 0;
    int16_t TutorialOn = 0;
};

// Reads numeric fields in file order into `into`; returns how many were read before the text ended
// or a field failed to convert (8 when all were read).
int ParseProgress(std::string_view text, Progress& into);

// The file's text: per line a sign position, the digits, one space, CR LF.
std::string FormatProgress(const Progress& progress);

// Reads config.cfg into the game's variables; false when the file is missing or incomplete, in which case
// the values read keep what was read and UnlockedMissions becomes 1. Values are kept in the ranges
// later rules can handle.
bool LoadProgress(Game& g);

// Writes config.cfg through a temporary file renamed over it, so a failed save leaves the old file whole.
// Failures are silent.
void SaveProgress(Game& g);

}  // namespace kr
