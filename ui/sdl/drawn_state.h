#pragma once
#include <string>

#include "ui/control.h"
#include "ui/sdl/form_renderer.h"

namespace kr::sdl {

// Everything a shown control's own drawing depends on, its placement included: a control that still matches
// the state it was drawn in would draw the same pixels again.
class DrawnState {
public:
    DrawnState() = default;
    DrawnState(const ui::Control& control, const Placement& at, bool focused);

    bool Matches(const ui::Control& control, const Placement& at, bool focused) const;
    // Where it was drawn.
    const Placement& At() const { return at_; }
    // Whether it was drawn with the keyboard focus.
    bool Focused() const { return focused_; }

private:
    struct Look {
        ui::ControlKind kind = ui::ControlKind::Panel;
        bool enabled = true;
        ui::PictureRef picture;
        int16_t value = 0;
        ui::Colour back, fore, border, fill;
        bool transparent = false, bordered = false, wordWrap = true, outlined = true, filled = false;
        ui::Face face = ui::Face::Sans;
        bool bold = false;
        float points = 0;
        ui::Align align = ui::Align::Left;
        ui::ShapeKind shape = ui::ShapeKind::Rectangle;
        int borderWidth = 1;
        friend bool operator==(const Look&, const Look&) = default;
    };
    static Look LookOf(const ui::Control& control);

    Placement at_;
    bool focused_ = false;
    Look look_;
    std::string caption_;
};

}  // namespace kr::sdl
