#pragma once
#include <cstdint>
#include <string>
#include <unordered_map>
#include <vector>

#include "ui/control.h"
#include "ui/sdl/fonts.h"
#include "ui/sdl/handles.h"

namespace kr::sdl {

// One rasterised line of text; sizes in device pixels.
struct TextLine {
    SDL_Texture* texture = nullptr;  // nullptr for an empty line
    int width = 0;
    int height = 0;
};

// Line layouts and line textures for one renderer, so a redraw of an unchanged screen rasterises nothing.
// Entries a frame did not use are dropped once the cache grows, as the hover and health texts never stop
// changing.
class TextCache {
public:
    TextCache(SDL_Renderer* renderer, Fonts& fonts);

    // wrapWidth in device pixels, 0 for no wrapping.
    const std::vector<std::string>& Lines(const std::string& caption, const ui::Font& font, int wrapWidth);
    TextLine Line(const std::string& text, const ui::Font& font, ui::Colour colour);
    int LineHeight(const ui::Font& font);

    // Closes a frame: forgets what it did not use when the cache has grown large.
    void EndFrame();

    uint64_t Rasterised() const { return rasterised_; }
    size_t Size() const { return lines_.size() + layouts_.size(); }

private:
    struct Texture {
        TexturePtr texture;
        int width = 0;
        int height = 0;
        uint64_t usedInFrame = 0;
    };
    struct Layout {
        std::vector<std::string> lines;
        uint64_t usedInFrame = 0;
    };

    std::string Key(const std::string& text, const ui::Font& font, int extra) const;

    SDL_Renderer* renderer_;
    Fonts& fonts_;
    std::unordered_map<std::string, Texture> lines_;
    std::unordered_map<std::string, Layout> layouts_;
    uint64_t frame_ = 1;
    uint64_t rasterised_ = 0;
};

}  // namespace kr::sdl
