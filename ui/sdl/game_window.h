#pragma once
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <vector>

#include "shell/game.h"
#include "tools/record.h"
#include "ui/sdl/assets.h"
#include "ui/sdl/cursors.h"
#include "ui/sdl/damage.h"
#include "ui/sdl/form_renderer.h"
#include "ui/sdl/handles.h"

namespace kr::sdl {

// The largest whole scale, 1 to 4, whose window and its frame fit a usable area of this many pixels.
int FittingScale(int usableWidth, int usableHeight);
// The fitting scale of the desktop's usable area; KRUSZARKA_SCALE forces one.
int ChooseScale();

// The game's one window: it draws the form, turns SDL's events into the form's input and drives the
// game's timers from the real clock. Needs SDL's video subsystem.
class GameWindow {
public:
    // Milliseconds on some steady clock; the loop only takes differences.
    using Clock = std::function<double()>;

    // Created hidden, so a box shown during start-up comes before the window.
    GameWindow(Game& game, const Assets& assets, int scale);
    GameWindow(const GameWindow&) = delete;
    GameWindow& operator=(const GameWindow&) = delete;
    ~GameWindow();

    void Show();
    SDL_Window* Handle() const { return window_.get(); }
    int Scale() const { return scale_; }

    // Waits for events and timer ticks until the game asks to quit or the window is closed.
    void Run(const Clock& clock = RealClock());

    // The pieces of the loop. How long it may sleep at this clock reading before a timer or the chore wants
    // it: whole milliseconds, -1 for as long as no event comes.
    int SleepFor(double clockMs);
    // Events woke the loop at this clock reading: the game's clock is brought up to their moment, so they
    // are handled at the time they came rather than at the time of the last tick.
    void InputArrives(double clockMs);
    // Handle returns false when the program must end.
    bool Handle(const SDL_Event& event);
    // Runs the timers up to the moment `clockMs` (the loop's clock); the first call ties that clock to the
    // game's present time.
    void Tick(double clockMs);
    // Draws and sends to the screen only what changed since the last frame (all of it after the window was
    // shown, exposed, restored or resized); true if anything was.
    bool Redraw();

    // From now on every input reaches the game through `recorder`, which writes it down; nullptr stops that.
    void Record(record::Recorder* recorder) { recorder_ = recorder; }

    uint64_t FramesPresented() const { return framesPresented_; }
    // Window pixels sent to the screen so far, counted at 1x.
    uint64_t PixelsPresented() const { return pixelsPresented_; }
    uint64_t Rasterised() const { return form_->Rasterised(); }

    static Clock RealClock();

    // Host work outside the game's timers, such as closing an idle sound device: asked after every turn of
    // the loop, it returns the milliseconds until it wants asking again, or nothing, and the loop sleeps no
    // longer than that.
    using Chore = std::function<std::optional<double>()>;
    void SetChore(Chore chore) { chore_ = std::move(chore); }

private:
    void Mouse(record::InputKind kind, int x, int y);
    void Deliver(const record::Input& input);
    void Present(const std::vector<PixelRect>& areas);
    // The game's time at this clock reading, less what the game did not see.
    double GameTime(double clockMs);

    Game& game_;
    int scale_;
    WindowPtr window_;
    RendererPtr renderer_;
    std::unique_ptr<FormRenderer> form_;
    PointerCursors cursors_;
    Damage damage_;
    uint64_t framesPresented_ = 0;
    uint64_t pixelsPresented_ = 0;
    std::optional<double> offset_;  // game time minus clock time
    std::string title_;
    Chore chore_;
    record::Recorder* recorder_ = nullptr;
};

}  // namespace kr::sdl
