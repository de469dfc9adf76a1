#pragma once
#include <cstdint>
#include <span>

namespace kr {

enum class Need : uint8_t { Absent, Optional, Required };

// A picture copied into a goal panel; kKeepPicture leaves the panel's last picture.
inline constexpr int16_t kKeepPicture = -1;
inline constexpr int16_t kBombPicture = 0;
inline constexpr int16_t kTerminalPicture = 1;

struct TerminalGoal {
    Need need = Need::Absent;
    int16_t work = 0;
    int16_t picture = kTerminalPicture;
};

struct EnemyGoal {
    Need need = Need::Absent;
    int16_t portrait = 0;
    int16_t health = 0;
    int16_t attack = 0;
    int16_t hitChance = 0;
};

struct BombGoal {
    Need need = Need::Absent;
    int16_t work = 0;
    int16_t ticks = 0;
    int16_t picture = kBombPicture;
};

struct StageGoals {
    TerminalGoal terminal;
    EnemyGoal enemy;
    BombGoal bomb;
};

// The stages of mission 0..9; empty for any other mission.
std::span<const StageGoals> StagesOf(int mission);

}  // namespace kr
