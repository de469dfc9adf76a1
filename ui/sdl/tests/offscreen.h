#pragma once
#include <filesystem>
#include <memory>
#include <string>

#include "shell/game.h"
#include "ui/headless.h"
#include "ui/sdl/assets.h"
#include "ui/sdl/handles.h"

namespace kr::sdl::testing {

// The sources' own assets folder, so tests need no copy of it.
const Assets& SourceAssets();

// SDL video on the offscreen driver, for as long as the fixture lives.
class OffscreenVideo {
public:
    OffscreenVideo();

private:
    std::unique_ptr<Subsystem> video_;
};

// A game with a scripted host, started with a fixed seed and a progress file of its own.
class HeadlessGame {
public:
    explicit HeadlessGame(uint32_t seed = 7);
    ~HeadlessGame();

    // The centre of the shown control with this caption, in 1x window pixels.
    SDL_Point Centre(const std::string& caption) const;
    // A click through the form, the way the scenario runner clicks.
    void Click(const std::string& caption);

    ui::ScriptedMessages messages;
    ui::RecordedSound sound;
    std::filesystem::path folder;
    std::unique_ptr<Game> game;
};

struct Rgb {
    int r = 0, g = 0, b = 0;
    friend bool operator==(const Rgb&, const Rgb&) = default;
};
Rgb PixelAt(const SDL_Surface& surface, int x, int y);
// How many pixels of the rectangle satisfy `match`.
int CountPixels(const SDL_Surface& surface, SDL_Rect area, bool (*match)(Rgb));

}  // namespace kr::sdl::testing
