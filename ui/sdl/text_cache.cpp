#include "ui/sdl/text_cache.h"

#include <iterator>

#include "ui/sdl/lines.h"

namespace kr::sdl {
namespace {

// Large enough for every label of the busiest screen, small enough that a long game holds little.
constexpr size_t kKeepBelow = 768;

template <typename Map>
void DropUnused(Map& map, uint64_t frame)
{
    for (auto it = map.begin(); it != map.end();)
        it = it->second.usedInFrame == frame ? std::next(it) : map.erase(it);
}

}  // namespace

TextCache::TextCache(SDL_Renderer* renderer, Fonts& fonts) : renderer_(renderer), fonts_(fonts) {}

std::string TextCache::Key(const std::string& text, const ui::Font& font, int extra) const
{
    std::string key = text;
    key += '\0';
    key += static_cast<char>(font.face);
    key += font.bold ? 'b' : 'r';
    key += std::to_string(fonts_.PixelSize(font));
    key += '/';
    key += std::to_string(extra);
    return key;
}

const std::vector<std::string>& TextCache::Lines(const std::string& caption, const ui::Font& font, int wrapWidth)
{
    Layout& layout = layouts_[Key(caption, font, wrapWidth)];
    if (layout.usedInFrame == 0) {
        TTF_Font* face = fonts_.Get(font);
        layout.lines = SplitLines(caption, wrapWidth, [face](std::string_view text) {
            int width = 0;
            const std::string line(text);
            TTF_SizeUTF8(face, line.c_str(), &width, nullptr);
            return width;
        });
    }
    layout.usedInFrame = frame_;
    return layout.lines;
}

TextLine TextCache::Line(const std::string& text, const ui::Font& font, ui::Colour colour)
{
    if (text.empty()) return {nullptr, 0, LineHeight(font)};
    const int rgb = colour.r << 16 | colour.g << 8 | colour.b;
    Texture& entry = lines_[Key(text, font, rgb)];
    if (entry.usedInFrame == 0) {
        const SDL_Color ink{colour.r, colour.g, colour.b, 255};
        SurfacePtr surface{TTF_RenderUTF8_Blended(fonts_.Get(font), text.c_str(), ink)};
        if (surface) {
            ++rasterised_;
            entry.texture.reset(SDL_CreateTextureFromSurface(renderer_, surface.get()));
            if (entry.texture) SDL_SetTextureBlendMode(entry.texture.get(), SDL_BLENDMODE_BLEND);
            entry.width = surface->w;
            entry.height = surface->h;
        }
    }
    entry.usedInFrame = frame_;
    return {entry.texture.get(), entry.width, entry.height};
}

int TextCache::LineHeight(const ui::Font& font) { return TTF_FontLineSkip(fonts_.Get(font)); }

void TextCache::EndFrame()
{
    if (Size() > kKeepBelow) {
        DropUnused(lines_, frame_);
        DropUnused(layouts_, frame_);
    }
    ++frame_;
}

}  // namespace kr::sdl
