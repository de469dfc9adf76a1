#pragma once
#include <array>

#include "ui/form.h"

namespace kr {

// The controls the game's procedures touch, each declared once here: its member's name is also its role, the
// name scripts and tests reach it by ("NoMovesLabel", "Cells(45)"), beside its form name ("Label5", "Image1(45)").
#define KRUSZARKA_SCREEN_CONTROLS(ONE, MANY) \
    /* Game screen */ \
    ONE(HeroPanel) /* Frame1 */ \
    ONE(HeroPortrait) /* Image3 */ \
    ONE(HealthFill) /* Shape7(0) */ \
    ONE(HealthFrame) /* Shape7(1) */ \
    ONE(HealthLabel) /* Label6 */ \
    ONE(DamageLabel) /* Label4 */ \
    ONE(HeroShotFrame) /* Shape8 */ \
    MANY(ResourceIcons, 30) /* Image6(0..29) */ \
    \
    ONE(SkillPanel) /* Frame2 */ \
    MANY(SkillFrames, 7) /* Frame7(s) */ \
    MANY(SkillIcons, 7) /* Image2(s) */ \
    MANY(CostIcons, 42) /* Image4(i) */ \
    MANY(SkillHighlight, 7) /* Shape2(s) */ \
    MANY(FiveTimesLabels, 2) /* Label13(k) */ \
    \
    MANY(Cells, 100) /* Image1(i) */ \
    ONE(SelectionMarker) /* Shape1 */ \
    \
    MANY(GoalPanel, 3) /* Frame4(i): 0 bomb, 1 enemy, 2 terminal */ \
    MANY(GoalPicture, 3) /* Image8, Image9, Image10 */ \
    MANY(RequiredFrame, 3) /* Shape4(i) */ \
    MANY(DoneFrame, 3) /* Shape5(i) */ \
    MANY(GoalIcons, 4) /* Image7(k) */ \
    ONE(BombWorkBar) /* Shape3(0), outline Shape3(1) */ \
    ONE(BombTimeBar) /* Shape3(2), outline Shape3(3) */ \
    ONE(EnemyHealthBar) /* Shape3(4), outline Shape3(5) */ \
    ONE(TerminalWorkBar) /* Shape3(6), outline Shape3(7) */ \
    MANY(BarOutlines, 4) \
    ONE(HitMarker) /* Shape6 */ \
    \
    ONE(TutorialArea) /* Frame3 */ \
    ONE(HoverLabel) /* Label1 */ \
    ONE(TutorialPanel) /* Frame15 */ \
    ONE(HintLabel) /* Label16 */ \
    ONE(PageLabel) /* Label17 */ \
    ONE(PreviousHint) /* Label19 */ \
    ONE(NextHint) /* Label20 */ \
    ONE(CloseHints) /* Label21 */ \
    \
    ONE(BulletTimeBar) /* Shape11 */ \
    ONE(StageDoneLabel) /* Label2 */ \
    ONE(NoMovesLabel) /* Label5 */ \
    ONE(MissionFailedLabel) /* Label7 */ \
    ONE(ReturnPrompt) /* Label3 */ \
    \
    /* Menu layer */ \
    ONE(MenuLayer) /* Frame5 */ \
    ONE(MainMenuScreen) /* Frame6 */ \
    ONE(PlayButton) /* Command1 "Gra" */ \
    ONE(OptionsButton) /* Command2 "Opcje" */ \
    ONE(ExitButton) /* Command3 "Wyjście" */ \
    ONE(MissionMenuScreen) /* Frame9 */ \
    MANY(MissionButtons, 10) /* Command4(i) */ \
    ONE(MissionMenuBack) /* Command5 */ \
    ONE(BriefingScreen) /* Frame10 */ \
    ONE(BriefingLabel) /* Label12 */ \
    ONE(StartMission) /* Command6 */ \
    ONE(BriefingBack) /* Command8 */ \
    ONE(OptionsScreen) /* Frame14 */ \
    ONE(SoundBox) /* Check1 */ \
    ONE(TutorialBox) /* Check2 */ \
    ONE(ResetButton) /* Command10 */ \
    ONE(OptionsBack) /* Command11 */ \
    ONE(HeroSummary) /* Label14 */ \
    ONE(LevelUpScreen) /* Frame12 */ \
    MANY(LevelUpLabels, 6) /* Label9(0..5): heading, then the five names */ \
    MANY(PlusLabels, 5) /* Label10(r) */ \
    MANY(AttributePips, 10) /* Shape10(k) */ \
    ONE(AttributeDescription) /* Label11 */ \
    ONE(LevelUpOk) /* Command7 */ \
    ONE(MissionCompleteScreen) /* Frame13 */ \
    ONE(MissionCompleteButton) /* Command9 "Wymiatam!" */ \
    \
    /* Hidden picture stores */ \
    MANY(GemPalette, 15) /* Image5(i) */ \
    MANY(EnemyPortraits, 8) /* Image11(i) */ \
    MANY(ObjectPictures, 2) /* Image12(i) */

struct Screen {
    using Control = ui::Control;
#define KRUSZARKA_ONE(name) Control* name = nullptr;
#define KRUSZARKA_MANY(name, count) std::array<Control*, count> name{};
    KRUSZARKA_SCREEN_CONTROLS(KRUSZARKA_ONE, KRUSZARKA_MANY)
#undef KRUSZARKA_ONE
#undef KRUSZARKA_MANY
};

// Builds every control of the window at its design position, size, colours and font, and gives each member of
// the screen its role name; a member the build left unset is a programming error and throws.
void BuildScreen(ui::Form& form, Screen& screen);

}  // namespace kr
