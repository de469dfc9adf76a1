#pragma once
#include <map>

#include "ui/picture.h"
#include "ui/sdl/assets.h"
#include "ui/sdl/handles.h"

namespace kr::sdl {

// The window's pointer pictures as system cursors. Cursors do not follow the renderer's scale, so each is
// rasterised at its 1x size times the window's scale.
class PointerCursors {
public:
    PointerCursors(const Assets& assets, int scale);
    PointerCursors(const PointerCursors&) = delete;
    PointerCursors& operator=(const PointerCursors&) = delete;
    ~PointerCursors();

    // Shows the pointer for this picture when it differs from the one shown; a driver that makes no
    // cursors (offscreen) keeps the system arrow.
    void Show(ui::PictureRef pointer);

private:
    SDL_Cursor* Make(ui::PictureRef pointer);

    const Assets& assets_;
    int scale_;
    std::map<int16_t, CursorPtr> cursors_;
    std::optional<ui::PictureRef> shown_;
};

}  // namespace kr::sdl
