#pragma once
#include <string>

#include <SDL.h>

#include "ui/host.h"

namespace kr::sdl {

// The game's modal boxes as SDL message boxes, over the game window once it is shown.
// Where no box can be shown (no display) the text goes to stderr and the default button answers.
class SdlMessageBoxes final : public ui::MessageBoxes {
public:
    static constexpr const char* kTitle = "Kruszarka";

    void SetParent(SDL_Window* window) { parent_ = window; }

    void ShowOk(const std::string& text) override;
    bool AskYesNo(const std::string& title, const std::string& text) override;

private:
    SDL_Window* Parent() const;

    SDL_Window* parent_ = nullptr;
};

// For the one error that ends the game: a box when it can, stderr always.
void ShowFatalError(const std::string& text, SDL_Window* parent = nullptr);

}  // namespace kr::sdl
