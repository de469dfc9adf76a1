#pragma once
#include <functional>
#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "ui/control.h"

namespace kr::ui {

struct Rect {
    float left = 0, top = 0, width = 0, height = 0;
    bool Contains(float x, float y) const { return x >= left && y >= top && x < left + width && y < top + height; }
};

// The game's one window: its controls, their names, the pointer, and the routing of input.
class Form {
public:
    static constexpr float kWidth = 8640;   // client area, twips
    static constexpr float kHeight = 6705;

    // The keys the keyboard focus answers to.
    static constexpr int kTabKey = 9;
    static constexpr int kEnterKey = 13;
    static constexpr int kSpaceKey = 32;
    static constexpr int kLeftKey = 37;
    static constexpr int kUpKey = 38;
    static constexpr int kRightKey = 39;
    static constexpr int kDownKey = 40;

    Form() = default;
    Form(const Form&) = delete;
    Form& operator=(const Form&) = delete;

    // Adds a control on top of its siblings; parent nullptr is the window itself.
    Control& Add(Control* parent, std::string name, ControlKind kind);

    // A second name for a control, the role a rule gives it ("NoMovesLabel").
    void Alias(std::string role, Control& control);

    // Looks a control up by form name or role; an unknown name is a programming error and throws.
    Control& operator[](std::string_view name) const;
    Control* Find(std::string_view name) const;

    // The topmost shown control with this caption, or nullptr.
    Control* FindByCaption(std::string_view text) const;

    const std::vector<Control*>& Roots() const { return roots_; }
    const std::vector<std::unique_ptr<Control>>& All() const { return controls_; }

    // Window position and the visible part (clipped by every ancestor panel and the window).
    Rect Bounds(const Control& control) const;
    Rect VisibleBounds(const Control& control) const;
    // Visible itself and through all its ancestors.
    bool Shown(const Control& control) const;

    // The topmost shown, enabled control under the point that takes the mouse, or nullptr (window background).
    Control* HitTest(float x, float y) const;

    // Input, in window twips. A click is a mouse-down and a release over the same control; a press also
    // takes the keyboard focus away, as the mouse is then in use.
    void MouseDown(float x, float y);
    void MouseUp(float x, float y);
    void MouseMove(float x, float y);
    // Tab (Shift+Tab backwards) and the arrows move the keyboard focus, Enter and Space click the focused
    // control; other keys, and these when they have nothing to act on, go to onKeyDown.
    void KeyDown(int keyCode, bool shift = false);

    // The buttons and check boxes the keyboard can reach on what is shown: enabled, in sight and not covered,
    // top to bottom and, at the same top, left to right.
    std::vector<Control*> FocusOrder() const;
    // The focused control, or nullptr; one hidden, disabled or covered since it took the focus has lost it.
    Control* Focused() const;
    // Moves the focus `step` places along the order, wrapping round; without a focus, forwards starts at the
    // first control and backwards at the last. False when nothing can take the focus.
    bool MoveFocus(int step);
    // Clicks the focused control with the mouse's own handler. When the click takes the screen away, the
    // focus moves to the first control of the screen shown now, or is cleared. False without a focus.
    bool ActivateFocus();

    std::function<void(int)> onKeyDown;
    std::function<void()> onBackgroundMouseMove;

    PictureRef pointer;
    std::string caption;
    PictureRef icon;

private:
    Control* HitIn(const std::vector<Control*>& layer, float x, float y) const;
    bool Focusable(const Control& control) const;
    void Click(Control& control);

    std::vector<std::unique_ptr<Control>> controls_;
    std::vector<Control*> roots_;
    std::map<std::string, Control*, std::less<>> names_;
    Control* pressed_ = nullptr;
    Control* focused_ = nullptr;
};

}  // namespace kr::ui
