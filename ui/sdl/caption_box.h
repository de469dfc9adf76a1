#pragma once
#include "ui/control.h"
#include "ui/sdl/shapes.h"

namespace kr::sdl {

// The side of a check box's square, in 1x pixels; its caption starts a little to the right of it.
inline constexpr int kCheckBoxSide = 13;

// Where a caption is set: a box in 1x window pixels and how its lines sit in it.
struct TextBox {
    PixelRect box;
    // The widest a line may be: the box less a pixel kept clear on each side a line can reach. Wrapping
    // breaks at it, and every caption of the game's layout fits it.
    int room = 0;
    ui::Align align = ui::Align::Left;
    bool wrap = false;
    bool centreVertically = false;
};

// The box the caption of a label, button or check box drawn at `rect` is set in. The renderer draws by it
// and the layout checks measure against it, so both break lines at the same width.
TextBox CaptionBox(const ui::Control& control, PixelRect rect);

}  // namespace kr::sdl
