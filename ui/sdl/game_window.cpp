#include "ui/sdl/game_window.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <stdexcept>

#include "ui/sdl/input.h"
#include "ui/sdl/pictures.h"

namespace kr::sdl {
namespace {

constexpr int kWidth = 576;
constexpr int kHeight = 447;
// Room for the title bar and frame a window manager adds.
constexpr int kDecoration = 64;
// 4x already fills a 4K screen.
constexpr int kLargestScale = 4;
// The most game time one wake-up may run past the tick it woke for. Beyond it (a modal box, a suspended
// laptop) the game resumes where it stopped instead of replaying every missed tick of its animations in one
// burst.
constexpr double kLongestCatchUp = 250;

}  // namespace

int FittingScale(int usableWidth, int usableHeight)
{
    int scale = kLargestScale;
    while (scale > 1 && (scale * kWidth > usableWidth || scale * kHeight + kDecoration > usableHeight)) --scale;
    return scale;
}

int ChooseScale()
{
    if (const char* forced = SDL_getenv("KRUSZARKA_SCALE")) {
        const int scale = std::atoi(forced);
        if (scale >= 1 && scale <= kLargestScale) return scale;
    }
    SDL_Rect usable{};
    if (SDL_GetDisplayUsableBounds(0, &usable) != 0) return 1;
    return FittingScale(usable.w, usable.h);
}

GameWindow::GameWindow(Game& game, const Assets& assets, int scale)
    : game_(game), scale_(scale), cursors_(assets, scale), title_(game.form.caption)
{
    // Without this the software renderer sits on an OpenGL texture: five times the memory, slower start.
    SDL_SetHint(SDL_HINT_FRAMEBUFFER_ACCELERATION, "0");
    window_.reset(SDL_CreateWindow(title_.c_str(), SDL_WINDOWPOS_CENTERED, SDL_WINDOWPOS_CENTERED, kWidth * scale,
                                   kHeight * scale, SDL_WINDOW_HIDDEN));
    if (!window_) throw std::runtime_error(std::string("GameWindow: ") + SDL_GetError());
    renderer_.reset(SDL_CreateRenderer(window_.get(), -1, SDL_RENDERER_SOFTWARE));
    if (!renderer_) throw std::runtime_error(std::string("GameWindow: ") + SDL_GetError());
    SDL_RenderSetLogicalSize(renderer_.get(), kWidth, kHeight);
    SDL_RenderSetIntegerScale(renderer_.get(), SDL_TRUE);
    if (SurfacePtr icon = RasterisePicture(assets, game.form.icon, scale)) SDL_SetWindowIcon(window_.get(), icon.get());
    form_ = std::make_unique<FormRenderer>(renderer_.get(), assets, scale);
    SDL_StopTextInput();
}

GameWindow::~GameWindow() = default;

void GameWindow::Show()
{
    SDL_ShowWindow(window_.get());
    damage_.Invalidate();
}

GameWindow::Clock GameWindow::RealClock()
{
    return [] {
        static const double frequency = static_cast<double>(SDL_GetPerformanceFrequency());
        return static_cast<double>(SDL_GetPerformanceCounter()) * 1000.0 / frequency;
    };
}

double GameWindow::GameTime(double clockMs)
{
    const double now = static_cast<double>(game_.timers.Now());
    if (!offset_) offset_ = now - clockMs;
    // Counted from the next tick rather than from the last wake-up: a loop that slept until a tick fell due
    // must run it, however long the sleep.
    if (const std::optional<int64_t> due = game_.timers.NextDue()) {
        const double limit = std::max(now, static_cast<double>(*due)) + kLongestCatchUp;
        const double time = clockMs + *offset_;
        if (time > limit) *offset_ -= time - limit;
    }
    return clockMs + *offset_;
}

int GameWindow::SleepFor(double clockMs)
{
    int timeout = -1;
    if (const std::optional<int64_t> wake = game_.timers.NextWake()) {
        // Rounded up: waking a fraction early would find nothing due and wait again.
        const double wait = static_cast<double>(*wake) - GameTime(clockMs);
        timeout = wait <= 0 ? 0 : static_cast<int>(std::min(std::ceil(wait), 86'400'000.0));
    }
    if (const std::optional<double> chore = chore_ ? chore_() : std::nullopt) {
        const int wait = static_cast<int>(std::clamp(std::ceil(*chore), 0.0, 86'400'000.0));
        timeout = timeout < 0 ? wait : std::min(timeout, wait);
    }
    return timeout;
}

void GameWindow::Run(const Clock& clock)
{
    offset_.reset();
    GameTime(clock());
    Redraw();
    while (!game_.quitRequested) {
        SDL_Event event;
        const bool woken = SDL_WaitEventTimeout(&event, SleepFor(clock())) != 0;
        if (woken) {
            InputArrives(clock());
            do {
                if (!Handle(event)) return;
            } while (SDL_PollEvent(&event));
        }
        const uint64_t ticksBefore = game_.timers.TicksRun();
        Tick(clock());
        if (game_.quitRequested) return;
        // SDL counts the wait in whole milliseconds and may return a fraction early: such a wake-up ran no tick
        // and brought no event, so it changed nothing worth comparing.
        if (woken || game_.timers.TicksRun() != ticksBefore) Redraw();
    }
}

void GameWindow::InputArrives(double clockMs)
{
    // The ticks that fell due before this moment run first, as they would have had the loop woken for each;
    // the input then comes a millisecond short of its moment, ahead of the ticks the moment itself makes due.
    game_.timers.AdvanceTo(static_cast<int64_t>(std::floor(GameTime(clockMs))) - 1);
}

void GameWindow::Tick(double clockMs)
{
    game_.timers.AdvanceTo(static_cast<int64_t>(std::floor(GameTime(clockMs))));
}

void GameWindow::Mouse(record::InputKind kind, int x, int y)
{
    Deliver({kind, PixelToTwips(x), PixelToTwips(y)});
}

void GameWindow::Deliver(const record::Input& input)
{
    if (recorder_) recorder_->Handle(input);
    else record::Deliver(game_.form, input);
}

bool GameWindow::Handle(const SDL_Event& event)
{
    switch (event.type) {
    case SDL_QUIT:
        return false;
    case SDL_MOUSEBUTTONDOWN:
        // Board cells and skills answer a press of any button; only the left one goes on to a click.
        Mouse(record::InputKind::Press, event.button.x, event.button.y);
        break;
    case SDL_MOUSEBUTTONUP:
        if (event.button.button == SDL_BUTTON_LEFT) Mouse(record::InputKind::Release, event.button.x, event.button.y);
        break;
    case SDL_MOUSEMOTION:
        Mouse(record::InputKind::Move, event.motion.x, event.motion.y);
        break;
    case SDL_KEYDOWN:
        if (const std::optional<int> code = GameKeyCode(event.key.keysym.sym)) {
            // Held down, Enter or Space would go on to press whatever each new screen focuses: only the first
            // press of a key counts. Tab and the arrows repeat as a held key should.
            if (event.key.repeat && (*code == ui::Form::kEnterKey || *code == ui::Form::kSpaceKey)) break;
            Deliver({record::InputKind::Key, 0, 0, *code, ShiftHeld(event.key.keysym.mod)});
        }
        break;
    case SDL_WINDOWEVENT:
        // The window's pixels were lost or resized: the next Redraw must draw even an unchanged frame.
        if (event.window.event == SDL_WINDOWEVENT_EXPOSED || event.window.event == SDL_WINDOWEVENT_SIZE_CHANGED ||
            event.window.event == SDL_WINDOWEVENT_RESTORED || event.window.event == SDL_WINDOWEVENT_SHOWN)
            damage_.Invalidate();
        break;
    default:
        break;
    }
    return !game_.quitRequested;
}

bool GameWindow::Redraw()
{
    cursors_.Show(game_.form.pointer);
    if (game_.form.caption != title_) {
        title_ = game_.form.caption;
        SDL_SetWindowTitle(window_.get(), title_.c_str());
    }
    const std::vector<PixelRect> damaged = damage_.Collect(game_.form, *form_);
    if (damaged.empty()) return false;
    damage_.Draw(*form_, damaged);
    Present(damaged);
    ++framesPresented_;
    return true;
}

void GameWindow::Present(const std::vector<PixelRect>& areas)
{
    // The software renderer draws straight into the window's surface, so flushing its queue and sending only
    // the redrawn rectangles presents the frame without copying the untouched rest of the window again.
    SDL_RenderFlush(renderer_.get());
    std::vector<SDL_Rect> device;
    for (const PixelRect& area : areas) {
        device.push_back({area.x * scale_, area.y * scale_, area.w * scale_, area.h * scale_});
        pixelsPresented_ += static_cast<uint64_t>(area.w) * static_cast<uint64_t>(area.h);
    }
    if (SDL_UpdateWindowSurfaceRects(window_.get(), device.data(), static_cast<int>(device.size())) != 0)
        SDL_RenderPresent(renderer_.get());
}

}  // namespace kr::sdl
