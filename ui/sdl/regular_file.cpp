#include "ui/sdl/regular_file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <cstring>

namespace kr::sdl {

SDL_RWops* OpenRegularFile(const std::filesystem::path& file)
{
    const int fd = ::open(file.c_str(), O_RDONLY | O_NONBLOCK | O_NOCTTY | O_CLOEXEC);
    if (fd < 0) {
        SDL_SetError("%s", std::strerror(errno));
        return nullptr;
    }
    struct stat opened{};
    if (::fstat(fd, &opened) != 0 || !S_ISREG(opened.st_mode)) {
        SDL_SetError("not a regular file");
        ::close(fd);
        return nullptr;
    }
    FILE* const stream = ::fdopen(fd, "rb");
    if (!stream) {
        SDL_SetError("%s", std::strerror(errno));
        ::close(fd);
        return nullptr;
    }
    return SDL_RWFromFP(stream, SDL_TRUE);
}

}  // namespace kr::sdl
