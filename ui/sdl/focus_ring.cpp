#include "ui/sdl/focus_ring.h"

#include <vector>

#include "ui/sdl/caption_box.h"

namespace kr::sdl {
namespace {

constexpr int kButtonInset = 2;
// A check box's ring goes round its caption, clear of the square.
constexpr int kCaptionLead = 2;

// By its luma, so the ring stands out on the grey, blue and yellow buttons alike.
bool Dark(ui::Colour c) { return 299 * c.r + 587 * c.g + 114 * c.b < 128 * 1000; }

}  // namespace

void DrawFocusRing(SDL_Renderer* renderer, const ui::Control& control, PixelRect outer)
{
    PixelRect ring{outer.x + kButtonInset, outer.y + kButtonInset, outer.w - 2 * kButtonInset,
                   outer.h - 2 * kButtonInset};
    if (control.kind == ui::ControlKind::CheckBox) {
        const int left = CaptionBox(control, outer).box.x - kCaptionLead;
        ring = {left, outer.y + 1, outer.x + outer.w - 1 - left, outer.h - 2};
    }
    if (ring.Empty()) return;
    const int right = ring.x + ring.w - 1, bottom = ring.y + ring.h - 1;
    // Every other pixel round the ring, counted from its top-left corner so the corners line up.
    std::vector<SDL_Rect> dots;
    for (int x = ring.x; x <= right; x += 2) {
        dots.push_back({x, ring.y, 1, 1});
        dots.push_back({x, bottom, 1, 1});
    }
    for (int y = ring.y + 2; y < bottom; y += 2) {
        dots.push_back({ring.x, y, 1, 1});
        dots.push_back({right, y, 1, 1});
    }
    const uint8_t ink = Dark(control.back) ? 255 : 0;
    SDL_SetRenderDrawColor(renderer, ink, ink, ink, 255);
    SDL_RenderFillRects(renderer, dots.data(), static_cast<int>(dots.size()));
}

}  // namespace kr::sdl
