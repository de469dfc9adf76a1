#include "ui/sdl/damage.h"

#include "ui/sdl/drawn_state.h"

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
    Walk walk{renderer, form.Focused(), {}, 0};
    // Controls are only ever added; a new one anywhere starts the record afresh.
    if (form.All().size() != controls_) {
        controls_ = form.All().size();
        drawn_.clear();
        extents_.clear();
        whole_ = true;
    }
    for (const ui::Control* root : form.Roots()) Visit(walk, *root, nullptr, true, false);
    drawn_.resize(walk.next);
    extents_.resize(walk.next);
    if (whole_) {
        whole_ = false;
        return {kWindowPixels};
    }
    return std::move(walk.damaged);
}

void Damage::Visit(Walk& walk, const ui::Control& control, const Placement* parent, bool shown, bool parentMoved)
{
    const size_t index = walk.next++;
    if (index == drawn_.size()) {
        drawn_.emplace_back();
        extents_.emplace_back();
    }
    Drawn& drawn = drawn_[index];
    shown = shown && control.visible;
    if (drawn.control == &control && !shown && !drawn.shown) {
        // Hidden now and last time: so was everything inside it, as nothing shows through a hidden parent.
        walk.next = index + drawn.subtree;
        return;
    }
    if (drawn.control != &control) drawn = {&control, 1, false, {}, {}, {}};
    if (!shown) {
        AddRect(walk.damaged, extents_[index], kMostRects);
        extents_[index] = {};
        drawn.shown = false;
        for (const ui::Control* child : control.children) Visit(walk, *child, nullptr, false, true);
    } else {
        // Placing is a pure function of the bounds and the parent's placement: unchanged inputs, unchanged result.
        const std::array<float, 4> bounds{control.left, control.top, control.width, control.height};
        bool moved = parentMoved || !drawn.shown || drawn.bounds != bounds;
        if (moved) {
            const Placement placed = Place(control, parent);
            moved = !drawn.shown || !(placed == drawn.placed);
            drawn.placed = placed;
            drawn.bounds = bounds;
        }
        const Placement at = drawn.placed;
        const bool focused = &control == walk.focus;
        if (!drawn.shown || !drawn.state.Matches(control, at, focused)) {
            AddRect(walk.damaged, extents_[index], kMostRects);
            drawn.shown = true;
            drawn.state = DrawnState(control, at, focused);
            extents_[index] = walk.renderer.Extent(control, at);
            AddRect(walk.damaged, extents_[index], kMostRects);
        }
        for (const ui::Control* child : control.children) Visit(walk, *child, &at, true, moved);
    }
    // drawn_ may have grown: the reference above is no longer safe.
    drawn_[index].subtree = walk.next - index;
}

void Damage::Draw(FormRenderer& renderer, std::span<const PixelRect> areas) const
{
    for (const PixelRect& area : areas) {
        renderer.BeginArea(area);
        for (size_t i = 0; i < extents_.size(); ++i)
            if (!Intersect(extents_[i], area).Empty()) renderer.DrawControl(*drawn_[i].control, drawn_[i].state.At(), drawn_[i].state.Focused());
    }
    renderer.EndFrame();
}

}  // namespace kr::sdl

