#pragma once
#include <array>
#include <cstdint>
#include <span>
#include <vector>

#include "ui/form.h"
#include "ui/sdl/drawn_state.h"
#include "ui/sdl/form_renderer.h"

namespace kr::sdl {

// Which parts of the window must be drawn again. Every control is compared with how it was last drawn (its
// placement, whether it shows through all its ancestors, caption, picture, colours, value, ...); a changed one
// damages both where it painted and where it paints now.
class Damage {
public:
    // The rectangles to redraw since the last call, in window pixels, overlapping ones merged; the whole window
    // after Invalidate. Either way it remembers the controls as they are now.
    std::vector<PixelRect> Collect(const ui::Form& form, FormRenderer& renderer);
    // The window's pixels are lost: the next Collect returns all of it.
    void Invalidate() { whole_ = true; }
    // Draws the areas as a full draw of the form at the last Collect would, visiting only the controls that
    // paint inside them.
    void Draw(FormRenderer& renderer, std::span<const PixelRect> areas) const;

private:
    struct Drawn {
        const ui::Control* control = nullptr;
        size_t subtree = 1;  // entries of the control and everything inside it
        bool shown = false;
        DrawnState state;
        // Where the last walk placed it and from which bounds: unmoved under an unmoved parent, it lands there again.
        std::array<float, 4> bounds{};
        Placement placed;
    };
    struct Walk {
        FormRenderer& renderer;
        const ui::Control* focus;
        std::vector<PixelRect> damaged;
        size_t next;
    };

    // Compares one control and its children, in drawing order, with how they were drawn. `parentMoved` is false
    // when the parent landed exactly where the last walk placed it.
    void Visit(Walk& walk, const ui::Control& control, const Placement* parent, bool shown, bool parentMoved);

    std::vector<Drawn> drawn_;  // in drawing order
    // What each of them painted (empty when hidden), kept apart so a search of them stays small in memory.
    std::vector<PixelRect> extents_;
    size_t controls_ = 0;
    bool whole_ = true;
};

// Adds a rectangle to a set, merging it with every one it overlaps or touches until none do; past `most`
// rectangles the set becomes their bounding box, as many small copies cost more than one larger one.
void AddRect(std::vector<PixelRect>& rects, PixelRect rect, size_t most);

}  // namespace kr::sdl
