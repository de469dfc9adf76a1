#pragma once
#include <filesystem>
#include <functional>
#include <sstream>
#include <string>
#include <vector>

#include "shell/game.h"
#include "tools/script.h"

namespace kr::testing {

// A fresh working folder per test, removed afterwards, so progress files never leak between tests.
class TempFolder {
public:
    TempFolder();
    ~TempFolder();
    TempFolder(const TempFolder&) = delete;
    TempFolder& operator=(const TempFolder&) = delete;
    const std::filesystem::path& path() const { return path_; }
    std::filesystem::path File(const char* name) const { return path_ / name; }

private:
    std::filesystem::path path_;
};

std::string ReadFile(const std::filesystem::path& file);
void WriteFile(const std::filesystem::path& file, const std::string& text);

// The game under the headless host and a virtual clock, driven through the scenario language, the
// same entry points a player uses.
class Session {
    TempFolder folder_;
    std::ostringstream out_;
    script::ScriptRunner runner_;

public:
    explicit Session(uint32_t seed = 7, const std::string& progress = " 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n");
    // Starts after `plant` has put whatever it likes into the working folder.
    Session(uint32_t seed, const std::function<void(const TempFolder&)>& plant);

    // Runs scenario lines; returns the runner's exit code (0 unless an expect failed or a line was bad).
    int Run(const std::string& lines);
    void Click(const std::string& target) { Must("click " + target); }
    void Press(const std::string& target) { Must("press " + target); }
    void Press(int cell) { Must("press Image1(" + std::to_string(cell) + ")"); }
    void Key(int code) { Must("key " + std::to_string(code)); }
    void Advance(int ms) { Must("wait " + std::to_string(ms)); }
    // Advances the clock a millisecond at a time until `done` holds, and returns that moment; a test failure
    // when it has not held after `limit` ms.
    int64_t AdvanceUntil(const std::function<bool()>& done, int limit = 20000);
    // Rows 1..8 of the board, "0"-"5" a kind, "g" a green-tipped bullet.
    void SetBoard(const std::string& rows);
    std::string Print(const std::string& name);
    // Output printed so far, and cleared.
    std::string TakeOutput();
    // The sound channels played since the last call.
    std::vector<int> Sounds();

    // Starts mission `index` (0-based) from the main menu and lets the board fill.
    void StartMission(int index);

    const TempFolder& folder() const { return folder_; }
    Game& game;

private:
    void Must(const std::string& line);
};

}  // namespace kr::testing
