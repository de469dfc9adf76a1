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

// Whole pixels round down, also left of the window, where a wide centred caption may start.
int FloorDiv(int value, int divisor) { return value >= 0 ? value / divisor : -((-value + divisor - 1) / divisor); }

ui::Colour Darker(ui::Colour c)
{
    return {static_cast<uint8_t>(c.r / 2), static_cast<uint8_t>(c.g / 2), static_cast<uint8_t>(c.b / 2)};
}

// The tick of a check box, seven pixels square, drawn three pixels in from the box's corner.
constexpr const char* kTick[7] = {
    "......#", ".....##", "#...###", "##.###.", "#####..", ".###...", "..#....",
};

PixelRect EdgesToPixels(float left, float top, float right, float bottom)
{
    const int x = ToPixel(left), y = ToPixel(top);
    return {x, y, ToPixel(right) - x, ToPixel(bottom) - y};
}

}  // namespace

PixelRect ToPixels(const ui::Rect& twips)
{
    return EdgesToPixels(twips.left, twips.top, twips.left + twips.width, twips.top + twips.height);
}

Placement Place(const ui::Control& control, const Placement* parent)
{
    Placement at;
    at.left = (parent ? parent->left : 0) + control.left;
    at.top = (parent ? parent->top : 0) + control.top;
    const float right = at.left + control.width, bottom = at.top + control.height;
    const float limitLeft = parent ? parent->visibleLeft : 0, limitTop = parent ? parent->visibleTop : 0;
    const float limitRight = parent ? parent->visibleRight : ui::Form::kWidth;
    const float limitBottom = parent ? parent->visibleBottom : ui::Form::kHeight;
    at.visibleLeft = std::max(at.left, limitLeft);
    at.visibleTop = std::max(at.top, limitTop);
    at.visibleRight = std::max(at.visibleLeft, std::min(right, limitRight));
    at.visibleBottom = std::max(at.visibleTop, std::min(bottom, limitBottom));
    at.rect = EdgesToPixels(at.left, at.top, right, bottom);
    at.own = EdgesToPixels(at.visibleLeft, at.visibleTop, at.visibleRight, at.visibleBottom);
    at.ancestors = parent ? parent->own : kWindowPixels;
    return at;
}

PixelRect Union(PixelRect a, PixelRect b)
{
    if (a.Empty()) return b;
    if (b.Empty()) return a;
    const int x = std::min(a.x, b.x), y = std::min(a.y, b.y);
    return {x, y, std::max(a.x + a.w, b.x + b.w) - x, std::max(a.y + a.h, b.y + b.h) - y};
}

PixelRect Intersect(PixelRect a, PixelRect b)
{
    const int x = std::max(a.x, b.x), y = std::max(a.y, b.y);
    return {x, y, std::min(a.x + a.w, b.x + b.w) - x, std::min(a.y + a.h, b.y + b.h) - y};
}

FormRenderer::FormRenderer(SDL_Renderer* renderer, const Assets& assets, int scale)
    : renderer_(renderer), scale_(scale), area_(kWindowPixels), fonts_(scale), pictures_(renderer, assets, scale),
      text_(renderer, fonts_)
{
}

bool FormRenderer::Clip(PixelRect rect)
{
    // An empty clip would switch SDL's clipping off rather than hide everything, so nothing is drawn through one.
    const PixelRect visible = Intersect(rect, area_);
    if (visible.Empty()) return false;
    const SDL_Rect r = visible.Sdl();
    SDL_RenderSetClipRect(renderer_, &r);
    return true;
}

void FormRenderer::Draw(const ui::Form& form)
{
    BeginArea(kWindowPixels);
    for (const ui::Control* root : form.Roots()) DrawTree(*root, nullptr, form.Focused());
    EndFrame();
}

void FormRenderer::BeginArea(PixelRect area)
{
    area_ = Intersect(area, kWindowPixels);
    // Filled rather than cleared: a clear ignores the clip.
    if (Clip(area_)) FillRect(renderer_, area_, kWindowColour);
}

void FormRenderer::EndFrame()
{
    SDL_RenderSetClipRect(renderer_, nullptr);
    area_ = kWindowPixels;
    text_.EndFrame();
}

void FormRenderer::DrawTree(const ui::Control& control, const Placement* parent, const ui::Control* focus)
{
    if (!control.visible) return;
    const Placement at = Place(control, parent);
    DrawControl(control, at, &control == focus);
    for (const ui::Control* child : control.children) DrawTree(*child, &at, focus);
}

void FormRenderer::DrawControl(const ui::Control& control, const Placement& at, bool focused)
{
    DrawFace(control, at);
    if (focused && Clip(at.own)) DrawFocusRing(renderer_, control, at.rect);
}

void FormRenderer::DrawFace(const ui::Control& control, const Placement& at)
{
    // Text may run past its own control, never past the panels holding it.
    if (Intersect(at.ancestors, area_).Empty()) return;
    switch (control.kind) {
    case ui::ControlKind::Label:
        DrawLabel(control, at);
        break;
    case ui::ControlKind::CheckBox:
        DrawCheckBox(control, at);
        break;
    default:
        if (!Clip(at.own)) break;
        if (control.kind == ui::ControlKind::Panel) FillRect(renderer_, at.rect, control.back);
        else if (control.kind == ui::ControlKind::Picture) DrawPicture(control, at.rect);
        else if (control.kind == ui::ControlKind::Button) DrawButton(control, at.rect);
        else if (control.kind == ui::ControlKind::Shape) DrawShape(control, at.rect);
        break;
    }
}

PixelRect FormRenderer::Extent(const ui::Control& control, const Placement& at)
{
    if (at.ancestors.Empty()) return {};
    switch (control.kind) {
    case ui::ControlKind::Label:
    case ui::ControlKind::CheckBox: {
        // A label's caption and a check box's whole face are clipped by the ancestors only.
        const bool face = control.kind == ui::ControlKind::CheckBox || !control.transparent || control.bordered;
        const PixelRect box = face ? (control.kind == ui::ControlKind::CheckBox ? at.rect : at.own) : PixelRect{};
        const PixelRect text = CaptionExtent(control, CaptionBox(control, at.rect));
        return Intersect(Union(box, text), at.ancestors);
    }
    default:
        return at.own;
    }
}

PixelRect FormRenderer::CaptionExtent(const ui::Control& control, const TextBox& where)
{
    PixelRect extent;
    const ui::Colour colour = control.enabled ? control.fore : kGreyedText;
    PlaceLines(control, where, colour, 0, [&](const TextLine&, const SDL_Rect& device) {
        const int left = FloorDiv(device.x, scale_), top = FloorDiv(device.y, scale_);
        const int right = -FloorDiv(-(device.x + device.w), scale_), bottom = -FloorDiv(-(device.y + device.h), scale_);
        extent = Union(extent, {left, top, right - left, bottom - top});
    });
    // The embossed white copy of a greyed caption lies one pixel right and down.
    if (!control.enabled && !extent.Empty()) ++extent.w, ++extent.h;
    return extent;
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

void FormRenderer::DrawLabel(const ui::Control& control, const Placement& at)
{
    if (!control.transparent || control.bordered) {
        if (Clip(at.own)) {
            if (!control.transparent) FillRect(renderer_, at.rect, control.back);
            if (control.bordered) FrameRect(renderer_, at.rect, 1, kBlack);
        }
    }
    if (Clip(at.ancestors)) DrawText(control, CaptionBox(control, at.rect));
}

void FormRenderer::DrawButton(const ui::Control& control, PixelRect rect)
{
    FillRect(renderer_, rect, control.back);
    FrameRect(renderer_, rect, 1, Darker(control.back));
    DrawText(control, CaptionBox(control, rect));
}

void FormRenderer::DrawCheckBox(const ui::Control& control, const Placement& at)
{
    if (!Clip(at.ancestors)) return;
    const PixelRect rect = at.rect;
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
    const float unit = 1.0f / static_cast<float>(scale_);
    const auto copy = [&](const TextLine& text, const SDL_Rect& device) {
        const SDL_FRect to{static_cast<float>(device.x) * unit, static_cast<float>(device.y) * unit,
                           static_cast<float>(device.w) * unit, static_cast<float>(device.h) * unit};
        SDL_RenderCopyF(renderer_, text.texture, nullptr, &to);
    };
    if (control.enabled) {
        PlaceLines(control, where, control.fore, 0, copy);
        return;
    }
    // Greyed and embossed, as a disabled control shows its caption.
    PlaceLines(control, where, kWhite, scale_, copy);
    PlaceLines(control, where, kGreyedText, 0, copy);
}

template <typename Each>
void FormRenderer::PlaceLines(const ui::Control& control, const TextBox& where, ui::Colour colour, int offset,
                              Each each)
{
    if (control.caption.empty()) return;
    // Worked out in device pixels, so centring at 2x lands on the real half pixel.
    const int wrapWidth = where.wrap ? std::max(where.room * scale_, 1) : 0;
    const std::vector<std::string>& lines = text_.Lines(control.caption, control.font, wrapWidth);
    const int lineHeight = text_.LineHeight(control.font);
    const int boxWidth = where.box.w * scale_;
    int y = where.box.y * scale_ + offset;
    if (where.centreVertically) y += (where.box.h * scale_ - static_cast<int>(lines.size()) * lineHeight) / 2;
    for (const std::string& line : lines) {
        const TextLine text = text_.Line(line, control.font, colour);
        if (text.texture) {
            int x = where.box.x * scale_ + offset;
            if (where.align == ui::Align::Centre) x += (boxWidth - text.width) / 2;
            else if (where.align == ui::Align::Right) x += boxWidth - text.width;
            each(text, SDL_Rect{x, y, text.width, text.height});
        }
        y += lineHeight;
    }
}

}  // namespace kr::sdl
