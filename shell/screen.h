#pragma once
#include <array>

#include "ui/form.h"

namespace kr {

// The controls the game's procedures touch, under the names the rules give them.
// Every one is also reachable through the form by its form name ("Label5") and its role ("NoMovesLabel").
struct Screen {
    using Control = ui::Control;

    // Game screen
    Control* HeroPanel = nullptr;         // Frame1
    Control* HeroPortrait = nullptr;      // Image3
    Control* HealthFill = nullptr;        // Shape7(0)
    Control* HealthFrame = nullptr;       // Shape7(1)
    Control* HealthLabel = nullptr;       // Label6
    Control* DamageLabel = nullptr;       // Label4
    Control* HeroShotFrame = nullptr;     // Shape8
    std::array<Control*, 30> ResourceIcons{};  // Image6(0..29)

    Control* SkillPanel = nullptr;        // Frame2
    std::array<Control*, 7> SkillFrames{};     // Frame7(s)
    std::array<Control*, 7> SkillIcons{};      // Image2(s)
    std::array<Control*, 42> CostIcons{};      // Image4(i)
    std::array<Control*, 7> SkillHighlight{};  // Shape2(s)
    std::array<Control*, 2> FiveTimesLabels{}; // Label13(k)

    std::array<Control*, 100> Cells{};    // Image1(i)
    Control* SelectionMarker = nullptr;   // Shape1

    std::array<Control*, 3> GoalPanel{};      // Frame4(i): 0 bomb, 1 enemy, 2 terminal
    std::array<Control*, 3> GoalPicture{};    // Image8, Image9, Image10
    std::array<Control*, 3> RequiredFrame{};  // Shape4(i)
    std::array<Control*, 3> DoneFrame{};      // Shape5(i)
    std::array<Control*, 4> GoalIcons{};      // Image7(k)
    Control* BombWorkBar = nullptr;       // Shape3(0), outline Shape3(1)
    Control* BombTimeBar = nullptr;       // Shape3(2), outline Shape3(3)
    Control* EnemyHealthBar = nullptr;    // Shape3(4), outline Shape3(5)
    Control* TerminalWorkBar = nullptr;   // Shape3(6), outline Shape3(7)
    std::array<Control*, 4> BarOutlines{};
    Control* HitMarker = nullptr;         // Shape6

    Control* TutorialArea = nullptr;      // Frame3
    Control* HoverLabel = nullptr;        // Label1
    Control* TutorialPanel = nullptr;     // Frame15
    Control* HintLabel = nullptr;         // Label16
    Control* PageLabel = nullptr;         // Label17
    Control* PreviousHint = nullptr;      // Label19
    Control* NextHint = nullptr;          // Label20
    Control* CloseHints = nullptr;        // Label21

    Control* BulletTimeBar = nullptr;     // Shape11
    Control* StageDoneLabel = nullptr;    // Label2
    Control* NoMovesLabel = nullptr;      // Label5
    Control* MissionFailedLabel = nullptr;  // Label7
    Control* ReturnPrompt = nullptr;      // Label3

    // Menu layer
    Control* MenuLayer = nullptr;         // Frame5
    Control* MainMenuScreen = nullptr;    // Frame6
    Control* PlayButton = nullptr;        // Command1 "Gra"
    Control* OptionsButton = nullptr;     // Command2 "Opcje"
    Control* ExitButton = nullptr;        // Command3 "Wyjście"
    Control* MissionMenuScreen = nullptr; // Frame9
    std::array<Control*, 10> MissionButtons{};  // Command4(i)
    Control* MissionMenuBack = nullptr;   // Command5
    Control* BriefingScreen = nullptr;    // Frame10
    Control* BriefingLabel = nullptr;     // Label12
    Control* StartMission = nullptr;      // Command6
    Control* BriefingBack = nullptr;      // Command8
    Control* OptionsScreen = nullptr;     // Frame14
    Control* SoundBox = nullptr;          // Check1
    Control* TutorialBox = nullptr;       // Check2
    Control* ResetButton = nullptr;       // Command10
    Control* OptionsBack = nullptr;       // Command11
    Control* HeroSummary = nullptr;       // Label14
    Control* LevelUpScreen = nullptr;     // Frame12
    std::array<Control*, 6> LevelUpLabels{};   // Label9(0..5): heading, then the five names
    std::array<Control*, 5> PlusLabels{};      // Label10(r)
    std::array<Control*, 10> AttributePips{};  // Shape10(k)
    Control* AttributeDescription = nullptr;   // Label11
    Control* LevelUpOk = nullptr;         // Command7
    Control* MissionCompleteScreen = nullptr;  // Frame13
    Control* MissionCompleteButton = nullptr;  // Command9 "Wymiatam!"

    // Hidden picture stores
    std::array<Control*, 15> GemPalette{};     // Image5(i)
    std::array<Control*, 8> EnemyPortraits{};  // Image11(i)
    std::array<Control*, 2> ObjectPictures{};  // Image12(i)
};

// Builds every control of the window at its design position, size, colours and font.
void BuildScreen(ui::Form& form, Screen& screen);

}  // namespace kr
