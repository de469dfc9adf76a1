#include "ui/form.h"

#include <algorithm>
#include <stdexcept>

namespace kr::ui {

Control& Form::Add(Control* parent, std::string name, ControlKind kind)
{
    if (names_.count(name)) throw std::logic_error("Form::Add: duplicate control " + name);
    auto control = std::make_unique<Control>();
    control->name = name;
    control->kind = kind;
    control->parent = parent;
    Control& added = *control;
    (parent ? parent->children : roots_).push_back(&added);
    names_.emplace(std::move(name), &added);
    controls_.push_back(std::move(control));
    return added;
}

void Form::Alias(std::string role, Control& control)
{
    if (!names_.emplace(std::move(role), &control).second) throw std::logic_error("Form::Alias: duplicate name");
}

Control* Form::Find(std::string_view name) const
{
    const auto it = names_.find(name);
    return it == names_.end() ? nullptr : it->second;
}

Control& Form::operator[](std::string_view name) const
{
    if (Control* control = Find(name)) return *control;
    throw std::out_of_range("Form: no control named " + std::string(name));
}

Control* Form::FindByCaption(std::string_view text) const
{
    Control* found = nullptr;
    for (const auto& control : controls_)
        if (control->caption == text && Shown(*control)) found = control.get();
    return found;
}

Rect Form::Bounds(const Control& control) const
{
    Rect rect{control.left, control.top, control.width, control.height};
    for (const Control* p = control.parent; p; p = p->parent) {
        rect.left += p->left;
        rect.top += p->top;
    }
    return rect;
}

Rect Form::VisibleBounds(const Control& control) const
{
    Rect rect = Bounds(control);
    float right = std::min(rect.left + rect.width, kWidth);
    float bottom = std::min(rect.top + rect.height, kHeight);
    rect.left = std::max(rect.left, 0.0f);
    rect.top = std::max(rect.top, 0.0f);
    for (const Control* p = control.parent; p; p = p->parent) {
        const Rect outer = Bounds(*p);
        rect.left = std::max(rect.left, outer.left);
        rect.top = std::max(rect.top, outer.top);
        right = std::min(right, outer.left + outer.width);
        bottom = std::min(bottom, outer.top + outer.height);
    }
    rect.width = std::max(0.0f, right - rect.left);
    rect.height = std::max(0.0f, bottom - rect.top);
    return rect;
}

bool Form::Shown(const Control& control) const
{
    for (const Control* c = &control; c; c = c->parent)
        if (!c->visible) return false;
    return true;
}

Control* Form::HitIn(const std::vector<Control*>& layer, float x, float y) const
{
    for (auto it = layer.rbegin(); it != layer.rend(); ++it) {
        Control* control = *it;
        if (!control->visible || !control->enabled) continue;
        if (!VisibleBounds(*control).Contains(x, y)) continue;
        if (Control* child = HitIn(control->children, x, y)) return child;
        if (control->TakesMouse()) return control;
    }
    return nullptr;
}

Control* Form::HitTest(float x, float y) const { return HitIn(roots_, x, y); }

void Form::MouseDown(float x, float y)
{
    focused_ = nullptr;
    pressed_ = HitTest(x, y);
    if (pressed_ && pressed_->onMouseDown) pressed_->onMouseDown();
}

void Form::MouseUp(float x, float y)
{
    Control* pressed = pressed_;
    pressed_ = nullptr;
    if (!pressed || pressed != HitTest(x, y)) return;
    Click(*pressed);
}

void Form::Click(Control& control)
{
    if (control.kind == ControlKind::CheckBox) control.value = control.value == 1 ? 0 : 1;
    if (control.onClick) control.onClick();
}

void Form::MouseMove(float x, float y)
{
    Control* control = HitTest(x, y);
    if (!control) {
        if (onBackgroundMouseMove) onBackgroundMouseMove();
    } else if (control->onMouseMove) {
        control->onMouseMove();
    }
}

void Form::KeyDown(int keyCode, bool shift)
{
    // A focus lost to a hidden or disabled control is forgotten, so it cannot come back with its screen.
    focused_ = Focused();
    bool used = false;
    switch (keyCode) {
    case kTabKey: used = MoveFocus(shift ? -1 : 1); break;
    case kRightKey:
    case kDownKey: used = MoveFocus(1); break;
    case kLeftKey:
    case kUpKey: used = MoveFocus(-1); break;
    case kEnterKey:
    case kSpaceKey: used = ActivateFocus(); break;
    default: break;
    }
    if (!used && onKeyDown) onKeyDown(keyCode);
}

bool Form::Focusable(const Control& control) const
{
    if (control.kind != ControlKind::Button && control.kind != ControlKind::CheckBox) return false;
    // The hit test at its centre answers for all the rest: shown and enabled through every panel holding
    // it, inside the window and not lying under another screen.
    const Rect seen = VisibleBounds(control);
    if (seen.width <= 0 || seen.height <= 0) return false;
    return HitTest(seen.left + seen.width / 2, seen.top + seen.height / 2) == &control;
}

std::vector<Control*> Form::FocusOrder() const
{
    std::vector<Control*> order;
    for (const auto& control : controls_)
        if (Focusable(*control)) order.push_back(control.get());
    std::stable_sort(order.begin(), order.end(), [this](const Control* a, const Control* b) {
        const Rect ra = Bounds(*a), rb = Bounds(*b);
        return ra.top != rb.top ? ra.top < rb.top : ra.left < rb.left;
    });
    return order;
}

Control* Form::Focused() const { return focused_ && Focusable(*focused_) ? focused_ : nullptr; }

bool Form::MoveFocus(int step)
{
    const std::vector<Control*> order = FocusOrder();
    if (order.empty()) {
        focused_ = nullptr;
        return false;
    }
    const auto count = static_cast<std::ptrdiff_t>(order.size());
    const auto at = std::find(order.begin(), order.end(), Focused());
    std::ptrdiff_t next = 0;
    if (at != order.end()) next = ((at - order.begin() + step) % count + count) % count;
    else if (step < 0) next = count - 1;
    focused_ = order[static_cast<size_t>(next)];
    return true;
}

bool Form::ActivateFocus()
{
    Control* control = Focused();
    if (!control) return false;
    Click(*control);
    if (!Focused()) {
        const std::vector<Control*> order = FocusOrder();
        focused_ = order.empty() ? nullptr : order.front();
    }
    return true;
}

}  // namespace kr::ui
