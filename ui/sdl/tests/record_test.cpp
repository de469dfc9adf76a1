#include <gtest/gtest.h>

#include <unistd.h>

#include <atomic>
#include <filesystem>
#include <fstream>
#include <sstream>

#include "board/resolve.h"
#include "shell/game.h"
#include "shell/startup.h"
#include "tools/record.h"
#include "tools/script.h"
#include "tools/soak.h"
#include "ui/sdl/form_renderer.h"
#include "ui/sdl/game_window.h"
#include "ui/sdl/tests/offscreen.h"

namespace kr::sdl {
namespace {

namespace fs = std::filesystem;
using testing::OffscreenVideo;
using testing::SourceAssets;

// The real window with its input written down, driven by SDL events and a clock of our own; the recording
// is then replayed by the scenario runner in an empty folder.
class RecordedGame : public ::testing::Test {
protected:
    RecordedGame()
    {
        static std::atomic<int> count{0};
        folder = fs::temp_directory_path() /
                 ("kruszarka-record-test-" + std::to_string(::getpid()) + "-" + std::to_string(count++));
        fs::create_directories(folder / "played");
        fs::create_directories(folder / "replayed");
    }
    ~RecordedGame() override
    {
        window.reset();
        recorder.reset();
        game.reset();
        std::error_code ignored;
        fs::remove_all(folder, ignored);
    }

    void Start(uint32_t seed)
    {
        game = std::make_unique<Game>(Host{answers, sound}, folder / "played" / "config.cfg");
        window = std::make_unique<GameWindow>(*game, SourceAssets(), 1);
        StartUp(*game, seed);
        recorder.emplace(*game, answers, [this](const std::string& lines) { script += lines; });
        recorder->Started(seed);
        window->Record(&*recorder);
        window->Tick(clock);
    }

    // Real time passing in uneven steps, the way the loop sees it.
    void Pass(double milliseconds)
    {
        for (const double end = clock + milliseconds; clock < end;) {
            clock = std::min(clock + 16.7, end);
            window->Tick(clock);
        }
    }

    // Time passes until the board takes input again or a menu shows.
    void Settle()
    {
        for (int step = 0; step < 2000 && !(game->InputReady || game->screen.MenuLayer->visible); ++step) Pass(16.7);
        ASSERT_TRUE(game->InputReady || game->screen.MenuLayer->visible);
    }

    // An event wakes the loop a little after the last tick, as the real loop meets it.
    void Arrive()
    {
        clock += 3.3;
        window->InputArrives(clock);
    }

    void Mouse(Uint32 type, SDL_Point at, Uint8 button = SDL_BUTTON_LEFT)
    {
        Arrive();
        SDL_Event event{};
        event.type = type;
        if (type == SDL_MOUSEMOTION) {
            event.motion.x = at.x;
            event.motion.y = at.y;
        } else {
            event.button.button = button;
            event.button.x = at.x;
            event.button.y = at.y;
        }
        ASSERT_TRUE(window->Handle(event));
    }

    static SDL_Point Centre(const ui::Form& form, const ui::Control& control)
    {
        const PixelRect rect = ToPixels(form.Bounds(control));
        return {rect.x + rect.w / 2, rect.y + rect.h / 2};
    }

    // A press and a release over the control, a few milliseconds apart.
    void Click(const ui::Control& control, Uint8 button = SDL_BUTTON_LEFT)
    {
        const SDL_Point at = Centre(game->form, control);
        Mouse(SDL_MOUSEMOTION, at);
        Mouse(SDL_MOUSEBUTTONDOWN, at, button);
        Pass(40);
        Mouse(SDL_MOUSEBUTTONUP, at, button);
    }

    void Key(SDL_Keycode key)
    {
        Arrive();
        SDL_Event event{};
        event.type = SDL_KEYDOWN;
        event.key.keysym.sym = key;
        ASSERT_TRUE(window->Handle(event));
    }

    void Swap(int16_t from, int16_t to)
    {
        Click(*game->screen.Cells[static_cast<size_t>(from)]);
        Pass(90);
        Click(*game->screen.Cells[static_cast<size_t>(to)]);
    }

    // The recording, closed as the game ends, replayed headless from an empty folder; what the replay ends in.
    std::string Replayed()
    {
        window->Record(nullptr);
        recorder.reset();
        std::ostringstream out;
        script::ScriptRunner runner(out, 0, {}, folder / "replayed" / "config.cfg");
        std::istringstream in(script);
        EXPECT_EQ(runner.Run(in), 0) << out.str();
        return record::Snapshot(runner.game());
    }

    OffscreenVideo video;
    fs::path folder;
    ui::ScriptedMessages messages;
    record::AnswerLog answers{messages};
    ui::RecordedSound sound;
    std::unique_ptr<Game> game;
    std::optional<record::Recorder> recorder;
    std::unique_ptr<GameWindow> window;
    std::string script;
    double clock = 0;
};

TEST_F(RecordedGame, AFailedMissionReplaysToTheSameState)
{
    Start(2024);
    Pass(500);
    const Screen& s = game->screen;
    Click(*s.OptionsButton);
    Click(*s.SoundBox);
    messages.Queue(ui::ScriptedMessages::Answer::No);
    Click(*s.ResetButton);
    Click(*s.OptionsBack);
    Click(*s.PlayButton);
    Click(*s.MissionButtons[0]);
    Pass(800);
    Click(*s.StartMission);
    Settle();
    Key(SDLK_ESCAPE);
    Pass(300);
    Key(SDLK_n);
    Mouse(SDL_MOUSEMOTION, {5, 440});
    Click(*s.Cells[0]);
    // Any button selects a cell; pressing it again lets go of it.
    Click(*s.Cells[45], SDL_BUTTON_RIGHT);
    Pass(1000);
    Click(*s.Cells[45]);
    // Swaps that line up nothing: each costs a third of the health, the third one the mission.
    for (int lost = 0; lost < 3; ++lost) {
        Settle();
        const auto matching = soak::MatchingSwaps(game->Board);
        int16_t from = 11;
        while (std::find(matching.begin(), matching.end(), std::pair<int16_t, int16_t>{from, int16_t(from + 1)}) !=
               matching.end())
            ++from;
        Swap(from, static_cast<int16_t>(from + 1));
        Pass(700);
    }
    Pass(8000);
    ASSERT_TRUE(s.MissionMenuScreen->visible) << "the mission was lost\n" << script;
    EXPECT_EQ(game->SoundOn, 1);

    const std::string played = record::Snapshot(*game);
    EXPECT_EQ(Replayed(), played) << script;
    // The answer goes ahead of the click that raised its box; an empty folder's replay answers its own box.
    EXPECT_NE(script.find("answer ok\nstart\n"), std::string::npos) << script;
    EXPECT_NE(script.find("answer no\nwait 50\nclick Command10"), std::string::npos) << script;
    EXPECT_NE(script.find("key 27\nwait 303\nkey 78\n"), std::string::npos) << script;
}

TEST_F(RecordedGame, ACompletedMissionReplaysToTheSameState)
{
    fs::remove(folder / "played" / "config.cfg");
    std::ofstream(folder / "played" / "config.cfg") << " 1 \r\n 0 \r\n 0 \r\n 0 \r\n 1 \r\n 0 \r\n 0 \r\n 0 \r\n";
    Start(77);
    const Screen& s = game->screen;
    Click(*s.PlayButton);
    Click(*s.MissionButtons[0]);
    Click(*s.StartMission);
    for (int move = 0; move < 400 && !s.MissionCompleteScreen->visible; ++move) {
        Settle();
        if (s.MenuLayer->visible) break;
        const auto matching = soak::MatchingSwaps(game->Board);
        ASSERT_FALSE(matching.empty());
        Swap(matching.front().first, matching.front().second);
        Pass(250);
    }
    ASSERT_TRUE(s.MissionCompleteScreen->visible) << "the mission was won";
    Click(*s.MissionCompleteButton);
    Click(*s.PlusLabels[0]);
    Click(*s.LevelUpOk);
    Pass(500);
    EXPECT_EQ(game->UnlockedMissions, 2);
    EXPECT_TRUE(s.MissionMenuScreen->visible);

    const std::string played = record::Snapshot(*game);
    EXPECT_EQ(Replayed(), played) << script;
    EXPECT_EQ(script.find("answer"), std::string::npos) << "no box at a start with a progress file";
    EXPECT_NE(script.find("set Dexterity 1\n"), std::string::npos) << "the progress read travels with the script";
}

}  // namespace
}  // namespace kr::sdl
