#include <gtest/gtest.h>

#include <utility>

#include "combat/stage.h"
#include "shell/game.h"
#include "shell/texts.h"
#include "shell/timer_numbers.h"
#include "ui/sdl/game_window.h"
#include "ui/sdl/screenshot.h"
#include "ui/sdl/tests/offscreen.h"

namespace kr::sdl {
namespace {

using testing::HeadlessGame;
using testing::OffscreenVideo;
using testing::PixelAt;
using testing::SourceAssets;

SDL_Event MouseButton(Uint32 type, SDL_Point at)
{
    SDL_Event event{};
    event.type = type;
    event.button.button = SDL_BUTTON_LEFT;
    event.button.x = at.x;
    event.button.y = at.y;
    return event;
}

SDL_Event Key(SDL_Keycode key, Uint16 modifiers = KMOD_NONE)
{
    SDL_Event event{};
    event.type = SDL_KEYDOWN;
    event.key.keysym.sym = key;
    event.key.keysym.mod = modifiers;
    return event;
}

// Clicks as SDL reports them: window pixels, a press and a release.
bool Click(GameWindow& window, const HeadlessGame& session, const std::string& caption)
{
    const SDL_Point at = session.Centre(caption);
    return window.Handle(MouseButton(SDL_MOUSEBUTTONDOWN, at)) && window.Handle(MouseButton(SDL_MOUSEBUTTONUP, at));
}

class GameWindowTest : public ::testing::Test {
protected:
    OffscreenVideo video;
    HeadlessGame session;
    Game& game = *session.game;
    GameWindow window{game, SourceAssets(), 1};
    double clock = 0;

    // Real time passing in small steps, the way the loop sees it.
    void Pass(double milliseconds)
    {
        for (double end = clock + milliseconds; clock < end;) {
            clock = std::min(clock + 20, end);
            window.Tick(clock);
            window.Redraw();
        }
    }
};

TEST_F(GameWindowTest, PlaysFromTheMenuIntoAMissionAndBack)
{
    window.Tick(clock);
    EXPECT_TRUE(window.Redraw());
    EXPECT_FALSE(window.Redraw()) << "nothing changed";
    EXPECT_EQ(window.FramesPresented(), 1u);

    ASSERT_TRUE(Click(window, session, "Gra"));
    EXPECT_TRUE(game.screen.MissionMenuScreen->visible);
    EXPECT_FALSE(game.screen.MainMenuScreen->visible);
    EXPECT_TRUE(window.Redraw());

    // A press with the right button is no click.
    const SDL_Point mission = session.Centre("Misja 1");
    SDL_Event right = MouseButton(SDL_MOUSEBUTTONDOWN, mission);
    right.button.button = SDL_BUTTON_RIGHT;
    window.Handle(right);
    right.type = SDL_MOUSEBUTTONUP;
    window.Handle(right);
    EXPECT_TRUE(game.screen.MissionMenuScreen->visible);

    ASSERT_TRUE(Click(window, session, "Misja 1"));
    EXPECT_TRUE(game.screen.BriefingScreen->visible);
    ASSERT_TRUE(Click(window, session, "Rozpocznij misję ->"));
    EXPECT_FALSE(game.screen.MenuLayer->visible);

    const uint64_t framesBefore = window.FramesPresented();
    Pass(3000);
    EXPECT_GE(game.timers.Now(), 3000);
    for (int row = 1; row <= 8; ++row)
        for (int column = 1; column <= 8; ++column) {
            const ui::PictureRef gem = game.screen.Cells[static_cast<size_t>(row * 10 + column)]->picture;
            EXPECT_EQ(gem.set, ui::PictureSet::Palette) << row << column;
            EXPECT_NE(gem.index, 10) << "cell " << row << column << " is still empty";
        }
    EXPECT_GT(window.FramesPresented(), framesBefore + 10) << "the fill is animated";

    // Keys arrive as the game's codes: Escape asks, N declines, T leaves.
    window.Handle(Key(SDLK_ESCAPE));
    EXPECT_TRUE(game.screen.ReturnPrompt->visible);
    window.Handle(Key(SDLK_n));
    EXPECT_FALSE(game.screen.ReturnPrompt->visible);
    window.Handle(Key(SDLK_ESCAPE));
    window.Handle(Key(SDLK_t));
    EXPECT_TRUE(game.screen.MenuLayer->visible);
    EXPECT_TRUE(game.screen.MainMenuScreen->visible);

    EXPECT_FALSE(Click(window, session, "Wyjście")) << "the game asked to quit";
    EXPECT_TRUE(game.quitRequested);
}

// The menus from SDL's keys: Shift+Tab goes backwards, either Shift key will do, Return presses.
TEST_F(GameWindowTest, TabShiftTabAndReturn)
{
    window.Tick(clock);
    window.Redraw();
    window.Handle(Key(SDLK_TAB, KMOD_LSHIFT));
    EXPECT_EQ(game.form.Focused(), game.screen.ExitButton);
    EXPECT_TRUE(window.Redraw()) << "the ring moved";
    window.Handle(Key(SDLK_TAB, KMOD_RSHIFT));
    EXPECT_EQ(game.form.Focused(), game.screen.OptionsButton);
    window.Handle(Key(SDLK_TAB, KMOD_NUM));
    EXPECT_EQ(game.form.Focused(), game.screen.ExitButton);
    window.Handle(Key(SDLK_UP));
    window.Handle(Key(SDLK_UP));
    EXPECT_EQ(game.form.Focused(), game.screen.PlayButton);
    window.Handle(Key(SDLK_RETURN));
    EXPECT_TRUE(game.screen.MissionMenuScreen->visible);
    EXPECT_EQ(game.form.Focused(), game.screen.MissionButtons[0]);

    // Enter held down: its repeats do not press on through the mission list; a held arrow moves on.
    SDL_Event held = Key(SDLK_RETURN);
    held.key.repeat = 1;
    window.Handle(held);
    held.key.keysym.sym = SDLK_SPACE;
    window.Handle(held);
    EXPECT_TRUE(game.screen.MissionMenuScreen->visible);
    EXPECT_FALSE(game.screen.BriefingScreen->visible);
    held.key.keysym.sym = SDLK_DOWN;
    window.Handle(held);
    EXPECT_EQ(game.form.Focused(), game.screen.MissionMenuBack) << "only Misja 1 is open";
    window.Handle(Key(SDLK_RETURN));
    EXPECT_TRUE(game.screen.MainMenuScreen->visible) << "a fresh press still presses";
}

// A press and release in the middle of a control, the way the player clicks a board cell.
void Press(ui::Form& form, const ui::Control& control)
{
    const ui::Rect r = form.Bounds(control);
    form.MouseDown(r.left + r.width / 2, r.top + r.height / 2);
    form.MouseUp(r.left + r.width / 2, r.top + r.height / 2);
}

// The window, drawn piece by piece as things changed, shows exactly what one full draw of the same state shows.
class PieceByPiece {
public:
    explicit PieceByPiece(int scale) : scale_(scale), window(game, SourceAssets(), scale), camera(SourceAssets(), scale) {}

    // One frame of real time; the pixels it sent, at 1x.
    uint64_t Frame(double milliseconds = 0)
    {
        clock_ += milliseconds;
        window.Tick(clock_);
        const uint64_t before = window.PixelsPresented();
        window.Redraw();
        return window.PixelsPresented() - before;
    }

    void ExpectSameAsFullDraw(const std::string& when)
    {
        const SDL_Surface& full = camera.Capture(game.form);
        const SDL_Surface* shown = SDL_GetWindowSurface(window.Handle());
        ASSERT_NE(shown, nullptr);
        ASSERT_EQ(shown->w, full.w);
        ASSERT_EQ(shown->h, full.h);
        int differing = 0;
        SDL_Point first{-1, -1};
        for (int y = 0; y < full.h; ++y)
            for (int x = 0; x < full.w; ++x)
                if (!(PixelAt(*shown, x, y) == PixelAt(full, x, y)) && differing++ == 0) first = {x, y};
        EXPECT_EQ(differing, 0) << when << " at " << scale_ << "x: first at " << first.x << ", " << first.y;
    }

    OffscreenVideo video;
    HeadlessGame session;
    Game& game = *session.game;

private:
    int scale_;
    double clock_ = 0;

public:
    GameWindow window;
    ScreenshotCamera camera;
};

TEST(GameWindowDamage, DrawsOnlyWhatChangedAndShowsWhatAFullDrawShows)
{
    constexpr uint64_t kCell = 33 * 33;
    for (int scale : {1, 2}) {
        PieceByPiece s(scale);
        Game& game = s.game;
        EXPECT_EQ(s.Frame(), 576u * 447u);
        s.ExpectSameAsFullDraw("main menu");
        s.session.Click("Gra");
        s.session.Click("Misja 1");
        s.session.Click("Rozpocznij misję ->");
        s.Frame();
        s.ExpectSameAsFullDraw("start of the mission");

        // The fill changes one cell a tick and sends no more than that.
        int frames = 0;
        while (game.timers[kFillTimer].Enabled()) {
            EXPECT_LE(s.Frame(30), kCell) << "fill frame " << frames;
            if (++frames % 20 == 0) s.ExpectSameAsFullDraw("fill frame " + std::to_string(frames));
        }
        s.ExpectSameAsFullDraw("the filled board");

        // A swap, then whatever follows it: runs blowing up and falling, or the swap back and its penalty.
        Press(game.form, *game.screen.Cells[44]);
        Press(game.form, *game.screen.Cells[45]);
        for (frames = 0; frames < 200 && !game.InputReady; ++frames) {
            s.Frame(15);
            if (frames % 7 == 0) s.ExpectSameAsFullDraw("swap frame " + std::to_string(frames));
        }
        EXPECT_TRUE(game.InputReady);
        s.Frame();
        s.ExpectSameAsFullDraw("after the swap");

        ui::Control& bar = *game.screen.TerminalWorkBar;
        ASSERT_TRUE(game.form.Shown(bar));
        bar.width = bar.width * 2 / 3;
        EXPECT_LT(s.Frame(), 576u * 447u / 20) << "a bar shrinking";
        s.ExpectSameAsFullDraw("a bar shrinking");
        game.screen.HealthLabel->caption = "7";
        EXPECT_LT(s.Frame(), 576u * 447u / 20) << "a label changing";
        s.ExpectSameAsFullDraw("a label changing");
        // A caption far wider than its label runs on over the hero panel; its shorter successor must clear that.
        game.screen.HealthLabel->caption = "1234567890";
        s.Frame();
        s.ExpectSameAsFullDraw("a caption running past its label");
        game.screen.HealthLabel->caption = "7";
        s.Frame();
        s.ExpectSameAsFullDraw("a short caption again");
        ui::Control& panel = *game.screen.GoalPanel[kTerminalPanel];
        panel.visible = false;
        s.Frame();
        s.ExpectSameAsFullDraw("a panel hidden");
        panel.visible = true;
        s.Frame();
        s.ExpectSameAsFullDraw("the panel shown again");
        // Only the panel's own bounds change: what it holds must follow.
        ASSERT_FALSE(panel.children.empty());
        panel.left += 150;
        s.Frame();
        s.ExpectSameAsFullDraw("a panel moved with what it holds");
        game.form.KeyDown(27);
        s.Frame();
        s.ExpectSameAsFullDraw("the return prompt");
        game.form.KeyDown(84);
        s.Frame();
        s.ExpectSameAsFullDraw("back on the main menu");
        game.form.KeyDown(9);
        game.form.KeyDown(9);
        s.Frame();
        s.ExpectSameAsFullDraw("the keyboard focus moved");
        game.form.MouseMove(0, 0);
        game.form.MouseDown(0, 0);
        game.form.MouseUp(0, 0);
        s.Frame();
        s.ExpectSameAsFullDraw("the focus gone");

        // Nothing changed, nothing sent; the window's pixels lost, all of them sent.
        EXPECT_EQ(s.Frame(), 0u);
        SDL_Event exposed{};
        exposed.type = SDL_WINDOWEVENT;
        exposed.window.event = SDL_WINDOWEVENT_EXPOSED;
        s.window.Handle(exposed);
        EXPECT_EQ(s.Frame(), 576u * 447u);
    }
}

// A stall (a modal box, a suspended machine) resumes the game where it stopped instead of replaying it.
TEST_F(GameWindowTest, StallIsNotReplayed)
{
    window.Tick(clock);
    ASSERT_TRUE(Click(window, session, "Gra"));
    ASSERT_TRUE(Click(window, session, "Misja 1"));
    ASSERT_TRUE(Click(window, session, "Rozpocznij misję ->"));
    const int64_t next = *game.timers.NextDue();
    const uint64_t ticksBefore = game.timers.TicksRun();
    clock += 60'000;
    window.Tick(clock);
    EXPECT_EQ(game.timers.Now(), next + 250) << "the next tick and a quarter of a second after it";
    EXPECT_LT(game.timers.TicksRun() - ticksBefore, 50u);
    Pass(100);
    EXPECT_EQ(game.timers.Now(), next + 350) << "real time runs on from the stall";
}

// Asleep until the only running timer falls due, however far off, the loop runs that tick when it wakes.
TEST_F(GameWindowTest, ALoneTimerTicksWhenTheLoopWakesForIt)
{
    for (int timer = 1; timer <= ui::TimerBank::kCount; ++timer) game.timers[timer].SetEnabled(false);
    window.Tick(clock);
    game.timers[kHintTimer].SetEnabled(true);
    const int sleep = window.SleepFor(clock);
    EXPECT_EQ(sleep, 30'000);
    clock += sleep;
    window.Tick(clock);
    EXPECT_EQ(game.timers.Now(), 30'000);
    EXPECT_EQ(game.timers.TicksRun(), 1u) << "the hint changed on time";
}

// Clicked after a while on the mission list, the briefing starts typing from its first letter: the loop
// handles the click at the moment it came, not at the last tick long before.
TEST_F(GameWindowTest, AnInputAfterAPauseIsHandledAtItsOwnMoment)
{
    window.Tick(clock);
    ASSERT_TRUE(Click(window, session, "Gra"));
    const SDL_Point mission = session.Centre("Misja 1");
    SDL_Event down = MouseButton(SDL_MOUSEBUTTONDOWN, mission), up = MouseButton(SDL_MOUSEBUTTONUP, mission);
    SDL_Event quit{};
    quit.type = SDL_QUIT;
    SDL_PushEvent(&down);
    SDL_PushEvent(&up);
    SDL_PushEvent(&quit);
    // The loop reads the clock once as it starts; the click comes five seconds later.
    bool started = false;
    window.Run([&started] { return std::exchange(started, true) ? 5'000.0 : 0.0; });
    ASSERT_TRUE(game.screen.BriefingScreen->visible);
    clock = 5'000;
    window.Tick(clock);
    EXPECT_EQ(game.screen.BriefingLabel->caption, "");
    Pass(20);
    EXPECT_EQ(game.screen.BriefingLabel->caption, "To");
}

// Ticks that fell due before an input run ahead of it, and those of its own moment after it.
TEST_F(GameWindowTest, AnInputComesAfterTheTicksDueBeforeIt)
{
    window.Tick(clock);
    ASSERT_TRUE(Click(window, session, "Gra"));
    ASSERT_TRUE(Click(window, session, "Misja 1"));
    clock += 50;
    window.InputArrives(clock);
    EXPECT_EQ(game.timers.Now(), 49);
    EXPECT_EQ(game.screen.BriefingLabel->caption, "To b") << "the letters due at 10..40";
    ASSERT_TRUE(Click(window, session, "<- Wróć do menu misji"));
    window.Tick(clock);
    EXPECT_EQ(game.screen.BriefingLabel->caption, "To bę") << "the letter due at 50, after the click";
}

// Once the briefing is left, its typing goes on unseen and wakes the loop only with the board's own ticks,
// or a few times a second on the mission list.
TEST_F(GameWindowTest, HiddenTypingDoesNotWakeTheLoop)
{
    window.Tick(clock);
    ASSERT_TRUE(Click(window, session, "Gra"));
    ASSERT_TRUE(Click(window, session, "Misja 1"));
    EXPECT_EQ(window.SleepFor(clock), 10) << "typing shows on the briefing";
    ASSERT_TRUE(Click(window, session, "<- Wróć do menu misji"));
    EXPECT_EQ(window.SleepFor(clock), 10 + ui::TimerBank::kUnseenLateness);
    ASSERT_TRUE(Click(window, session, "Misja 1"));
    EXPECT_EQ(window.SleepFor(clock), 10) << "a new choice types in sight again";
    ASSERT_TRUE(Click(window, session, "Rozpocznij misję ->"));
    EXPECT_EQ(window.SleepFor(clock), 30) << "the fill's ticks";
    Pass(8'000);
    EXPECT_FALSE(game.timers[kTypewriterTimer].Enabled());
    EXPECT_EQ(game.screen.BriefingLabel->caption, kBriefings[0]) << "every letter was typed, in order";
}

// The real loop on the real clock ends on the window's close and on the game's own request.
TEST_F(GameWindowTest, LoopEndsOnCloseAndOnExit)
{
    // Closing the window's frame ends the game as "Wyjście" does.
    SDL_Event quit{};
    quit.type = SDL_QUIT;
    ASSERT_FALSE(window.Handle(quit));
    SDL_PushEvent(&quit);
    window.Run();
    EXPECT_FALSE(game.quitRequested);
    EXPECT_EQ(window.FramesPresented(), 1u);

    const SDL_Point exit = session.Centre("Wyjście");
    SDL_Event down = MouseButton(SDL_MOUSEBUTTONDOWN, exit), up = MouseButton(SDL_MOUSEBUTTONUP, exit);
    SDL_PushEvent(&down);
    SDL_PushEvent(&up);
    window.Run();
    EXPECT_TRUE(game.quitRequested);
}

Uint32 PushQuit(Uint32, void*)
{
    SDL_Event quit{};
    quit.type = SDL_QUIT;
    SDL_PushEvent(&quit);
    return 0;
}

// The host's own chores wake the idle loop when they ask to, and not otherwise.
TEST_F(GameWindowTest, IdleLoopSleepsUntilTheChoreIsDue)
{
    // Every timer stopped, so that only the chore can wake the loop.
    for (int timer = 1; timer <= ui::TimerBank::kCount; ++timer) game.timers[timer].SetEnabled(false);
    std::vector<Uint64> asked;
    window.SetChore([&asked]() -> std::optional<double> {
        asked.push_back(SDL_GetTicks64());
        if (asked.size() == 1) return 40.0;
        PushQuit(0, nullptr);
        return std::nullopt;
    });
    const SDL_TimerID safety = SDL_AddTimer(2000, PushQuit, nullptr);
    window.Run();
    SDL_RemoveTimer(safety);
    ASSERT_EQ(asked.size(), 2u) << "the loop woke for the chore";
    EXPECT_GE(asked[1] - asked[0], 39u) << "and slept until it was due";
}

}  // namespace
}  // namespace kr::sdl
