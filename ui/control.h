#pragma once
#include <cstdint>
#include <functional>
#include <string>
#include <vector>

#include "ui/picture.h"

namespace kr::ui {

enum class ControlKind : uint8_t { Panel, Picture, Label, Button, CheckBox, Shape };
enum class ShapeKind : uint8_t { Rectangle, Circle };
enum class Align : uint8_t { Left, Centre, Right };
// Mono is the game's "Courier New" (same metrics); Sans its sans-serif face; Narrow a condensed sans for
// figures and captions that must fit a small box.
enum class Face : uint8_t { Mono, Sans, Narrow };

struct Colour {
    uint8_t r = 0, g = 0, b = 0;
    friend bool operator==(const Colour&, const Colour&) = default;
};

struct Font {
    Face face = Face::Sans;
    bool bold = false;
    float points = 8.25f;
};

// A retained control of the window. Geometry is in twips relative to the parent
// (15 twips = 1 pixel at 96 dpi); single precision, as the game's bars shrink by fractions.
struct Control {
    std::string name;  // the form's name, "Label5" or "Image1(45)"
    ControlKind kind = ControlKind::Panel;
    Control* parent = nullptr;
    std::vector<Control*> children;  // drawing order: later children lie on top

    bool visible = true;
    bool enabled = true;
    float left = 0, top = 0, width = 0, height = 0;
    std::string caption;
    PictureRef picture;
    int16_t value = 0;  // check box: 1 checked, 0 not
    std::string tag;

    Colour back{128, 128, 128};
    Colour fore{0, 0, 0};
    bool transparent = false;  // labels: no background
    bool bordered = false;     // labels: a thin single border
    Font font;
    Align align = Align::Left;
    bool wordWrap = true;

    // Shapes: an outline of borderWidth pixels, optionally filled; they never take the mouse.
    ShapeKind shape = ShapeKind::Rectangle;
    Colour border{0, 0, 0};
    int borderWidth = 1;
    bool outlined = true;
    bool filled = false;
    Colour fill{0, 0, 0};

    std::function<void()> onMouseDown;
    std::function<void()> onClick;
    std::function<void()> onMouseMove;

    // A notice over the board that presses pass through to the cells beneath.
    bool mouseThrough = false;

    bool TakesMouse() const { return kind != ControlKind::Shape && !mouseThrough; }
};

}  // namespace kr::ui
