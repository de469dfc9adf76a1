#include "ui/sdl/shapes.h"

#include <algorithm>
#include <cmath>
#include <vector>

namespace kr::sdl {
namespace {

void SetColour(SDL_Renderer* renderer, ui::Colour colour)
{
    SDL_SetRenderDrawColor(renderer, colour.r, colour.g, colour.b, 255);
}

// Half the chord of an ellipse with half-axes a, b at height y from its centre; negative outside.
double HalfChord(double a, double b, double y)
{
    if (a <= 0 || b <= 0 || std::abs(y) >= b) return -1;
    return a * std::sqrt(1 - (y / b) * (y / b));
}

}  // namespace

void FillRect(SDL_Renderer* renderer, PixelRect rect, ui::Colour colour)
{
    if (rect.Empty()) return;
    SetColour(renderer, colour);
    const SDL_Rect r = rect.Sdl();
    SDL_RenderFillRect(renderer, &r);
}

void FrameRect(SDL_Renderer* renderer, PixelRect rect, int thickness, ui::Colour colour)
{
    if (rect.Empty() || thickness <= 0) return;
    const int tx = std::min(thickness, (rect.w + 1) / 2);
    const int ty = std::min(thickness, (rect.h + 1) / 2);
    SetColour(renderer, colour);
    const SDL_Rect sides[4] = {
        {rect.x, rect.y, rect.w, ty},
        {rect.x, rect.y + rect.h - ty, rect.w, ty},
        {rect.x, rect.y + ty, tx, rect.h - 2 * ty},
        {rect.x + rect.w - tx, rect.y + ty, tx, rect.h - 2 * ty},
    };
    SDL_RenderFillRects(renderer, sides, 4);
}

void DrawEllipse(SDL_Renderer* renderer, PixelRect rect, int scale, std::optional<ui::Colour> fill,
                 std::optional<ui::Colour> border, int borderWidth)
{
    if (rect.Empty()) return;
    const double unit = 1.0 / scale;
    const int rows = rect.h * scale;
    const double a = rect.w * scale / 2.0, b = rect.h * scale / 2.0;
    const double ring = border ? std::max(borderWidth, 1) * scale : 0;
    std::vector<SDL_FRect> inside, edge;
    const auto span = [&](std::vector<SDL_FRect>& into, int row, long from, long to) {
        if (to <= from) return;
        into.push_back({static_cast<float>(rect.x + static_cast<double>(from) * unit),
                        static_cast<float>(rect.y + row * unit), static_cast<float>(static_cast<double>(to - from) * unit),
                        static_cast<float>(unit)});
    };
    for (int row = 0; row < rows; ++row) {
        const double y = row + 0.5 - b;
        const double outer = HalfChord(a, b, y);
        if (outer < 0) continue;
        const long left = std::lround(a - outer), right = std::lround(a + outer);
        const double inner = HalfChord(a - ring, b - ring, y);
        if (inner < 0) {
            span(border ? edge : inside, row, left, right);
            continue;
        }
        const long innerLeft = std::lround(a - inner), innerRight = std::lround(a + inner);
        if (border) {
            span(edge, row, left, innerLeft);
            span(edge, row, innerRight, right);
        }
        span(inside, row, border ? innerLeft : left, border ? innerRight : right);
    }
    if (fill && !inside.empty()) {
        SetColour(renderer, *fill);
        SDL_RenderFillRectsF(renderer, inside.data(), static_cast<int>(inside.size()));
    }
    if (border && !edge.empty()) {
        SetColour(renderer, *border);
        SDL_RenderFillRectsF(renderer, edge.data(), static_cast<int>(edge.size()));
    }
}

}  // namespace kr::sdl
