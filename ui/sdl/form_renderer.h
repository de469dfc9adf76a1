#pragma once
#include <cstdint>

#include "ui/form.h"
#include "ui/sdl/assets.h"
#include "ui/sdl/caption_box.h"
#include "ui/sdl/fonts.h"
#include "ui/sdl/pictures.h"
#include "ui/sdl/shapes.h"
#include "ui/sdl/text_cache.h"

namespace kr::sdl {

// Twips to whole window pixels, each edge rounded on its own so neighbours neither gap nor overlap.
PixelRect ToPixels(const ui::Rect& twips);

// The whole window in 1x pixels.
inline constexpr PixelRect kWindowPixels{0, 0, 576, 447};

// Where one control lands, in whole window pixels, and in twips for its children.
struct Placement {
    PixelRect rect;       // its bounds
    PixelRect own;        // the part inside every ancestor panel and the window
    PixelRect ancestors;  // what its ancestors leave of the window: text may run past its bounds up to here
    float left = 0, top = 0;                                          // its corner in window twips
    float visibleLeft = 0, visibleTop = 0, visibleRight = 0, visibleBottom = 0;  // `own` in twips
    friend bool operator==(const Placement&, const Placement&) = default;
};
// Worked out from where the parent landed (nullptr for a control placed directly in the window), so a walk
// down the tree places every control in one step.
Placement Place(const ui::Control& control, const Placement* parent);

// The part two rectangles share; empty when they do not meet.
PixelRect Intersect(PixelRect a, PixelRect b);
// The smallest rectangle holding both; an empty one adds nothing.
PixelRect Union(PixelRect a, PixelRect b);

// Draws a form onto one renderer at a whole scale. The renderer's logical size must be the window's
// 576 x 447, so everything here is placed in 1x pixels while textures are rasterised at the real size.
class FormRenderer {
public:
    static constexpr ui::Colour kWindowColour{128, 128, 128};

    FormRenderer(SDL_Renderer* renderer, const Assets& assets, int scale);
    FormRenderer(const FormRenderer&) = delete;
    FormRenderer& operator=(const FormRenderer&) = delete;

    // Clears to the window colour and draws every shown control, later siblings on top, and the keyboard
    // focus; does not present.
    void Draw(const ui::Form& form);

    // Drawing part of the window: BeginArea clears one area to the window colour and clips everything after it
    // there; DrawControl then draws a shown control's own face (not its children) placed there, with the focus
    // ring when it holds the keyboard focus, and the
    // controls drawn in their drawing order leave exactly the pixels a full draw leaves in the area. EndFrame
    // closes the frame (it does not present).
    void BeginArea(PixelRect area);
    void DrawControl(const ui::Control& control, const Placement& at, bool focused);
    void EndFrame();

    // Every pixel the control itself paints (not its children), for a shown control placed there.
    PixelRect Extent(const ui::Control& control, const Placement& placement);

    int Scale() const { return scale_; }
    // Pictures and text lines rasterised so far: a redraw of an unchanged screen adds none.
    uint64_t Rasterised() const { return pictures_.Rasterised() + text_.Rasterised(); }

private:
    PixelRect CaptionExtent(const ui::Control& control, const TextBox& where);

    void DrawTree(const ui::Control& control, const Placement* parent, const ui::Control* focus);
    void DrawFace(const ui::Control& control, const Placement& at);
    void DrawPicture(const ui::Control& control, PixelRect rect);
    void DrawLabel(const ui::Control& control, const Placement& at);
    void DrawButton(const ui::Control& control, PixelRect rect);
    void DrawCheckBox(const ui::Control& control, const Placement& at);
    void DrawShape(const ui::Control& control, PixelRect rect);
    void DrawText(const ui::Control& control, const TextBox& where);
    // Calls each(line texture, device rectangle) for every line of the caption in the box.
    template <typename Each>
    void PlaceLines(const ui::Control& control, const TextBox& where, ui::Colour colour, int offset, Each each);
    // Clips to the rectangle within the area being drawn; false when nothing of it is left.
    bool Clip(PixelRect rect);

    SDL_Renderer* renderer_;
    int scale_;
    PixelRect area_;
    Fonts fonts_;
    PictureCache pictures_;
    TextCache text_;
};

}  // namespace kr::sdl
