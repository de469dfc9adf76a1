#pragma once
#include <string>

#include "ui/form.h"
#include "ui/sdl/assets.h"
#include "ui/sdl/form_renderer.h"
#include "ui/sdl/handles.h"

namespace kr::sdl {

// Draws the window at 1x into memory with SDL's software renderer: no display, no video driver, and the
// same pixels the window shows. The scenario runner's eyes.
class ScreenshotCamera {
public:
    static constexpr int kWidth = 576;
    static constexpr int kHeight = 447;

    explicit ScreenshotCamera(const Assets& assets, int scale = 1);
    ScreenshotCamera(const ScreenshotCamera&) = delete;
    ScreenshotCamera& operator=(const ScreenshotCamera&) = delete;

    // The frame as drawn; valid until the next capture.
    const SDL_Surface& Capture(const ui::Form& form);
    // Captures and writes a PNG; false (with the reason on stderr) when it cannot.
    bool Save(const ui::Form& form, const std::string& file);

    FormRenderer& Renderer() { return *form_; }

private:
    SurfacePtr surface_;
    RendererPtr renderer_;
    std::unique_ptr<FormRenderer> form_;
};

}  // namespace kr::sdl
