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

// Draws a form onto one renderer at a whole scale. The renderer's logical size must be the window's
// 576 x 447, so everything here is placed in 1x pixels while textures are rasterised at the real size.
class FormRenderer {
public:
    static constexpr ui::Colour kWindowColour{128, 128, 128};

    FormRenderer(SDL_Renderer* renderer, const Assets& assets, int scale);
    FormRenderer(const FormRenderer&) = delete;
    FormRenderer& operator=(const FormRenderer&) = delete;

    // Clears to the window colour and draws every shown control, later siblings on top; does not present.
    void Draw(const ui::Form& form);

    int Scale() const { return scale_; }
    // Pictures and text lines rasterised so far: a redraw of an unchanged screen adds none.
    uint64_t Rasterised() const { return pictures_.Rasterised() + text_.Rasterised(); }

private:
    void DrawTree(const ui::Form& form, const ui::Control& control);
    void DrawPicture(const ui::Control& control, PixelRect rect);
    void DrawLabel(const ui::Control& control, PixelRect rect, PixelRect own, PixelRect ancestors);
    void DrawButton(const ui::Control& control, PixelRect rect);
    void DrawCheckBox(const ui::Control& control, PixelRect rect, PixelRect ancestors);
    void DrawShape(const ui::Control& control, PixelRect rect);
    void DrawText(const ui::Control& control, const TextBox& where);
    void DrawLines(const std::vector<std::string>& lines, const ui::Font& font, ui::Colour colour,
                   const TextBox& where, int offset);
    void Clip(PixelRect rect);

    SDL_Renderer* renderer_;
    int scale_;
    Fonts fonts_;
    PictureCache pictures_;
    TextCache text_;
};

}  // namespace kr::sdl
