#pragma once
#include <cstdint>
#include <filesystem>
#include <functional>
#include <istream>
#include <memory>
#include <optional>
#include <ostream>
#include <string>
#include <utility>

#include "shell/game.h"
#include "ui/headless.h"

namespace kr::script {

// Writes a PNG of the window as a player would see it; false when it could not.
using ScreenshotWriter = std::function<bool(const Game&, const std::string& file)>;

// The 10 x 10 board as `dump` prints it: `#` border, `.` cleared, digits, `g` green-tipped, one row a line.
std::string DumpBoard(const Game& g);

// The scenario language: drives the real game headless under a virtual clock.
// Exit codes: 0 at the end, 1 at the first failed expect, 2 on a line it cannot understand.
class ScriptRunner {
public:
    ScriptRunner(std::ostream& out, uint32_t clockSeed, ScreenshotWriter screenshot = {},
                 std::filesystem::path progressFile = "config.cfg");

    int Run(std::istream& in);

    Game& game() { return *game_; }

private:
    // Runs one line; returns an exit code when the script must stop there.
    std::optional<int> Execute(const std::string& line, std::istream& in);
    void Deliver(const std::string& verb, const std::string& target);
    // The window point a target names: a control's centre, or "@X,Y" in twips.
    std::pair<float, float> Aim(const std::string& target) const;
    std::string Print(const std::string& name) const;
    void SetBoard(std::istream& in);
    void Dump();

    std::ostream& out_;
    uint32_t seed_;
    ScreenshotWriter screenshot_;
    ui::ScriptedMessages messages_;
    ui::RecordedSound sound_;
    std::unique_ptr<Game> game_;
    int lineNumber_ = 0;
    size_t soundsReported_ = 0;
};

}  // namespace kr::script
