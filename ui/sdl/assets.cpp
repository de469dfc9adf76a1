#include "ui/sdl/assets.h"

#include <SDL.h>
#include <string>
#include <system_error>

namespace kr::sdl {

Assets::Assets(std::vector<std::filesystem::path> folders) : folders_(std::move(folders)) {}

Assets::Assets(std::filesystem::path folder) : folders_{std::move(folder)} {}

Assets Assets::BesideExecutable()
{
    char* base = SDL_GetBasePath();
    // Without the executable's folder only the configured install is left to try.
    if (!base) return Assets(std::filesystem::path(KRUSZARKA_INSTALL_DATA));
    const std::filesystem::path executable(base);
    SDL_free(base);
    return Assets({executable, (executable / KRUSZARKA_DATA_FROM_BIN).lexically_normal()});
}

std::filesystem::path Assets::Resolve(std::string_view relative) const
{
    if (folders_.empty()) return {};
    for (const std::filesystem::path& folder : folders_) {
        std::error_code error;
        const std::filesystem::path file = folder / relative;
        if (std::filesystem::is_regular_file(file, error)) return file;
    }
    return folders_.front() / relative;
}

std::filesystem::path Assets::Picture(std::string_view stem) const
{
    return Resolve("assets/pictures/" + std::string(stem) + ".svg");
}

}  // namespace kr::sdl
