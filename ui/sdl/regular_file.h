#pragma once
#include <filesystem>

#include <SDL.h>

namespace kr::sdl {

// A stream over a regular file (or a link to one), opened without ever blocking; nullptr with the reason in
// SDL_GetError for anything else, so a folder or a FIFO standing at a picture's or font's name reads as missing.
SDL_RWops* OpenRegularFile(const std::filesystem::path& file);

}  // namespace kr::sdl
