// kruszarka-selfplay: a simple player (the first swap that lines up a run) plays every mission many times under
// the virtual clock. Prints missions simulated per second and the win rate per mission.
//
//   kruszarka-selfplay [--games N]   (N games per mission, default 200)
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>

#include "shell/game.h"
#include "shell/startup.h"
#include "tools/autoplay.h"
#include "ui/headless.h"

int main(int argc, char** argv)
{
    using namespace kr;
    int games = 200;
    for (int i = 1; i + 1 < argc; ++i)
        if (std::strcmp(argv[i], "--games") == 0) games = std::max(1, std::atoi(argv[i + 1]));

    // The player never saves: a throw-away progress file with every mission open.
    const std::filesystem::path folder = std::filesystem::temp_directory_path() / "kruszarka-selfplay";
    std::filesystem::create_directories(folder);
    const std::filesystem::path progress = folder / "config.cfg";

    std::printf("%-10s %8s %9s %12s %14s\n", "mission", "games", "win rate", "avg moves", "avg game time");
    int total = 0;
    const auto start = std::chrono::steady_clock::now();
    for (int mission = 0; mission < 10; ++mission) {
        int wins = 0;
        long moves = 0;
        long long virtualMs = 0;
        for (int game = 0; game < games; ++game) {
            ui::ScriptedMessages messages;
            ui::RecordedSound sound;
            Game g{Host{messages, sound}, progress};
            StartUp(g, static_cast<uint32_t>(mission * 100003 + game));
            g.UnlockedMissions = 11;
            const MissionResult result = PlayMission(g, mission);
            wins += result.won;
            moves += result.moves;
            virtualMs += result.milliseconds;
            ++total;
        }
        std::printf("Misja %-4d %8d %8.1f%% %12.1f %12.1f s\n", mission + 1, games, 100.0 * wins / games,
                    static_cast<double>(moves) / games, static_cast<double>(virtualMs) / games / 1000.0);
    }
    const double seconds = std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
    std::printf("\n%d missions in %.2f s: %.0f missions simulated per second\n", total, seconds, total / seconds);
    std::filesystem::remove_all(folder);
    return 0;
}
