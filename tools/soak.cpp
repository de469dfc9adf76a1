#include "tools/soak.h"

#include <fstream>
#include <random>
#include <sstream>
#include <stdexcept>

#include "board/resolve.h"
#include "shell/game.h"
#include "shell/progress.h"
#include "shell/startup.h"
#include "shell/timer_numbers.h"
#include "tools/record.h"
#include "tools/script.h"
#include "tools/soak_invariants.h"
#include "ui/headless.h"

namespace kr::soak {
namespace {

// A broken rule, thrown from wherever it was seen, a timer's tick included.
struct Broken : std::runtime_error {
    using std::runtime_error::runtime_error;
};

constexpr int kEscape = 27, kKeyT = 84, kKeyN = 78;

// The random player and the game it plays, recorded from start-up.
class Player {
public:
    Player(uint32_t seed, const std::filesystem::path& progress, std::string& script)
        : game_(Host{answers_, sound_}, progress),
          recorder_(game_, answers_, [&script](const std::string& lines) { script += lines; }),
          random_(seed ^ 0x9e3779b9u)
    {
        StartUp(game_, seed);
        // Each tick is checked as it ends, so ticks due at the same moment are told apart. The start-up has
        // connected the game's handlers by now: these wrap them.
        for (int timer = 1; timer <= ui::TimerBank::kCount; ++timer) {
            ui::Timer& t = game_.timers[timer];
            t.onTick = [this, inner = std::move(t.onTick)] {
                if (inner) inner();
                Check();
            };
        }
        recorder_.Started(seed);
        Check();
    }

    void Play(uint64_t inputs)
    {
        while (tally_.inputs < inputs) {
            Act();
            Pass();
        }
    }

    Tally Result() const
    {
        Tally t = tally_;
        t.games = 1;
        t.ticks = game_.timers.TicksRun();
        t.gameMs = game_.timers.Now();
        return t;
    }

    const Game& game() const { return game_; }

private:
    int Roll(int below) { return std::uniform_int_distribution<int>(0, below - 1)(random_); }
    template <typename T>
    const T& Pick(const std::vector<T>& items)
    {
        return items[static_cast<size_t>(Roll(static_cast<int>(items.size())))];
    }

    void Check()
    {
        if (std::optional<std::string> broken = invariants_.Check(game_)) throw Broken(*broken);
        const bool menu = game_.screen.MenuLayer->visible, won = game_.screen.MissionCompleteScreen->visible;
        const bool failing = game_.timers[kFailureTimer].Enabled();
        if (menuShown_ && !menu) ++tally_.missionsStarted;
        if (!wonShown_ && won) ++tally_.missionsWon;
        if (!failingSeen_ && failing) ++tally_.missionsFailed;
        menuShown_ = menu;
        wonShown_ = won;
        failingSeen_ = failing;
    }

    void Deliver(const record::Input& input)
    {
        // Time passed since the last tick: the rules see the moment the input arrives, too.
        Check();
        recorder_.Handle(input);
        ++tally_.inputs;
        Check();
    }

    // Somewhere inside the control's visible part, as a player's aim would land.
    std::pair<float, float> Somewhere(const ui::Control& control)
    {
        const ui::Rect r = game_.form.VisibleBounds(control);
        if (r.width < 1 || r.height < 1) return {r.left, r.top};
        return {r.left + static_cast<float>(Roll(static_cast<int>(r.width))),
                r.top + static_cast<float>(Roll(static_cast<int>(r.height)))};
    }

    void Click(const ui::Control& control)
    {
        const auto [x, y] = Somewhere(control);
        Deliver({record::InputKind::Press, x, y});
        Deliver({record::InputKind::Release, x, y});
    }

    void Move(const ui::Control& control)
    {
        const auto [x, y] = Somewhere(control);
        Deliver({record::InputKind::Move, x, y});
    }

    void Key(int code) { Deliver({record::InputKind::Key, 0, 0, code}); }

    void Swap(int16_t from, int16_t to)
    {
        Click(*game_.screen.Cells[static_cast<size_t>(from)]);
        Click(*game_.screen.Cells[static_cast<size_t>(to)]);
    }

    void Act()
    {
        if (game_.screen.MenuLayer->visible) {
            Menu();
            return;
        }
        const Screen& s = game_.screen;
        const int roll = Roll(100);
        if (roll < 60) {
            const auto swaps = MatchingSwaps(game_.Board);
            if (!swaps.empty()) {
                // A player sees the green outline of a cell left selected and lets go of it first.
                if (s.SelectionMarker->visible && game_.SelectedCell > 0 && Roll(10))
                    Click(*s.Cells[static_cast<size_t>(game_.SelectedCell)]);
                const auto [from, to] = Pick(swaps);
                Swap(from, to);
                return;
            }
        }
        // Swaps that line up nothing cost a third of the health: rare enough that missions get won.
        if (roll < 63) {
            const int16_t from = static_cast<int16_t>(11 + 10 * Roll(8) + Roll(8));
            const int16_t to = static_cast<int16_t>(from + (Roll(2) ? 1 : 10));
            Swap(from, to);
        } else if (roll < 68) {
            Click(*s.Cells[static_cast<size_t>(Roll(100))]);
        } else if (roll < 76) {
            const int which = Roll(3);
            const ui::Control* skill = which == 0   ? s.SkillFrames[static_cast<size_t>(Roll(7))]
                                       : which == 1 ? s.SkillIcons[static_cast<size_t>(Roll(7))]
                                                    : s.CostIcons[static_cast<size_t>(Roll(42))];
            Click(*skill);
            // A targeting skill waits for its board press.
            if (Roll(2)) Click(*s.Cells[static_cast<size_t>(11 + 10 * Roll(8) + Roll(8))]);
        } else if (roll < 80) {
            const int key = Roll(10);
            Key(key < 5 ? kEscape : key < 9 ? kKeyN : kKeyT);
        } else if (roll < 92) {
            Move(*Pick(game_.form.All()));
        } else {
            const float x = static_cast<float>(Roll(8640)), y = static_cast<float>(Roll(6705));
            Deliver({record::InputKind::Press, x, y});
            Deliver({record::InputKind::Release, x, y});
        }
    }

    // Mostly on towards a mission; now and then anything the menus offer, the way out excepted.
    void Menu()
    {
        const Screen& s = game_.screen;
        std::vector<const ui::Control*> offered;
        for (const auto& c : game_.form.All()) {
            if (c.get() == s.ExitButton || !game_.form.Shown(*c) || !c->enabled) continue;
            if (!c->onClick && c->kind != ui::ControlKind::CheckBox) continue;
            const ui::Rect b = game_.form.Bounds(*c);
            if (game_.form.HitTest(b.left + b.width / 2, b.top + b.height / 2) == c.get()) offered.push_back(c.get());
        }
        const ui::Control* choice = nullptr;
        if (Roll(10) < 7) {
            if (s.MissionMenuScreen->visible) {
                std::vector<const ui::Control*> open;
                for (const ui::Control* b : s.MissionButtons)
                    if (b->enabled) open.push_back(b);
                if (!open.empty()) choice = Pick(open);
            } else if (s.BriefingScreen->visible) {
                choice = s.StartMission;
            } else if (s.MainMenuScreen->visible) {
                choice = s.PlayButton;
            } else if (s.MissionCompleteScreen->visible) {
                choice = s.MissionCompleteButton;
            } else if (s.OptionsScreen->visible) {
                choice = s.OptionsBack;
            }
        }
        if (!choice && !offered.empty()) choice = Pick(offered);
        if (!choice) return Key(kKeyT);
        if (choice == s.ResetButton)
            messages_.Queue(Roll(2) ? ui::ScriptedMessages::Answer::Yes : ui::ScriptedMessages::Answer::No);
        Click(*choice);
    }

    bool Responsive() const
    {
        return game_.screen.MenuLayer->visible || game_.InputReady;
    }

    void Pass()
    {
        const int roll = Roll(100);
        if (roll < 15) return;
        if (roll < 40) {
            game_.timers.Advance(Roll(1500));
        } else if (roll < 50) {
            // Long enough for a bomb to go off and for the hints to turn.
            game_.timers.Advance(3000 + Roll(30000));
        } else {
            while (!Responsive()) {
                const std::optional<int64_t> next = game_.timers.NextDue();
                if (!next) throw Broken("no input, no menu and no timer running");
                game_.timers.AdvanceTo(*next);
            }
        }
    }

    ui::ScriptedMessages messages_;
    record::AnswerLog answers_{messages_};
    ui::RecordedSound sound_;
    Game game_;
    Invariants invariants_;
    record::Recorder recorder_;
    std::mt19937 random_;
    Tally tally_;
    bool menuShown_ = true, wonShown_ = false, failingSeen_ = false;
};

// Half the games start from a first start, the others from a progress file of random missions and points.
void PrepareProgress(uint32_t seed, const std::filesystem::path& progress)
{
    std::mt19937 random(seed);
    auto roll = [&](int below) {
        return static_cast<int16_t>(std::uniform_int_distribution<int>(0, below - 1)(random));
    };
    if (roll(2)) return;
    const Progress p{static_cast<int16_t>(1 + roll(11)), roll(2), roll(3), roll(3), roll(3), roll(3), roll(3), roll(2)};
    std::ofstream(progress, std::ios::binary) << FormatProgress(p);
}

std::optional<std::string> ReplayDiffers(const std::string& script, const std::string& expected,
                                         const std::filesystem::path& folder)
{
    std::filesystem::create_directories(folder);
    std::ostringstream out;
    script::ScriptRunner runner(out, 0, {}, folder / "config.cfg");
    std::istringstream in(script);
    const int code = runner.Run(in);
    if (code != 0) return "the recording does not replay (exit " + std::to_string(code) + "): " + out.str();
    const std::string replayed = record::Snapshot(runner.game());
    if (replayed != expected) return "the replay ends elsewhere:\n" + expected + "--- replayed ---\n" + replayed;
    return std::nullopt;
}

}  // namespace

std::vector<std::pair<int16_t, int16_t>> MatchingSwaps(const BoardCells& board)
{
    static const std::array<bool, 100> kNoGreens{};
    std::vector<std::pair<int16_t, int16_t>> swaps;
    for (int16_t cell = 11; cell <= 88; ++cell) {
        for (const int16_t step : {int16_t{1}, int16_t{10}}) {
            const int16_t other = static_cast<int16_t>(cell + step);
            if (!IsPlayable(cell) || !IsPlayable(other)) continue;
            BoardCells swapped = board;
            std::swap(swapped[static_cast<size_t>(cell)], swapped[static_cast<size_t>(other)]);
            if (!FindRuns(swapped, kNoGreens).empty()) swaps.emplace_back(cell, other);
        }
    }
    return swaps;
}

void Tally::Add(const Tally& other)
{
    games += other.games;
    inputs += other.inputs;
    ticks += other.ticks;
    gameMs += other.gameMs;
    missionsStarted += other.missionsStarted;
    missionsWon += other.missionsWon;
    missionsFailed += other.missionsFailed;
}

Outcome SoakGame(uint32_t seed, uint64_t inputs, const std::filesystem::path& folder)
{
    Outcome outcome;
    std::filesystem::create_directories(folder / "played");
    PrepareProgress(seed, folder / "played" / "config.cfg");
    std::string snapshot;
    {
        Player player(seed, folder / "played" / "config.cfg", outcome.script);
        try {
            player.Play(inputs);
        } catch (const Broken& broken) {
            outcome.failure = broken.what();
        } catch (const std::exception& error) {
            outcome.failure = std::string("the game threw: ") + error.what();
        }
        outcome.tally = player.Result();
        snapshot = record::Snapshot(player.game());
    }
    if (!outcome.failure) outcome.failure = ReplayDiffers(outcome.script, snapshot, folder / "replayed");
    std::error_code ignored;
    std::filesystem::remove_all(folder / "played", ignored);
    std::filesystem::remove_all(folder / "replayed", ignored);
    return outcome;
}

}  // namespace kr::soak
