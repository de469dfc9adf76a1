#include "ui/sdl/handles.h"

#include <stdexcept>
#include <string>

namespace kr::sdl {

Subsystem::Subsystem(Uint32 flags) : flags_(flags)
{
    if (SDL_InitSubSystem(flags) != 0) throw std::runtime_error(std::string("SDL_InitSubSystem: ") + SDL_GetError());
}

Subsystem::~Subsystem() { SDL_QuitSubSystem(flags_); }

TtfLibrary::TtfLibrary()
{
    if (TTF_Init() != 0) throw std::runtime_error(std::string("TTF_Init: ") + TTF_GetError());
}

TtfLibrary::~TtfLibrary() { TTF_Quit(); }

}  // namespace kr::sdl
