#include "ui/sdl/message_boxes.h"

#include <iostream>

namespace kr::sdl {
namespace {

enum Button { kOk = 1, kYes = 1, kNo = 2 };

}  // namespace

SDL_Window* SdlMessageBoxes::Parent() const
{
    // A box tied to a hidden window may never appear under some window managers.
    if (!parent_ || (SDL_GetWindowFlags(parent_) & SDL_WINDOW_SHOWN) == 0) return nullptr;
    return parent_;
}

void SdlMessageBoxes::ShowOk(const std::string& text)
{
    const SDL_MessageBoxButtonData ok{SDL_MESSAGEBOX_BUTTON_RETURNKEY_DEFAULT | SDL_MESSAGEBOX_BUTTON_ESCAPEKEY_DEFAULT,
                                      kOk, "OK"};
    const SDL_MessageBoxData box{SDL_MESSAGEBOX_INFORMATION, Parent(), kTitle, text.c_str(), 1, &ok, nullptr};
    int pressed = 0;
    if (SDL_ShowMessageBox(&box, &pressed) != 0) std::cerr << kTitle << ": " << text << '\n';
}

bool SdlMessageBoxes::AskYesNo(const std::string& title, const std::string& text)
{
    const SDL_MessageBoxButtonData buttons[2] = {
        {SDL_MESSAGEBOX_BUTTON_RETURNKEY_DEFAULT, kYes, "Tak"},
        {SDL_MESSAGEBOX_BUTTON_ESCAPEKEY_DEFAULT, kNo, "Nie"},
    };
    const SDL_MessageBoxData box{SDL_MESSAGEBOX_INFORMATION | SDL_MESSAGEBOX_BUTTONS_LEFT_TO_RIGHT, Parent(), title.c_str(),
                                 text.c_str(), 2, buttons, nullptr};
    int pressed = kYes;
    if (SDL_ShowMessageBox(&box, &pressed) != 0) {
        std::cerr << title << ": " << text << " (Tak)\n";
        return true;
    }
    // Closing the box without a button reports -1: the same as Escape.
    return pressed == kYes;
}

void ShowFatalError(const std::string& text, SDL_Window* parent)
{
    std::cerr << SdlMessageBoxes::kTitle << ": " << text << '\n';
    SDL_ShowSimpleMessageBox(SDL_MESSAGEBOX_ERROR, SdlMessageBoxes::kTitle, text.c_str(), parent);
}

}  // namespace kr::sdl
