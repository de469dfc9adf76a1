#include "ui/sdl/assets.h"

#include <SDL.h>
#include <string>
#include <system_error>

namespace kr::sdl {

Assets::Assets(std::filesystem::path folder) : folder_(std::move(folder)) {}

Assets Assets::BesideExecutable()
{
    char* base = SDL_GetBasePath();
    if (!base) return Assets(std::filesystem::current_path());
    Assets assets{std::filesystem::path(base)};
    SDL_free(base);
    return assets;
}

std::filesystem::path Assets::Resolve(std::string_view relative) const
{
    std::error_code error;
    const std::filesystem::path beside = folder_ / relative;
    if (std::filesystem::exists(beside, error)) return beside;
    const std::filesystem::path here = std::filesystem::path(relative);
    if (std::filesystem::exists(here, error)) return here;
    return beside;
}

std::filesystem::path Assets::Picture(std::string_view stem) const
{
    return Resolve("assets/pictures/" + std::string(stem) + ".svg");
}

}  // namespace kr::sdl
