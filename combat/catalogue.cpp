#include "combat/catalogue.h"

#include <array>

namespace kr {
namespace {

constexpr TerminalGoal Terminal(int16_t work, int16_t picture = kTerminalPicture)
{
    return {Need::Required, work, picture};
}
constexpr EnemyGoal Enemy(Need need, int16_t portrait, int16_t health, int16_t attack, int16_t hitChance)
{
    return {need, portrait, health, attack, hitChance};
}
constexpr EnemyGoal Enemy(int16_t portrait, int16_t health, int16_t attack, int16_t hitChance)
{
    return Enemy(Need::Required, portrait, health, attack, hitChance);
}
constexpr BombGoal Bomb(Need need, int16_t work, int16_t ticks, int16_t picture = kBombPicture)
{
    return {need, work, ticks, picture};
}

constexpr StageGoals Stage(TerminalGoal t, EnemyGoal e = {}, BombGoal b = {}) { return {t, e, b}; }
constexpr StageGoals Stage(EnemyGoal e, BombGoal b = {}) { return {{}, e, b}; }
constexpr StageGoals Stage(BombGoal b) { return {{}, {}, b}; }

constexpr std::array kMission1{Stage(Terminal(20)), Stage(Enemy(0, 25, 2, 25))};
constexpr std::array kMission2{Stage(Enemy(1, 40, 3, 35)), Stage(Enemy(1, 45, 3, 35)), Stage(Enemy(1, 45, 4, 35))};
constexpr std::array kMission3{Stage(Enemy(1, 45, 3, 40)), Stage(Enemy(1, 50, 4, 40)),
                               Stage(Bomb(Need::Required, 20, 1500))};
constexpr std::array kMission4{Stage(Terminal(35)), Stage(Enemy(1, 55, 4, 45)),
                               Stage(Terminal(25), Enemy(Need::Optional, 3, 200, 5, 50))};
constexpr std::array kMission5{Stage(Terminal(25)), Stage(Terminal(33, kBombPicture), Enemy(Need::Optional, 3, 100, 5, 50)),
                               Stage(Enemy(1, 60, 5, 45), Bomb(Need::Optional, 100, 1800))};
constexpr std::array kMission6{Stage(Terminal(25), Enemy(1, 70, 6, 50)), Stage(Enemy(3, 70, 7, 55)),
                               Stage(Enemy(2, 110, 10, 25))};
constexpr std::array kMission7{Stage(Enemy(1, 75, 7, 55)), Stage(Enemy(3, 80, 8, 55)), Stage(Enemy(4, 130, 12, 35))};
constexpr std::array kMission8{Stage(Enemy(5, 100, 10, 50)), Stage(Enemy(5, 101, 10, 51)),
                               Stage(Enemy(5, 95, 12, 40))};
// In mission 9 the panels keep the pictures they showed last.
constexpr std::array kMission9{Stage(Terminal(30, kKeepPicture), {}, Bomb(Need::Optional, 100, 900, kKeepPicture)),
                               Stage(Enemy(6, 110, 11, 55)),
                               Stage(Terminal(40, kKeepPicture), Enemy(Need::Optional, 6, 220, 13, 55))};
constexpr std::array kMission10{Stage(Enemy(5, 110, 12, 55)), Stage(Enemy(6, 120, 12, 60)),
                                Stage(Terminal(40), Enemy(6, 125, 13, 55)), Stage(Enemy(7, 250, 15, 50))};

}  // namespace

std::span<const StageGoals> StagesOf(int mission)
{
    switch (mission) {
    case 0: return kMission1;
    case 1: return kMission2;
    case 2: return kMission3;
    case 3: return kMission4;
    case 4: return kMission5;
    case 5: return kMission6;
    case 6: return kMission7;
    case 7: return kMission8;
    case 8: return kMission9;
    case 9: return kMission10;
    default: return {};
    }
}

}  // namespace kr
