#include "ui/sdl/control_signature.h"

#include <cstring>
#include <string_view>
#include <type_traits>

namespace kr::sdl {
namespace {

// FNV-1a: a few hundred controls a frame, so cheap beats strong.
class Hash {
public:
    void Bytes(const void* data, size_t size)
    {
        const auto* bytes = static_cast<const unsigned char*>(data);
        for (size_t i = 0; i < size; ++i) {
            value_ ^= bytes[i];
            value_ *= 0x100000001b3ull;
        }
    }
    template <typename T>
    void Add(const T& value)
    {
        static_assert(std::is_arithmetic_v<T> || std::is_enum_v<T> || std::is_pointer_v<T>);
        Bytes(&value, sizeof value);
    }
    void Add(std::string_view text)
    {
        Add(text.size());
        Bytes(text.data(), text.size());
    }
    void Add(ui::Colour colour)
    {
        Add(colour.r);
        Add(colour.g);
        Add(colour.b);
    }
    void Add(ui::PictureRef picture)
    {
        Add(picture.set);
        Add(picture.index);
    }
    void Add(PixelRect rect)
    {
        Add(rect.x);
        Add(rect.y);
        Add(rect.w);
        Add(rect.h);
    }
    uint64_t Value() const { return value_; }

private:
    uint64_t value_ = 0xcbf29ce484222325ull;
};

}  // namespace

uint64_t ControlSignature(const ui::Control& control, const Placement& placement)
{
    Hash hash;
    hash.Add(control.kind);
    hash.Add(placement.rect);
    hash.Add(placement.own);
    hash.Add(placement.ancestors);
    hash.Add(control.enabled);
    switch (control.kind) {
    case ui::ControlKind::Panel:
        hash.Add(control.back);
        break;
    case ui::ControlKind::Picture:
        hash.Add(control.picture);
        break;
    case ui::ControlKind::Label:
    case ui::ControlKind::Button:
    case ui::ControlKind::CheckBox:
        hash.Add(std::string_view(control.caption));
        hash.Add(control.value);
        hash.Add(control.back);
        hash.Add(control.fore);
        hash.Add(control.transparent);
        hash.Add(control.bordered);
        hash.Add(control.font.face);
        hash.Add(control.font.bold);
        hash.Add(control.font.points);
        hash.Add(control.align);
        hash.Add(control.wordWrap);
        break;
    case ui::ControlKind::Shape:
        hash.Add(control.shape);
        hash.Add(control.border);
        hash.Add(control.borderWidth);
        hash.Add(control.outlined);
        hash.Add(control.filled);
        hash.Add(control.fill);
        break;
    }
    return hash.Value();
}

}  // namespace kr::sdl
