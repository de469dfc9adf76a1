// kruszarka-selfplay: a careful player plays every mission many times under the virtual clock, once as a fresh
// hero and once with one attribute point per mission already won, and prints per mission the win rate, the
// median number of moves, how the games were lost, and the missions simulated per second.
//
//   kruszarka-selfplay [--games N]   (N games per mission and hero, default 100)
#include <stdlib.h>

#include <algorithm>
#include <array>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <string>
#include <system_error>
#include <vector>

#include "shell/game.h"
#include "shell/startup.h"
#include "tools/autoplay.h"
#include "ui/headless.h"

namespace {

using kr::Ending;

// The order a sensible player spends points in: accuracy and endurance first (every bullet run hits harder,
// every mission gives more health), then strength for the skills, dexterity, intelligence.
constexpr std::array<int16_t kr::Game::*, 10> kPointOrder{
    &kr::Game::Accuracy, &kr::Game::Endurance, &kr::Game::Accuracy,     &kr::Game::Endurance,    &kr::Game::Strength,
    &kr::Game::Dexterity, &kr::Game::Strength, &kr::Game::Intelligence, &kr::Game::Dexterity, &kr::Game::Intelligence};

struct Tally {
    int games = 0;
    std::array<int, 4> endings{};  // by Ending
    std::vector<int> moves;
    int skills = 0;

    double Percent(Ending ending) const { return 100.0 * endings[static_cast<size_t>(ending)] / games; }
    int MedianMoves()
    {
        std::sort(moves.begin(), moves.end());
        return moves.empty() ? 0 : moves[moves.size() / 2];
    }
};

// A folder of its own for each run: the player never saves, and no stray progress file can join in.
std::filesystem::path FreshFolder()
{
    std::string pattern = (std::filesystem::temp_directory_path() / "kruszarka-selfplay-XXXXXX").string();
    if (!mkdtemp(pattern.data())) {
        std::perror("kruszarka-selfplay: mkdtemp");
        std::exit(1);
    }
    return pattern;
}

Tally PlayMany(int mission, int games, int points, const std::filesystem::path& progress)
{
    Tally tally;
    for (int game = 0; game < games; ++game) {
        kr::ui::ScriptedMessages messages;
        kr::ui::RecordedSound sound;
        kr::Game g{kr::Host{messages, sound}, progress};
        kr::StartUp(g, static_cast<uint32_t>(mission * 100003 + game * 7 + points));
        // The mission is open, and so is every skill it brings; the points go where a sensible player puts them.
        g.UnlockedMissions = static_cast<int16_t>(mission + 1);
        for (int point = 0; point < points; ++point) ++(g.*kPointOrder[static_cast<size_t>(point)]);
        const kr::MissionResult result = kr::PlayMission(g, mission);
        ++tally.games;
        ++tally.endings[static_cast<size_t>(result.ending)];
        tally.moves.push_back(result.moves);
        tally.skills += result.skills;
    }
    return tally;
}

void PrintRow(Tally& t)
{
    std::printf(" %5.0f%% %6d %6.1f %5.0f%% %5.0f%% %5.0f%% |", t.Percent(Ending::Won), t.MedianMoves(),
                static_cast<double>(t.skills) / t.games, t.Percent(Ending::EnemyFire), t.Percent(Ending::Bomb),
                t.Percent(Ending::NoTime));
}

}  // namespace

int main(int argc, char** argv)
{
    int games = 100;
    for (int i = 1; i + 1 < argc; ++i)
        if (std::strcmp(argv[i], "--games") == 0) games = std::max(1, std::atoi(argv[i + 1]));

    const std::filesystem::path folder = FreshFolder();
    const std::filesystem::path progress = folder / "config.cfg";

    std::printf("%-9s|%-45s|%-45s\n", "", " fresh hero", " one point per mission won");
    std::printf("%-9s|", "mission");
    for (int hero = 0; hero < 2; ++hero)
        std::printf(" %6s %6s %6s %6s %6s %6s |", "won", "moves", "skills", "shot", "bomb", "time");
    std::printf("\n");
    int total = 0;
    const auto start = std::chrono::steady_clock::now();
    for (int mission = 0; mission < 10; ++mission) {
        std::printf("Misja %-3d|", mission + 1);
        for (int points : {0, mission}) {
            Tally tally = PlayMany(mission, games, points, progress);
            PrintRow(tally);
            total += tally.games;
        }
        std::printf("\n");
        std::fflush(stdout);
    }
    const double seconds = std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
    std::printf("\nwon: games won; moves: median moves (swaps and board targets); skills: skills used per game;\n"
                "shot, bomb, time: games lost to enemy fire, to the bomb, and unfinished after an hour of game time\n");
    std::printf("%d missions in %.2f s: %.0f missions simulated per second\n", total, seconds, total / seconds);
    std::error_code ignored;
    std::filesystem::remove_all(folder, ignored);
    return 0;
}
