#include "ui/sdl/screenshot.h"

#include <SDL_image.h>
#include <iostream>
#include <stdexcept>

namespace kr::sdl {

ScreenshotCamera::ScreenshotCamera(const Assets& assets, int scale)
{
    surface_.reset(SDL_CreateRGBSurfaceWithFormat(0, kWidth * scale, kHeight * scale, 32, SDL_PIXELFORMAT_RGB888));
    if (!surface_) throw std::runtime_error(std::string("ScreenshotCamera: ") + SDL_GetError());
    renderer_.reset(SDL_CreateSoftwareRenderer(surface_.get()));
    if (!renderer_) throw std::runtime_error(std::string("ScreenshotCamera: ") + SDL_GetError());
    SDL_RenderSetLogicalSize(renderer_.get(), kWidth, kHeight);
    form_ = std::make_unique<FormRenderer>(renderer_.get(), assets, scale);
}

const SDL_Surface& ScreenshotCamera::Capture(const ui::Form& form)
{
    form_->Draw(form);
    // The software renderer batches its drawing; presenting flushes it into the surface.
    SDL_RenderPresent(renderer_.get());
    return *surface_;
}

bool ScreenshotCamera::Save(const ui::Form& form, const std::string& file)
{
    Capture(form);
    if (IMG_SavePNG(surface_.get(), file.c_str()) == 0) return true;
    std::cerr << "Kruszarka: cannot write " << file << ": " << IMG_GetError() << '\n';
    return false;
}

}  // namespace kr::sdl
