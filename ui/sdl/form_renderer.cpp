#include "ui/sdl/form_renderer.h"

#include <algorithm>
#include <cmath>

#include "ui/sdl/focus_ring.h"

namespace kr::sdl {
namespace {

constexpr int kTwipsPerPixel = 15;
constexpr ui::Colour kBlack{0, 0, 0};
constexpr ui::Colour kWhite{255, 255, 255};
constexpr ui::Colour kGreyedText{128, 128, 128};

int ToPixel(float twips) { return static_cast<int>(std::floor(twips / kTwipsPerPixel + 0.5f)); }

ui::Colour Darker(ui::Colour c)
{
    return {static_cast<uint8_t>(c.r / 2), static_cast<uint8_t>(c.g / 2), static_cast<uint8_t>(c.b / 2)};
}

// The tick of a check box, seven pixels square, drawn three pixels in from the box's corner.
constexpr const char* kTick[7] = {
    "......#", ".....##", "#...###", "##.###.", "#####..", ".###...", "..#....",
};

}  // namespace

PixelRect ToPixels(const ui::Rect& twips)
{
    const int x = ToPixel(twips.left), y = ToPixel(twips.top);
    return {x, y, ToPixel(twips.left + twips.width) - x, ToPixel(twips.top + twips.height) - y};
}

FormRenderer::FormRenderer(SDL_Renderer* renderer, const Assets& assets, int scale)
    : renderer_(renderer), scale_(scale), fonts_(scale), pictures_(renderer, assets, scale), text_(renderer, fonts_)
{
}

void FormRenderer::Clip(PixelRect rect)
{
    const SDL_Rect r = rect.Sdl();
    SDL_RenderSetClipRect(renderer_, &r);
}

void FormRenderer::Draw(const ui::Form& form)
{
    SDL_RenderSetClipRect(renderer_, nullptr);
    SDL_SetRenderDrawColor(renderer_, kWindowColour.r, kWindowColour.g, kWindowColour.b, 255);
    SDL_RenderClear(renderer_);
    for (const ui::Control* root : form.Roots()) DrawTree(form, *root);
    DrawFocusRing(renderer_, form);
    SDL_RenderSetClipRect(renderer_, nullptr);
    text_.EndFrame();
}

void FormRenderer::DrawTree(const ui::Form& form, const ui::Control& control)
{
    if (!control.visible) return;
    const PixelRect rect = ToPixels(form.Bounds(control));
    const PixelRect own = ToPixels(form.VisibleBounds(control));
    const PixelRect ancestors = control.parent ? ToPixels(form.VisibleBounds(*control.parent))
                                               : ToPixels({0, 0, ui::Form::kWidth, ui::Form::kHeight});
    // Text may run past its own control, never past the panels holding it. An empty clip would switch
    // SDL's clipping off rather than hide everything, so nothing is drawn through one.
    if (ancestors.Empty()) return;
    switch (control.kind) {
    case ui::ControlKind::Label:
        DrawLabel(control, rect, own, ancestors);
        break;
    case ui::ControlKind::CheckBox:
        DrawCheckBox(control, rect, ancestors);
        break;
    default:
        if (own.Empty()) break;
        Clip(own);
        if (control.kind == ui::ControlKind::Panel) FillRect(renderer_, rect, control.back);
        else if (control.kind == ui::ControlKind::Picture) DrawPicture(control, rect);
        else if (control.kind == ui::ControlKind::Button) DrawButton(control, rect);
        else if (control.kind == ui::ControlKind::Shape) DrawShape(control, rect);
        break;
    }
    for (const ui::Control* child : control.children) DrawTree(form, *child);
}

void FormRenderer::DrawPicture(const ui::Control& control, PixelRect rect)
{
    const std::optional<ui::PixelSize> size = ui::SizeOf(control.picture);
    if (!size) return;
    SDL_Texture* texture = pictures_.Get(control.picture);
    if (!texture) return;
    // At its natural size from the top-left corner: a 33-pixel board cell shows a 32-pixel gem.
    const SDL_Rect to{rect.x, rect.y, size->width, size->height};
    SDL_RenderCopy(renderer_, texture, nullptr, &to);
}

void FormRenderer::DrawLabel(const ui::Control& control, PixelRect rect, PixelRect own, PixelRect ancestors)
{
    if (!own.Empty() && (!control.transparent || control.bordered)) {
        Clip(own);
        if (!control.transparent) FillRect(renderer_, rect, control.back);
        if (control.bordered) FrameRect(renderer_, rect, 1, kBlack);
    }
    Clip(ancestors);
    DrawText(control, CaptionBox(control, rect));
}

void FormRenderer::DrawButton(const ui::Control& control, PixelRect rect)
{
    FillRect(renderer_, rect, control.back);
    FrameRect(renderer_, rect, 1, Darker(control.back));
    DrawText(control, CaptionBox(control, rect));
}

void FormRenderer::DrawCheckBox(const ui::Control& control, PixelRect rect, PixelRect ancestors)
{
    Clip(ancestors);
    FillRect(renderer_, rect, control.back);
    const PixelRect box{rect.x, rect.y + (rect.h - kCheckBoxSide) / 2, kCheckBoxSide, kCheckBoxSide};
    FillRect(renderer_, box, kWhite);
    FrameRect(renderer_, box, 1, kBlack);
    if (control.value == 1) {
        SDL_SetRenderDrawColor(renderer_, 0, 0, 0, 255);
        for (int row = 0; row < 7; ++row)
            for (int column = 0; column < 7; ++column)
                if (kTick[row][column] == '#') {
                    const SDL_Rect dot{box.x + 3 + column, box.y + 3 + row, 1, 1};
                    SDL_RenderFillRect(renderer_, &dot);
                }
    }
    DrawText(control, CaptionBox(control, rect));
}

void FormRenderer::DrawShape(const ui::Control& control, PixelRect rect)
{
    const int width = std::max(control.borderWidth, 1);
    if (control.shape == ui::ShapeKind::Circle) {
        DrawEllipse(renderer_, rect, scale_, control.filled ? std::optional(control.fill) : std::nullopt,
                    control.outlined ? std::optional(control.border) : std::nullopt, width);
        return;
    }
    if (control.filled) FillRect(renderer_, rect, control.fill);
    if (control.outlined) FrameRect(renderer_, rect, width, control.border);
}

void FormRenderer::DrawText(const ui::Control& control, const TextBox& where)
{
    if (control.caption.empty()) return;
    const int wrapWidth = where.wrap ? std::max(where.room * scale_, 1) : 0;
    const std::vector<std::string>& lines = text_.Lines(control.caption, control.font, wrapWidth);
    if (control.enabled) {
        DrawLines(lines, control.font, control.fore, where, 0);
        return;
    }
    // Greyed and embossed, as a disabled control shows its caption.
    DrawLines(lines, control.font, kWhite, where, scale_);
    DrawLines(lines, control.font, kGreyedText, where, 0);
}

void FormRenderer::DrawLines(const std::vector<std::string>& lines, const ui::Font& font, ui::Colour colour,
                             const TextBox& where, int offset)
{
    // Worked out in device pixels, so centring at 2x lands on the real half pixel.
    const int lineHeight = text_.LineHeight(font);
    const int boxWidth = where.box.w * scale_;
    int y = where.box.y * scale_ + offset;
    if (where.centreVertically) y += (where.box.h * scale_ - static_cast<int>(lines.size()) * lineHeight) / 2;
    const float unit = 1.0f / static_cast<float>(scale_);
    for (const std::string& line : lines) {
        const TextLine text = text_.Line(line, font, colour);
        if (text.texture) {
            int x = where.box.x * scale_ + offset;
            if (where.align == ui::Align::Centre) x += (boxWidth - text.width) / 2;
            else if (where.align == ui::Align::Right) x += boxWidth - text.width;
            const SDL_FRect to{static_cast<float>(x) * unit, static_cast<float>(y) * unit,
                               static_cast<float>(text.width) * unit, static_cast<float>(text.height) * unit};
            SDL_RenderCopyF(renderer_, text.texture, nullptr, &to);
        }
        y += lineHeight;
    }
}

}  // namespace kr::sdl
