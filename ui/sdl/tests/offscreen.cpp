#include "ui/sdl/tests/offscreen.h"

#include <unistd.h>

#include <atomic>
#include <stdexcept>

#include "shell/startup.h"
#include "ui/sdl/form_renderer.h"

namespace kr::sdl::testing {

const Assets& SourceAssets()
{
    static const Assets assets{KRUSZARKA_SOURCE_DIR};
    return assets;
}

OffscreenVideo::OffscreenVideo()
{
    SDL_SetHint(SDL_HINT_VIDEODRIVER, "offscreen");
    video_ = std::make_unique<Subsystem>(SDL_INIT_VIDEO);
}

HeadlessGame::HeadlessGame(uint32_t seed)
{
    static std::atomic<int> count{0};
    folder = std::filesystem::temp_directory_path() /
             ("kruszarka-sdl-test-" + std::to_string(::getpid()) + "-" + std::to_string(count++));
    std::filesystem::create_directories(folder);
    game = std::make_unique<Game>(Host{messages, sound}, folder / "config.cfg");
    StartUp(*game, seed);
}

HeadlessGame::~HeadlessGame()
{
    game.reset();
    std::error_code ignored;
    std::filesystem::remove_all(folder, ignored);
}

SDL_Point HeadlessGame::Centre(const std::string& caption) const
{
    const ui::Control* control = game->form.FindByCaption(caption);
    if (!control) throw std::runtime_error("no shown control " + caption);
    const PixelRect rect = ToPixels(game->form.Bounds(*control));
    return {rect.x + rect.w / 2, rect.y + rect.h / 2};
}

void HeadlessGame::Click(const std::string& caption)
{
    const SDL_Point at = Centre(caption);
    const float x = static_cast<float>(at.x * 15 + 7), y = static_cast<float>(at.y * 15 + 7);
    game->form.MouseDown(x, y);
    game->form.MouseUp(x, y);
}

Rgb PixelAt(const SDL_Surface& surface, int x, int y)
{
    const auto* row = static_cast<const Uint8*>(surface.pixels) + y * surface.pitch;
    Uint32 pixel = 0;
    SDL_memcpy(&pixel, row + x * surface.format->BytesPerPixel, surface.format->BytesPerPixel);
    Uint8 r = 0, g = 0, b = 0;
    SDL_GetRGB(pixel, surface.format, &r, &g, &b);
    return {r, g, b};
}

int CountPixels(const SDL_Surface& surface, SDL_Rect area, bool (*match)(Rgb))
{
    int count = 0;
    for (int y = area.y; y < area.y + area.h; ++y)
        for (int x = area.x; x < area.x + area.w; ++x) count += match(PixelAt(surface, x, y)) ? 1 : 0;
    return count;
}

}  // namespace kr::sdl::testing
