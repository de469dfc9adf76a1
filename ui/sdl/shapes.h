#pragma once
#include <optional>

#include <SDL.h>

#include "ui/control.h"

namespace kr::sdl {

// A rectangle in whole window pixels at 1x; the renderer's scale turns it into device pixels.
struct PixelRect {
    int x = 0, y = 0, w = 0, h = 0;
    bool Empty() const { return w <= 0 || h <= 0; }
    SDL_Rect Sdl() const { return {x, y, w, h}; }
    friend bool operator==(const PixelRect&, const PixelRect&) = default;
};

void FillRect(SDL_Renderer* renderer, PixelRect rect, ui::Colour colour);
// A frame `thickness` pixels wide lying inside the rectangle.
void FrameRect(SDL_Renderer* renderer, PixelRect rect, int thickness, ui::Colour colour);
// An ellipse filling the rectangle, worked out row by row in device pixels so it stays round at 2x;
// the border ring lies inside the rectangle, as a rectangle's does.
void DrawEllipse(SDL_Renderer* renderer, PixelRect rect, int scale, std::optional<ui::Colour> fill,
                 std::optional<ui::Colour> border, int borderWidth);

}  // namespace kr::sdl
