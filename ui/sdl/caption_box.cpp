#include "ui/sdl/caption_box.h"

namespace kr::sdl {
namespace {

// A label painted as a box of its own is pressed like a button and may carry an outline over its edges:
// its caption keeps clear of them.
constexpr int kPaintedLabelPadding = 3;
constexpr int kButtonInset = 2;
constexpr int kCheckBoxGap = 4;
constexpr int kClearance = 1;

TextBox Box(PixelRect box, ui::Align align, bool wrap, bool centreVertically)
{
    // A left- or right-aligned line starts at its edge by design and only runs out at the other one.
    const int sides = align == ui::Align::Centre ? 2 : 1;
    return {box, box.w - sides * kClearance, align, wrap, centreVertically};
}

}  // namespace

TextBox CaptionBox(const ui::Control& control, PixelRect rect)
{
    switch (control.kind) {
    case ui::ControlKind::Button:
        return Box({rect.x + kButtonInset, rect.y + kButtonInset, rect.w - 2 * kButtonInset, rect.h - 2 * kButtonInset},
                   ui::Align::Centre, true, true);
    case ui::ControlKind::CheckBox: {
        const int gap = kCheckBoxSide + kCheckBoxGap;
        return Box({rect.x + gap, rect.y, rect.w - gap, rect.h}, ui::Align::Left, false, true);
    }
    default: {
        const int inset = control.bordered ? 1 : 0;
        const int side = control.transparent ? inset : kPaintedLabelPadding;
        return Box({rect.x + side, rect.y + inset, rect.w - 2 * side, rect.h - 2 * inset}, control.align,
                   control.wordWrap, false);
    }
    }
}

}  // namespace kr::sdl
