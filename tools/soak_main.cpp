#include <unistd.h>

#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <iostream>
#include <optional>
#include <string>

#include "tools/soak.h"

// kruszarka-soak [--seed N] [--games N] [--inputs N] [--seconds S]: random games, each checked after every
// input and tick and then replayed from its recording. Stops at the first broken rule, printing the seed
// and the script that reproduces it, and exits 1. With --seconds it plays games until the time is up.
int main(int argc, char** argv)
{
    using namespace kr;
    uint32_t seed = static_cast<uint32_t>(std::chrono::system_clock::now().time_since_epoch().count());
    uint64_t games = 10, inputs = 2000;
    std::optional<double> seconds;
    for (int i = 1; i < argc; ++i) {
        const std::string option = argv[i];
        if (i + 1 >= argc) {
            std::cerr << "usage: kruszarka-soak [--seed N] [--games N] [--inputs N] [--seconds S]\n";
            return 2;
        }
        const char* value = argv[++i];
        if (option == "--seed") seed = static_cast<uint32_t>(std::strtoul(value, nullptr, 10));
        else if (option == "--games") games = std::strtoull(value, nullptr, 10);
        else if (option == "--inputs") inputs = std::strtoull(value, nullptr, 10);
        else if (option == "--seconds") seconds = std::strtod(value, nullptr);
        else {
            std::cerr << "kruszarka-soak: unknown option " << option << '\n';
            return 2;
        }
    }
    const std::filesystem::path folder =
        std::filesystem::temp_directory_path() / ("kruszarka-soak-" + std::to_string(::getpid()));
    const auto start = std::chrono::steady_clock::now();
    auto elapsed = [&] { return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count(); };
    soak::Tally total;
    int code = 0;
    for (uint64_t game = 0; seconds ? elapsed() < *seconds : game < games; ++game) {
        const uint32_t gameSeed = seed + static_cast<uint32_t>(game);
        const soak::Outcome outcome = soak::SoakGame(gameSeed, inputs, folder);
        total.Add(outcome.tally);
        if (outcome.failure) {
            std::cout << "soak failed: seed " << gameSeed << ", " << outcome.tally.inputs << " inputs, game time "
                      << outcome.tally.gameMs << " ms: " << *outcome.failure << "\n--- the game as recorded ---\n"
                      << outcome.script << "--- end ---\n";
            code = 1;
            break;
        }
    }
    std::filesystem::remove_all(folder);
    std::printf("%llu games from seed %u: %llu inputs, %llu ticks, %.1f h of game time; missions %llu started, "
                "%llu won, %llu failed; %.1f s\n",
                static_cast<unsigned long long>(total.games), seed, static_cast<unsigned long long>(total.inputs),
                static_cast<unsigned long long>(total.ticks), static_cast<double>(total.gameMs) / 3.6e6,
                static_cast<unsigned long long>(total.missionsStarted),
                static_cast<unsigned long long>(total.missionsWon),
                static_cast<unsigned long long>(total.missionsFailed), elapsed());
    return code;
}
