#include <gtest/gtest.h>

#include "shell/game.h"
#include "ui/sdl/form_renderer.h"
#include "ui/sdl/damage.h"
#include "ui/sdl/screenshot.h"
#include "ui/sdl/tests/offscreen.h"

namespace kr::sdl {
namespace {

using testing::CountPixels;
using testing::HeadlessGame;
using testing::PixelAt;
using testing::Rgb;
using testing::SourceAssets;

constexpr Rgb kBlack{0, 0, 0};
constexpr Rgb kButtonGrey{192, 192, 192};

bool Black(Rgb p) { return p == kBlack; }

// The dotted ring lies two pixels inside the focused button, one dot every other pixel, each dot a whole
// square of device pixels at 2x; it moves with the focus, and a move alone is worth a new frame.
TEST(FocusRing, DottedInsideTheFocusedButtonAtBothScales)
{
    HeadlessGame session;
    ui::Form& form = session.game->form;
    const PixelRect play = ToPixels(form.Bounds(*session.game->screen.PlayButton));
    const PixelRect options = ToPixels(form.Bounds(*session.game->screen.OptionsButton));
    for (int scale : {1, 2}) {
        ScreenshotCamera camera(SourceAssets(), scale);
        const auto ringRow = [scale](PixelRect button) {
            return SDL_Rect{(button.x + 2) * scale, (button.y + 2) * scale, (button.w - 4) * scale, scale};
        };
        const SDL_Surface& before = camera.Capture(form);
        EXPECT_EQ(CountPixels(before, ringRow(play), Black), 0) << "no ring before a key asks for the focus";

        Damage damage;
        damage.Collect(form, camera.Renderer());
        form.KeyDown(ui::Form::kTabKey);
        ASSERT_EQ(form.Focused(), session.game->screen.PlayButton);
        const std::vector<PixelRect> damaged = damage.Collect(form, camera.Renderer());
        ASSERT_EQ(damaged.size(), 1u) << "the ring alone is worth a new frame";
        EXPECT_EQ(Intersect(damaged[0], play).w, play.w);
        const SDL_Surface& shot = camera.Capture(form);
        const int dots = (play.w - 4 + 1) / 2;
        EXPECT_EQ(CountPixels(shot, ringRow(play), Black), dots * scale * scale);
        const int x = play.x + 2, y = play.y + 2;
        for (int dy = 0; dy < scale; ++dy)
            for (int dx = 0; dx < scale; ++dx) EXPECT_EQ(PixelAt(shot, x * scale + dx, y * scale + dy), kBlack);
        EXPECT_EQ(PixelAt(shot, (x + 1) * scale, y * scale), kButtonGrey) << "a gap between two dots";
        EXPECT_EQ(PixelAt(shot, (play.x + 1) * scale, (play.y + 1) * scale), kButtonGrey) << "inside the edge";
        EXPECT_EQ(CountPixels(shot, ringRow(options), Black), 0);

        form.KeyDown(ui::Form::kTabKey);
        const SDL_Surface& moved = camera.Capture(form);
        EXPECT_EQ(CountPixels(moved, ringRow(play), Black), 0);
        EXPECT_EQ(CountPixels(moved, ringRow(options), Black), dots * scale * scale);
        form.MouseDown(0, 0);
        form.MouseUp(0, 0);
        ASSERT_EQ(form.Focused(), nullptr);
    }
}

}  // namespace
}  // namespace kr::sdl
