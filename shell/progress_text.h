#pragma once
#include <cstdint>
#include <string>
#include <string_view>

namespace kr {

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
// or a field failed to convert (8 when all were read). Any bytes at all are safe to hand in.
int ParseProgress(std::string_view text, Progress& into);

// The file's text: per line a sign position, the digits, one space, CR LF.
std::string FormatProgress(const Progress& progress);

}  // namespace kr
