#include "ui/sdl/drawn_state.h"

namespace kr::sdl {
DrawnState::DrawnState(const ui::Control& control, const Placement& at, bool focused)
    : at_(at), focused_(focused), look_(LookOf(control)), caption_(control.caption)
{
}

bool DrawnState::Matches(const ui::Control& control, const Placement& at, bool focused) const
{
    return focused_ == focused && at_.rect == at.rect && at_.own == at.own && at_.ancestors == at.ancestors &&
           look_ == LookOf(control) && caption_ == control.caption;
}

DrawnState::Look DrawnState::LookOf(const ui::Control& c)
{
    return {c.kind, c.enabled, c.picture, c.value, c.back, c.fore, c.border, c.fill, c.transparent, c.bordered,
            c.wordWrap, c.outlined, c.filled, c.font.face, c.font.bold, c.font.points, c.align, c.shape,
            c.borderWidth};
}

}  // namespace kr::sdl
