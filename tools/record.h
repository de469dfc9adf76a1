#pragma once
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "ui/form.h"
#include "ui/host.h"

namespace kr {

class Game;

namespace record {

enum class InputKind { Press, Release, Move, Key };

// One input as the window hands it to the game: a point in window twips, or a key code.
struct Input {
    InputKind kind = InputKind::Press;
    float x = 0, y = 0;
    int key = 0;
    bool shift = false;  // keys: Shift held down
};

// What a replay must reproduce: the board as `dump` prints it, the clock, the ticks run since start-up,
// the hero, the goals, the progress and which screens show, one "NAME = VALUE" a line.
std::string Snapshot(const Game& g);

// Hands one input to the form, as the window's events do.
void Deliver(ui::Form& form, const Input& input);

// Message boxes that remember how each was answered ("ok", "yes", "no") for the recorder.
class AnswerLog final : public ui::MessageBoxes {
public:
    explicit AnswerLog(ui::MessageBoxes& boxes) : boxes_(boxes) {}
    void ShowOk(const std::string& text) override;
    bool AskYesNo(const std::string& title, const std::string& text) override;
    // The answers given since the last call, oldest first.
    std::vector<std::string> Take();

private:
    ui::MessageBoxes& boxes_;
    std::vector<std::string> answers_;
};

// Writes down a game as a script of the scenario language, so that the runner replays it tick for tick:
// the seed, the progress read at start-up, and every input that reached a handler, each after a wait of
// the game time since the one before. Every input must reach the game through Handle.
class Recorder {
public:
    // Receives the script a few lines at a time, as the game goes on.
    using Sink = std::function<void(const std::string& lines)>;

    // The game's message boxes must be `answers`.
    Recorder(Game& game, AnswerLog& answers, Sink sink);
    Recorder(const Recorder&) = delete;
    Recorder& operator=(const Recorder&) = delete;
    // Writes the time since the last input, so the replay ends at the same moment, also after an error.
    ~Recorder();

    // After StartUp: the seed, the answers start-up needed and the progress it read.
    void Started(uint32_t seed);
    // Delivers the input, and writes it down when it ran one of the game's handlers.
    void Handle(const Input& input);

private:
    // The control by its form name when the runner's aim at its centre finds it, else the point itself.
    std::string Target(const ui::Control& control, const Input& input) const;
    std::optional<std::string> LineFor(const Input& input);
    void Write(const std::string& line);

    Game& game_;
    AnswerLog& answers_;
    Sink sink_;
    int64_t written_ = 0;  // game time of the last line written
    const ui::Control* pressed_ = nullptr;  // as the form keeps it, to tell a click
    std::optional<const ui::Control*> under_;  // under the pointer at the last move; nullptr is the background
};

}  // namespace record
}  // namespace kr
