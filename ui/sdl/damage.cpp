#include "ui/sdl/damage.h"

#include "ui/sdl/control_signature.h"

namespace kr::sdl {
namespace {

// A board's fall moves eight columns of cells; more pieces than that are cheaper drawn as one.
constexpr size_t kMostRects = 16;

bool Touch(PixelRect a, PixelRect b)
{
    return a.x <= b.x + b.w && b.x <= a.x + a.w && a.y <= b.y + b.h && b.y <= a.y + a.h;
}

}  // namespace

void AddRect(std::vector<PixelRect>& rects, PixelRect rect, size_t most)
{
    if (rect.Empty()) return;
    for (size_t i = 0; i < rects.size();) {
        if (!Touch(rects[i], rect)) {
            ++i;
            continue;
        }
        rect = Union(rects[i], rect);
        rects.erase(rects.begin() + static_cast<std::ptrdiff_t>(i));
        i = 0;
    }
    rects.push_back(rect);
    if (rects.size() <= most) return;
    PixelRect all;
    for (const PixelRect& r : rects) all = Union(all, r);
    rects.assign(1, all);
}

std::vector<PixelRect> Damage::Collect(const ui::Form& form, FormRenderer& renderer)
{
    Walk walk{renderer, {}, 0};
    for (const ui::Control* root : form.Roots()) Visit(walk, *root, nullptr, true);
    drawn_.resize(walk.next);
    if (whole_) {
        whole_ = false;
        return {kWindowPixels};
    }
    return std::move(walk.damaged);
}

void Damage::Visit(Walk& walk, const ui::Control& control, const Placement* parent, bool shown)
{
    if (walk.next == drawn_.size()) drawn_.emplace_back();
    Drawn& drawn = drawn_[walk.next++];
    // The same controls in the same order as last time, or the window is drawn anew.
    if (drawn.control != &control) {
        drawn = {&control, false, 0, {}};
        whole_ = true;
    }
    shown = shown && control.visible;
    if (!shown) {
        if (drawn.shown) {
            AddRect(walk.damaged, drawn.extent, kMostRects);
            drawn.shown = false;
        }
        for (const ui::Control* child : control.children) Visit(walk, *child, nullptr, false);
        return;
    }
    const Placement at = Place(control, parent);
    const uint64_t signature = ControlSignature(control, at);
    if (!drawn.shown || drawn.signature != signature) {
        AddRect(walk.damaged, drawn.shown ? drawn.extent : PixelRect{}, kMostRects);
        drawn.shown = true;
        drawn.signature = signature;
        drawn.extent = walk.renderer.Extent(control, at);
        AddRect(walk.damaged, drawn.extent, kMostRects);
    }
    for (const ui::Control* child : control.children) Visit(walk, *child, &at, true);
}

}  // namespace kr::sdl
