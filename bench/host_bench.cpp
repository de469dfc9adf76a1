// kruszarka-bench: what the SDL host costs a player. Prints start-up to the first presented frame, CPU over an
// idle spell on the main menu and on the board with the real loop (the sound device closed), how soon a sound
// starts after a silence, CPU while the board fills at 1x and 2x with the real loop, the time to draw one full
// frame at 1x and 2x, how far the bomb clock strays from the wall clock over a whole bomb (1,500 ticks of
// 100 ms with the real loop and clock), and peak memory.
//
//   kruszarka-bench [--idle-seconds N] [--frames N] [--fills N] [--bomb-ticks N] [--only fill]
//
// --only fill measures just the board fills at 2x (started at once and after the briefing), for a profiler.
//
// With no DISPLAY it runs on SDL's offscreen driver, which has no way to sleep in SDL_WaitEventTimeout and polls
// every millisecond instead: run it under X (Xvfb will do) for the idle figure a player sees.
#define SDL_MAIN_HANDLED
#include <sys/resource.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <functional>
#include <stdexcept>
#include <string>
#include <vector>

#include "board/fill.h"
#include "combat/stage.h"
#include "shell/game.h"
#include "shell/startup.h"
#include "shell/timer_numbers.h"
#include "ui/headless.h"
#include "ui/sdl/assets.h"
#include "ui/sdl/damage.h"
#include "ui/sdl/game_window.h"
#include "ui/sdl/handles.h"
#include "ui/sdl/mixer_sound.h"
#include "ui/sdl/screenshot.h"

namespace {

using namespace kr;
using Clock = std::chrono::steady_clock;

double MillisecondsSince(Clock::time_point start)
{
    return std::chrono::duration<double, std::milli>(Clock::now() - start).count();
}

double CpuMilliseconds()
{
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    const auto ms = [](timeval t) { return static_cast<double>(t.tv_sec) * 1000.0 + static_cast<double>(t.tv_usec) / 1000.0; };
    return ms(usage.ru_utime) + ms(usage.ru_stime);
}

double PeakMegabytes()
{
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return static_cast<double>(usage.ru_maxrss) / 1024.0;
}

struct Options {
    double idleSeconds = 10;
    int frames = 200;
    int fills = 5;
    int bombTicks = 1500;
    bool onlyFill = false;
};

Options Parse(int argc, char** argv)
{
    Options options;
    for (int i = 1; i + 1 < argc; i += 2) {
        if (std::strcmp(argv[i], "--idle-seconds") == 0) options.idleSeconds = std::atof(argv[i + 1]);
        else if (std::strcmp(argv[i], "--frames") == 0) options.frames = std::max(1, std::atoi(argv[i + 1]));
        else if (std::strcmp(argv[i], "--fills") == 0) options.fills = std::max(1, std::atoi(argv[i + 1]));
        else if (std::strcmp(argv[i], "--bomb-ticks") == 0)
            options.bombTicks = std::clamp(std::atoi(argv[i + 1]), 2, 1500);
        else if (std::strcmp(argv[i], "--only") == 0 && std::strcmp(argv[i + 1], "fill") == 0) options.onlyFill = true;
        else {
            std::fprintf(stderr, "usage: kruszarka-bench [--idle-seconds N] [--frames N] [--fills N] "
                                 "[--bomb-ticks N] [--only fill]\n");
            std::exit(2);
        }
    }
    return options;
}

// A game on a scripted host with a progress file of its own, so no box waits for an answer.
struct BenchGame {
    explicit BenchGame(ui::SoundChannels& channels)
        : folder(std::filesystem::temp_directory_path() / ("kruszarka-bench-" + std::to_string(::getpid()))),
          game((std::filesystem::create_directories(folder), Host{messages, channels}), folder / "config.cfg")
    {
    }
    ~BenchGame()
    {
        std::error_code ignored;
        std::filesystem::remove_all(folder, ignored);
    }

    void Click(const std::string& caption)
    {
        const ui::Control* control = game.form.FindByCaption(caption);
        if (!control) throw std::runtime_error("kruszarka-bench: no button " + caption);
        const ui::Rect r = game.form.Bounds(*control);
        game.form.MouseDown(r.left + r.width / 2, r.top + r.height / 2);
        game.form.MouseUp(r.left + r.width / 2, r.top + r.height / 2);
    }

    ui::ScriptedMessages messages;
    std::filesystem::path folder;
    Game game;
};

Uint32 PushQuit(Uint32, void*)
{
    SDL_Event quit{};
    quit.type = SDL_QUIT;
    SDL_PushEvent(&quit);
    return 0;
}

// Runs the window's real loop for `seconds`; returns the CPU milliseconds the process spent meanwhile.
double RunFor(sdl::GameWindow& window, double seconds, double& wall)
{
    const double cpuBefore = CpuMilliseconds();
    const Clock::time_point start = Clock::now();
    SDL_AddTimer(static_cast<Uint32>(seconds * 1000), PushQuit, nullptr);
    window.Run();
    wall = MillisecondsSince(start);
    return CpuMilliseconds() - cpuBefore;
}

void PrintIdle(const char* where, double cpu, double wall, uint64_t frames, const sdl::MixerSound& sound)
{
    std::printf("idle %-23s %.1f ms CPU over %.1f s (%.3f %%, %.2f ms per 30 s), %llu frames drawn, "
                "sound device %s\n",
                where, cpu, wall / 1000.0, 100.0 * cpu / wall, cpu * 30000.0 / wall,
                static_cast<unsigned long long>(frames), sound.DeviceOpen() ? "OPEN" : "closed");
}

// From a Play after a silence to the moment the reopened device first asks for samples.
void FirstSound(sdl::MixerSound& sound, int channel)
{
    if (!sound.HasSound()) return;
    const uint64_t fed = sound.BuffersFed();
    const Clock::time_point start = Clock::now();
    sound.Play(channel);
    const double play = MillisecondsSince(start);
    while (sound.BuffersFed() == fed && MillisecondsSince(start) < 2000) SDL_Delay(0);
    std::printf("first sound after a silence  %.1f ms from Play to the device's first buffer (Play itself %.1f ms)\n",
                MillisecondsSince(start), play);
}

void StartUpAndIdle(const Options& options)
{
    const Clock::time_point start = Clock::now();
    const sdl::Subsystem video(SDL_INIT_VIDEO | SDL_INIT_TIMER);
    const sdl::Assets assets = sdl::Assets::BesideExecutable();
    sdl::MixerSound sound(assets, sdl::GameWindow::RealClock());
    BenchGame bench(sound);
    // Mission 1 open, sound on, tutorial off: the board scene plays its start sound.
    std::ofstream(bench.folder / "config.cfg") << " 1 \r\n 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n";
    sdl::GameWindow window(bench.game, assets, sdl::ChooseScale());
    StartUp(bench.game, 7);
    window.Show();
    window.Redraw();
    const double startUp = MillisecondsSince(start);
    sound.Start();
    const double soundReady = MillisecondsSince(start);
    window.SetChore([&sound] { return sound.CloseWhenQuiet(); });

    std::printf("video driver                 %s, window scale %dx, sound %s\n", SDL_GetCurrentVideoDriver(),
                window.Scale(), sound.HasSound() ? sound.Driver().c_str() : "none");
    std::printf("start-up to first frame      %.1f ms (in process: SDL, game, start-up, window, first present)\n",
                startUp);
    std::printf("sound ready                  %.1f ms after start (device checked after the first frame)\n",
                soundReady);

    double wall = 0;
    uint64_t frames = window.FramesPresented();
    double cpu = RunFor(window, options.idleSeconds, wall);
    PrintIdle("on the main menu", cpu, wall, window.FramesPresented() - frames, sound);

    FirstSound(sound, 0);
    bench.Click("Gra");
    bench.Click("Misja 1");
    bench.Click("Rozpocznij misję ->");
    // The board fills and the start sound ends; then the device closes after its linger.
    const double settle = (sdl::MixerSound::kLingerMs + 3000) / 1000.0;
    frames = window.FramesPresented();
    cpu = RunFor(window, settle, wall);
    PrintIdle("settling on the board", cpu, wall, window.FramesPresented() - frames, sound);
    frames = window.FramesPresented();
    cpu = RunFor(window, options.idleSeconds, wall);
    PrintIdle("on the board", cpu, wall, window.FramesPresented() - frames, sound);
}

void PushQuitNow()
{
    SDL_Event quit{};
    quit.type = SDL_QUIT;
    SDL_PushEvent(&quit);
}

// Runs `then` after every tick of one timer, keeping the game's own handler.
void AfterEachTick(Game& game, int timer, std::function<void()> then)
{
    std::function<void()>& onTick = game.timers[timer].onTick;
    onTick = [own = onTick, then = std::move(then)] {
        own();
        then();
    };
}

// The whole board fill (64 ticks of 30 ms) in a mission with the real loop on the real clock, several times over.
// A player who starts at once fills the board while the hidden briefing still types; one who read it does not.
void FillCpu(const Options& options, int scale, bool briefingRead)
{
    const sdl::Subsystem video(SDL_INIT_VIDEO | SDL_INIT_TIMER);
    const sdl::Assets assets = sdl::Assets::BesideExecutable();
    ui::RecordedSound silent;
    BenchGame bench(silent);
    Game& game = bench.game;
    sdl::GameWindow window(game, assets, scale);
    StartUp(game, 7);
    window.Show();
    window.Redraw();
    bench.Click("Gra");
    bench.Click("Misja 1");
    while (briefingRead && game.timers[kTypewriterTimer].Enabled()) game.timers.Advance(1000);
    window.Redraw();
    AfterEachTick(game, kFillTimer, [&game] {
        if (!game.timers[kFillTimer].Enabled()) PushQuitNow();
    });

    double cpu = 0, wall = 0;
    const uint64_t frames = window.FramesPresented();
    for (int fill = 0; fill < options.fills; ++fill) {
        const double cpuBefore = CpuMilliseconds();
        const Clock::time_point start = Clock::now();
        if (fill == 0) bench.Click("Rozpocznij misję ->");
        else StartBoardFill(game);
        window.Run();
        wall += MillisecondsSince(start);
        cpu += CpuMilliseconds() - cpuBefore;
    }
    const uint64_t drawn = window.FramesPresented() - frames;
    std::printf("board fill, real loop %dx%s %.1f ms CPU over %.2f s of %d fills (%.2f %% of a core), "
                "%llu frames, %.3f ms CPU a frame\n",
                scale, briefingRead ? ", read" : "     ", cpu, wall / 1000.0, options.fills, 100.0 * cpu / wall, static_cast<unsigned long long>(drawn),
                cpu / static_cast<double>(std::max<uint64_t>(drawn, 1)));
}

// A whole bomb (mission 3's last stage) with the real loop and clock: each tick's wall-clock moment against the
// first tick's plus whole intervals.
void BombClock(const Options& options)
{
    const sdl::Subsystem video(SDL_INIT_VIDEO | SDL_INIT_TIMER);
    const sdl::Assets assets = sdl::Assets::BesideExecutable();
    ui::RecordedSound silent;
    BenchGame bench(silent);
    Game& game = bench.game;
    sdl::GameWindow window(game, assets, sdl::ChooseScale());
    StartUp(game, 7);
    window.Show();
    bench.Click("Gra");
    bench.Click("Misja 1");
    bench.Click("Rozpocznij misję ->");
    // Missions count from 0 inside the game: this is "Misja 3", whose last stage is a bomb of 1,500 ticks.
    game.ChosenMission = 2;
    game.MissionStage = 2;
    SetUpStage(game, 2, 2);
    if (!game.BombPresent) throw std::runtime_error("mission 3, stage 3 has no bomb");

    std::vector<double> moments;
    moments.reserve(static_cast<size_t>(options.bombTicks));
    AfterEachTick(game, kBombClock, [&] {
        moments.push_back(MillisecondsSince(Clock::time_point{}));
        if (static_cast<int>(moments.size()) == options.bombTicks) PushQuitNow();
    });
    const double cpuBefore = CpuMilliseconds();
    const Clock::time_point start = Clock::now();
    window.Run();
    const double wall = MillisecondsSince(start);
    const double cpu = CpuMilliseconds() - cpuBefore;

    if (moments.empty()) throw std::runtime_error("the bomb clock never ticked");
    double worst = 0;
    for (size_t n = 0; n < moments.size(); ++n) {
        const double error = moments[n] - moments[0] - static_cast<double>(n) * kNormalBombInterval;
        if (std::abs(error) > std::abs(worst)) worst = error;
    }
    const double last = moments.back() - moments[0] - static_cast<double>(moments.size() - 1) * kNormalBombInterval;
    std::printf("bomb clock, real loop %dx     %zu ticks: last tick %+.2f ms off the wall clock, worst %+.2f ms; "
                "%.1f ms CPU over %.1f s (%.2f %%)\n",
                window.Scale(), moments.size(), last, worst, cpu, wall / 1000.0, 100.0 * cpu / wall);
}

void FrameTimes(const ui::Form& form, const char* scene, int scale, int frames)
{
    const sdl::Assets assets = sdl::Assets::BesideExecutable();
    const Clock::time_point coldStart = Clock::now();
    sdl::ScreenshotCamera camera(assets, scale);
    camera.Capture(form);
    const double cold = MillisecondsSince(coldStart);

    std::vector<double> times;
    for (int i = 0; i < frames; ++i) {
        const Clock::time_point t = Clock::now();
        camera.Capture(form);
        times.push_back(MillisecondsSince(t));
    }
    std::sort(times.begin(), times.end());
    // What every wake-up of the loop costs when nothing changed: comparing each control with its last drawing.
    sdl::Damage damage;
    damage.Collect(form, camera.Renderer());
    const Clock::time_point checkStart = Clock::now();
    size_t sink = 0;
    for (int i = 0; i < frames; ++i) sink += damage.Collect(form, camera.Renderer()).size();
    const double check = MillisecondsSince(checkStart) * 1000.0 / frames;
    std::printf("frame %-12s %dx         full draw median %.3f ms, worst %.3f ms; first %.1f ms (rasterising); "
                "damage check %.1f us%s\n",
                scene, scale, times[times.size() / 2], times.back(), cold, check, sink == 1 ? " " : "");
}

void RenderTimes(const Options& options)
{
    ui::RecordedSound silent;
    BenchGame menu(silent);
    StartUp(menu.game, 7);
    BenchGame board(silent);
    StartUp(board.game, 7);
    board.Click("Gra");
    board.Click("Misja 1");
    board.Click("Rozpocznij misję ->");
    board.game.timers.Advance(3000);
    for (int scale : {1, 2}) {
        FrameTimes(menu.game.form, "main menu", scale, options.frames);
        FrameTimes(board.game.form, "game board", scale, options.frames);
    }
}

}  // namespace

int main(int argc, char** argv)
{
    SDL_SetMainReady();
    const Options options = Parse(argc, argv);
    if (!std::getenv("DISPLAY") && !std::getenv("SDL_VIDEODRIVER")) {
        setenv("SDL_VIDEODRIVER", "offscreen", 1);
        std::printf("no display: on SDL's offscreen driver, which polls every millisecond, the CPU figures are not a "
                    "player's (run it under X or Xvfb)\n");
    }
    try {
        if (options.onlyFill) {
            for (bool briefingRead : {false, true}) FillCpu(options, 2, briefingRead);
            return 0;
        }
        StartUpAndIdle(options);
        for (int scale : {1, 2}) FillCpu(options, scale, false);
        FillCpu(options, 2, true);
        RenderTimes(options);
        BombClock(options);
    } catch (const std::exception& error) {
        std::fprintf(stderr, "kruszarka-bench: %s\n", error.what());
        return 1;
    }
    std::printf("peak memory                  %.1f MB (ru_maxrss)\n", PeakMegabytes());
    return 0;
}
