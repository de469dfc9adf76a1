#pragma once
#include <array>
#include <cstdint>
#include <filesystem>
#include <string>

#include "shell/random.h"
#include "shell/screen.h"
#include "ui/form.h"
#include "ui/host.h"
#include "ui/timers.h"

namespace kr {

// The host services the game needs besides its window and timers.
struct Host {
    ui::MessageBoxes& messages;
    ui::SoundChannels& sound;
};

// The one game object: every piece of state the rules name, the window's controls, its timers and the one
// random generator. It is plain state: procedures live with their subsystem, and the start-up connects them
// to the controls and timers.
class Game {
public:
    explicit Game(Host host, std::filesystem::path progressFile = "config.cfg");
    Game(const Game&) = delete;
    Game& operator=(const Game&) = delete;

    ui::Form form;
    ui::TimerBank timers;
    Screen screen;
    Random random;
    Host host;
    std::filesystem::path progressFile;
    // Why config.cfg could not be read at start-up; while set, the next save first moves that file aside.
    std::string progressUnreadable;
    // Set by "Wyjście": the host ends the program at once.
    bool quitRequested = false;

    // Board
    std::array<int16_t, 100> Board{};
    std::array<bool, 100> GreenFlag{};
    int16_t FillCounter = 0;
    bool InputReady = false;
    int16_t SelectedCell = 0;
    int16_t SwapFrom = 0;
    int16_t SwapTo = 0;
    bool SwapUnmatched = false;
    bool TeleportPending = false;
    bool BlastPending = false;
    // A grenade paid for and not yet thrown: the next board press throws it.
    bool GrenadePending = false;

    // Hero (attributes in their storage order)
    int16_t Strength = 0;
    int16_t Intelligence = 0;
    int16_t Dexterity = 0;
    int16_t Endurance = 0;
    int16_t Accuracy = 0;
    int16_t Health = 0;
    int16_t MaxHealth = 0;
    std::array<int16_t, 6> Resources{};
    // Entry = resource row x 7 + skill index.
    std::array<int16_t, 35> SkillCost{};
    int16_t DeadlyBulletsTurns = 0;
    int16_t ImmobilisedTurns = 0;
    bool EnemyAttackToggle = false;

    // Goals of the stage
    bool BombPresent = false;
    bool BombRequired = false;
    int16_t BombWork = 0;
    int16_t BombTicks = 0;
    bool EnemyPresent = false;
    bool EnemyRequired = false;
    int16_t EnemyHealth = 0;
    int16_t EnemyAttack = 0;
    int16_t EnemyHitChance = 0;
    bool TerminalPresent = false;
    bool TerminalRequired = false;
    int16_t TerminalWork = 0;

    // Shell
    int16_t UnlockedMissions = 0;
    int16_t SoundOn = 0;     // 1 on, anything else off
    int16_t TutorialOn = 0;  // 1 on, anything else off
    int16_t TutorialPage = 0;
    std::array<std::string, 15> TutorialTexts;  // pages 1..14
    int16_t ChosenMission = 0;
    int16_t MissionStage = 0;
    std::string BriefingText;
};

}  // namespace kr
