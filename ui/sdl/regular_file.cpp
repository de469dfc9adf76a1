#include "ui/sdl/regular_file.h"

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <string>

#include "ui/file_io.h"

namespace kr::sdl {

SDL_RWops* OpenRegularFile(const std::filesystem::path& file)
{
    std::string reason;
    ui::Descriptor fd = ui::OpenRegularFile(file, reason);
    if (!fd.valid()) {
        SDL_SetError("%s", reason.empty() ? std::strerror(ENOENT) : reason.c_str());
        return nullptr;
    }
    FILE* const stream = ::fdopen(fd.get(), "rb");
    if (!stream) {
        SDL_SetError("%s", std::strerror(errno));
        return nullptr;
    }
    fd.Release();
    return SDL_RWFromFP(stream, SDL_TRUE);
}

}  // namespace kr::sdl
