#include "tools/procedures.h"

#include <map>

#include "board/fill.h"
#include "board/moves.h"
#include "board/resolve.h"
#include "board/swap.h"
#include "combat/effects.h"
#include "combat/enemy.h"
#include "combat/outcome.h"
#include "combat/stage.h"
#include "hero/levelup.h"
#include "hero/panel.h"
#include "shell/briefing.h"
#include "shell/game.h"
#include "shell/progress.h"
#include "shell/screens.h"
#include "shell/tutorial.h"
#include "tools/variables.h"

namespace kr::script {
namespace {

using Args = std::vector<int16_t>;

Procedure Action(void (*procedure)(Game&))
{
    return {0, [procedure](Game& g, const Args&) -> std::optional<std::string> {
                procedure(g);
                return std::nullopt;
            }};
}

Procedure Action1(void (*procedure)(Game&, int16_t))
{
    return {1, [procedure](Game& g, const Args& a) -> std::optional<std::string> {
                procedure(g, a[0]);
                return std::nullopt;
            }};
}

Procedure Action1Ref(void (*procedure)(Game&, const int16_t&))
{
    return {1, [procedure](Game& g, const Args& a) -> std::optional<std::string> {
                procedure(g, a[0]);
                return std::nullopt;
            }};
}

Procedure Test(bool (*procedure)(Game&))
{
    return {0, [procedure](Game& g, const Args&) -> std::optional<std::string> { return FormatBool(procedure(g)); }};
}

const std::map<std::string, Procedure, std::less<>>& Procedures()
{
    static const std::map<std::string, Procedure, std::less<>> procedures{
        {"StartBoardFill", Action(StartBoardFill)},
        {"GenerateCell", Action1(GenerateCell)},
        {"ShowCell", Action1(ShowCell)},
        {"MarkBorderRing", Action(MarkBorderRing)},
        {"RefreshHeroPanel", Action(RefreshHeroPanel)},
        {"SetUpStage", {2, [](Game& g, const Args& a) -> std::optional<std::string> {
                            SetUpStage(g, a[0], a[1]);
                            return std::nullopt;
                        }}},
        {"CheckStageDone", Action(CheckStageDone)},
        {"StartFailure", Action(StartFailure)},
        {"ShowMissionComplete", Action1Ref(ShowMissionComplete)},
        {"PrepareLevelUp", Action1Ref(PrepareLevelUp)},
        {"LoadProgress", Test(LoadProgress)},
        {"SaveProgress", Action(SaveProgress)},
        {"ReturnToMenu", Action(ReturnToMenu)},
        {"EnableMissionButtons", Action(EnableMissionButtons)},
        {"ShowHint", Action1(ShowHint)},
        {"PlaceTutorialPanel", Action(PlaceTutorialPanel)},
        {"sprawdz", Test(sprawdz)},
        {"ResolveBoard", Action(ResolveBoard)},
        {"TurnEnd", Action(TurnEnd)},
        {"RenewBoard", Action(RenewBoard)},
        {"StartSwap", {2, [](Game& g, const Args& a) -> std::optional<std::string> {
                           StartSwap(g, a[0], a[1]);
                           return std::nullopt;
                       }}},
        {"ShootEnemy", {2, [](Game& g, const Args& a) -> std::optional<std::string> {
                            ShootEnemy(g, a[0], a[1]);
                            return std::nullopt;
                        }}},
        {"DoEngineering", Action1Ref(DoEngineering)},
        {"HealHero", Action1Ref(HealHero)},
        {"StartEnemyAttack", Action(StartEnemyAttack)},
        {"MaxHealthFor", {2, [](Game&, const Args& a) -> std::optional<std::string> {
                              return std::to_string(MaxHealthFor(a[0], a[1]));
                          }}},
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
