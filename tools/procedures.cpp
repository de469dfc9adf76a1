#include "tools/procedures.h"

#include <map>

#include "board/fill.h"
#include "board/grid.h"
#include "board/moves.h"
#include "board/resolve.h"
#include "board/swap.h"
#include "board/targets.h"
#include "combat/effects.h"
#include "combat/enemy.h"
#include "combat/outcome.h"
#include "combat/stage.h"
#include "hero/bullet_time.h"
#include "hero/descriptions.h"
#include "hero/levelup.h"
#include "hero/panel.h"
#include "hero/skills.h"
#include "hero/targeting.h"
#include "shell/briefing.h"
#include "shell/game.h"
#include "shell/progress.h"
#include "shell/screens.h"
#include "shell/tutorial.h"
#include "tools/variables.h"

namespace kr::script {
namespace {

using Args = std::vector<int16_t>;

constexpr ArgumentRule kAnyCell{[](int16_t c) { return c >= 0 && c < 100; }, "a cell 0..99"};
constexpr ArgumentRule kPlayableCell{[](int16_t c) { return IsPlayable(c); }, "a playable cell"};
constexpr ArgumentRule kMission{[](int16_t m) { return m >= 0 && m <= 9; }, "a mission 0..9"};
constexpr ArgumentRule kStage{[](int16_t s) { return s >= 0 && s <= 4; }, "a stage 0..4"};
constexpr ArgumentRule kPage{[](int16_t p) { return p >= 1 && p <= 14; }, "a page 1..14"};
constexpr ArgumentRule kAttribute{[](int16_t a) { return a >= 0 && a <= 10; }, "an attribute 0..10"};
constexpr ArgumentRule kAmount{[](int16_t a) { return a >= -1000 && a <= 1000; }, "an amount -1000..1000"};
constexpr ArgumentRule kSkill{[](int16_t s) { return s >= 0 && s < kSkillCount; }, "a skill 0..6"};
constexpr ArgumentRule kGreenTips{[](int16_t n) { return n >= 0 && n <= 8; }, "green tips 0..8"};

Procedure Checked(Procedure procedure, std::vector<ArgumentRule> rules)
{
    procedure.rules = std::move(rules);
    return procedure;
}

Procedure Action(void (*procedure)(Game&))
{
    return {0, [procedure](Game& g, const Args&) -> std::optional<std::string> {
                procedure(g);
                return std::nullopt;
            },
            {}};
}

Procedure Action1(void (*procedure)(Game&, int16_t))
{
    return {1, [procedure](Game& g, const Args& a) -> std::optional<std::string> {
                procedure(g, a[0]);
                return std::nullopt;
            },
            {}};
}

Procedure Action1Ref(void (*procedure)(Game&, const int16_t&))
{
    return {1, [procedure](Game& g, const Args& a) -> std::optional<std::string> {
                procedure(g, a[0]);
                return std::nullopt;
            },
            {}};
}

Procedure Test(bool (*procedure)(Game&))
{
    return {0, [procedure](Game& g, const Args&) -> std::optional<std::string> { return FormatBool(procedure(g)); },
            {}};
}

const std::map<std::string, Procedure, std::less<>>& Procedures()
{
    static const std::map<std::string, Procedure, std::less<>> procedures{
        {"StartBoardFill", Action(StartBoardFill)},
        {"GenerateCell", Checked(Action1(GenerateCell), {kPlayableCell})},
        {"ShowCell", Checked(Action1(ShowCell), {kAnyCell})},
        {"MarkBorderRing", Action(MarkBorderRing)},
        {"RefreshHeroPanel", Action(RefreshHeroPanel)},
        {"SetUpStage", {2,
                        [](Game& g, const Args& a) -> std::optional<std::string> {
                            SetUpStage(g, a[0], a[1]);
                            return std::nullopt;
                        },
                        {kMission, kStage}}},
        {"CheckStageDone", Action(CheckStageDone)},
        {"StartFailure", Action(StartFailure)},
        {"ShowMissionComplete", Checked(Action1Ref(ShowMissionComplete), {kMission})},
        {"PrepareLevelUp", Checked(Action1Ref(PrepareLevelUp), {kMission})},
        {"LoadProgress", Test(LoadProgress)},
        {"SaveProgress", Action(SaveProgress)},
        {"ReturnToMenu", Action(ReturnToMenu)},
        {"EnableMissionButtons", Action(EnableMissionButtons)},
        {"ShowHint", Checked(Action1(ShowHint), {kPage})},
        {"PlaceTutorialPanel", Action(PlaceTutorialPanel)},
        {"sprawdz", Test(sprawdz)},
        {"ResolveBoard", Action(ResolveBoard)},
        {"TurnEnd", Action(TurnEnd)},
        {"RenewBoard", Action(RenewBoard)},
        {"StartSwap", {2,
                       [](Game& g, const Args& a) -> std::optional<std::string> {
                           StartSwap(g, a[0], a[1]);
                           return std::nullopt;
                       },
                       {kAnyCell, kAnyCell}}},
        {"ShootEnemy", {2, [](Game& g, const Args& a) -> std::optional<std::string> {
                            ShootEnemy(g, a[0], a[1]);
                            return std::nullopt;
                        }, {kAmount, kGreenTips}}},
        {"DoEngineering", Checked(Action1Ref(DoEngineering), {kAmount})},
        {"HealHero", Checked(Action1Ref(HealHero), {kAmount})},
        {"StartEnemyAttack", Action(StartEnemyAttack)},
        {"UseSkill", Checked(Action1Ref(UseSkill), {kSkill})},
        {"BoardPressed", Checked(Action1(BoardPressed), {kPlayableCell})},
        {"ThrowGrenade", Checked(Action1(ThrowGrenade), {kPlayableCell})},
        {"BlastKind", Checked(Action1(BlastKind), {kPlayableCell})},
        {"StartBulletTime", Action(StartBulletTime)},
        {"EndBulletTime", Action(EndBulletTime)},
        {"ShowBoardPointer", Action(ShowBoardPointer)},
        {"ShowSkillDescription", Checked(Action1Ref(ShowSkillDescription), {kSkill})},
        {"ShowHeroAttributes", Action(ShowHeroAttributes)},
        {"ClearDescription", Action(ClearDescription)},
        {"MaxHealthFor", {2,
                          [](Game&, const Args& a) -> std::optional<std::string> {
                              return std::to_string(MaxHealthFor(a[0], a[1]));
                          },
                          {kMission, kAttribute}}},
    };
    return procedures;
}

}  // namespace

const Procedure* FindProcedure(std::string_view name)
{
    const auto it = Procedures().find(name);
    return it == Procedures().end() ? nullptr : &it->second;
}

}  // namespace kr::script
