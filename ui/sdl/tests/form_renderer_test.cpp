#include <gtest/gtest.h>

#include "shell/game.h"
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

constexpr Rgb kWindowGrey{128, 128, 128};
constexpr Rgb kMenuGrey{64, 64, 64};
constexpr Rgb kButtonGrey{192, 192, 192};
constexpr Rgb kWhite{255, 255, 255};
constexpr Rgb kRed{255, 0, 0};
constexpr Rgb kBlue{0, 0, 255};

bool Dark(Rgb p) { return p.r < 64 && p.g < 64 && p.b < 64; }
bool Yellow(Rgb p) { return p.r > 200 && p.g > 200 && p.b < 100; }
bool Ink(Rgb p) { return p.r < 100; }
bool Greyed(Rgb p) { return p == Rgb{128, 128, 128}; }

// Main menu as the player first sees it, at both scales: the same layout, the 2x one pixel-doubled.
TEST(FormRenderer, MainMenuThenMissionMenu)
{
    HeadlessGame session;
    for (int scale : {1, 2}) {
        ScreenshotCamera camera(SourceAssets(), scale);
        const SDL_Surface& shot = camera.Capture(session.game->form);
        ASSERT_EQ(shot.w, 576 * scale);
        const auto at = [&](int x, int y) { return PixelAt(shot, x * scale, y * scale); };
        EXPECT_EQ(at(5, 5), kMenuGrey);
        EXPECT_EQ(at(157, 69), kWindowGrey) << "the main menu panel";
        const SDL_Point play = session.Centre("Gra");
        EXPECT_EQ(at(play.x - 100, play.y - 20), kButtonGrey);
        EXPECT_GT(CountPixels(shot, {(play.x - 30) * scale, (play.y - 15) * scale, 60 * scale, 30 * scale}, Dark),
                  40 * scale * scale)
            << "the caption of Gra";
        const SDL_Point version = session.Centre("Kruszarka v.1.0.");
        EXPECT_GT(CountPixels(shot, {(version.x - 45) * scale, (version.y - 8) * scale, 90 * scale, 16 * scale},
                              Yellow),
                  30 * scale * scale);
    }

    ScreenshotCamera camera(SourceAssets());
    const SDL_Point options = session.Centre("Opcje");
    session.Click("Gra");
    ASSERT_TRUE(session.game->form.FindByCaption("Misja 1"));
    const SDL_Surface& shot = camera.Capture(session.game->form);
    const SDL_Point mission = session.Centre("Misja 1");
    EXPECT_EQ(PixelAt(shot, mission.x - 40, mission.y - 8), kButtonGrey);
    EXPECT_NE(PixelAt(shot, options.x - 100, options.y - 20), kButtonGrey) << "the main menu is gone";
}

bool Inside(PixelRect inner, PixelRect outer)
{
    const PixelRect common = Intersect(inner, outer);
    return !inner.Empty() && common.w == inner.w && common.h == inner.h;
}

// An unchanged screen damages nothing and rasterises nothing again; what is hidden does not count; a changed
// control damages where it was and where it is, and nothing far from it.
TEST(FormRenderer, DamagesAndRasterisesOnlyWhatChanged)
{
    HeadlessGame session;
    Game& game = *session.game;
    ScreenshotCamera camera(SourceAssets());
    camera.Capture(game.form);
    const uint64_t rasterised = camera.Renderer().Rasterised();
    ASSERT_GT(rasterised, 0u);
    camera.Capture(game.form);
    EXPECT_EQ(camera.Renderer().Rasterised(), rasterised);

    Damage damage;
    const auto collect = [&] { return damage.Collect(game.form, camera.Renderer()); };
    const std::vector<PixelRect> first = collect();
    ASSERT_EQ(first.size(), 1u);
    EXPECT_TRUE(Inside(kWindowPixels, first[0])) << "the first frame is all new";
    EXPECT_TRUE(collect().empty());
    game.screen.StageDoneLabel->caption = "ukryty";
    game.screen.StageDoneLabel->top += 15;
    EXPECT_TRUE(collect().empty()) << "a hidden label changed";

    // The label sits over the board, under the menu layer: shown, then swapped for another notice.
    game.screen.StageDoneLabel->visible = true;
    const std::vector<PixelRect> shown = collect();
    ASSERT_EQ(shown.size(), 1u);
    EXPECT_TRUE(Inside(shown[0], ToPixels(game.form.Bounds(*game.screen.StageDoneLabel)))) << "only its own text";
    game.screen.StageDoneLabel->visible = false;
    game.screen.ReturnPrompt->visible = true;
    const std::vector<PixelRect> swapped = collect();
    PixelRect both;
    for (const PixelRect& r : swapped) both = Union(both, r);
    EXPECT_TRUE(Inside(shown[0], both)) << "the hidden label's pixels are drawn over";
    game.screen.ReturnPrompt->visible = false;
    collect();

    // A pointer is no part of the frame.
    game.form.pointer = ui::CursorPicture(ui::EnemyTurnCursor);
    EXPECT_TRUE(collect().empty());

    // Moving the menu layer's panel one pixel damages its old and new place, nothing else.
    const PixelRect before = ToPixels(game.form.Bounds(*game.screen.MainMenuScreen));
    game.screen.MainMenuScreen->left += 15;
    const std::vector<PixelRect> moved = collect();
    ASSERT_EQ(moved.size(), 1u);
    EXPECT_EQ(moved[0].x, before.x);
    EXPECT_EQ(moved[0].w, before.w + 1);
    EXPECT_EQ(moved[0].h, before.h);

    // Measuring a new caption for its damage rasterises it once, for the drawing as well.
    camera.Capture(game.form);
    const uint64_t beforeHealth = camera.Renderer().Rasterised();
    game.screen.HealthLabel->caption = "123";
    collect();
    camera.Capture(game.form);
    EXPECT_EQ(camera.Renderer().Rasterised(), beforeHealth + 1) << "one new line of text, nothing else";
}

// Touching rectangles merge; separate ones stay apart until there are too many.
TEST(FormRenderer, DamageRectanglesMerge)
{
    std::vector<PixelRect> rects;
    AddRect(rects, {0, 0, 10, 10}, 3);
    AddRect(rects, {20, 0, 10, 10}, 3);
    AddRect(rects, {}, 3);
    EXPECT_EQ(rects.size(), 2u);
    AddRect(rects, {10, 5, 10, 2}, 3);
    ASSERT_EQ(rects.size(), 1u) << "a bridge joins both";
    EXPECT_EQ(rects[0].x, 0);
    EXPECT_EQ(rects[0].w, 30);
    AddRect(rects, {100, 100, 1, 1}, 3);
    AddRect(rects, {200, 100, 1, 1}, 3);
    AddRect(rects, {300, 100, 1, 1}, 3);
    ASSERT_EQ(rects.size(), 1u) << "past three, one box holds all";
    EXPECT_EQ(rects[0].w, 301);
    EXPECT_EQ(rects[0].h, 101);
}

// Hand-made controls with known pixels: outlines lie inside their bounds, circles fill theirs, a long line of
// text runs past its label but not past the panel holding it, and a disabled caption is greyed.
TEST(FormRenderer, ShapesTextAndClipping)
{
    ui::Form form;
    ui::Control& panel = form.Add(nullptr, "Panel", ui::ControlKind::Panel);
    panel.left = 150, panel.top = 150, panel.width = 1500, panel.height = 750;  // 10,10 100x50 px
    panel.back = {255, 255, 255};

    ui::Control& box = form.Add(&panel, "Box", ui::ControlKind::Shape);
    box.left = 150, box.top = 150, box.width = 150, box.height = 150;  // 20,20 10x10 px
    box.border = {255, 0, 0};
    box.borderWidth = 2;

    ui::Control& dot = form.Add(&panel, "Dot", ui::ControlKind::Shape);
    dot.left = 600, dot.top = 150, dot.width = 150, dot.height = 150;  // 50,20 10x10 px
    dot.shape = ui::ShapeKind::Circle;
    dot.outlined = false;
    dot.filled = true;
    dot.fill = {0, 0, 255};

    ui::Control& label = form.Add(&panel, "Long", ui::ControlKind::Label);
    label.left = 1200, label.top = 450, label.width = 150, label.height = 255;  // 90,40 10x17 px
    label.caption = "WWWWWWWW";
    label.transparent = true;
    label.wordWrap = false;

    ui::Control& right = form.Add(&panel, "Right", ui::ControlKind::Label);
    right.left = 150, right.top = 450, right.width = 600, right.height = 255;  // 20,40 40x17 px
    right.caption = "5x";
    right.align = ui::Align::Right;
    right.transparent = true;

    ui::Control& button = form.Add(nullptr, "Button", ui::ControlKind::Button);
    button.left = 150, button.top = 1200, button.width = 1500, button.height = 450;  // 10,80 100x30 px
    button.back = {192, 192, 192};
    button.caption = "Powrót";
    button.font = {ui::Face::Mono, true, 11.25f};

    ScreenshotCamera camera(SourceAssets());
    const SDL_Surface& shot = camera.Capture(form);
    EXPECT_EQ(PixelAt(shot, 20, 20), kRed);
    EXPECT_EQ(PixelAt(shot, 21, 21), kRed);
    EXPECT_EQ(PixelAt(shot, 22, 22), kWhite);
    EXPECT_EQ(PixelAt(shot, 29, 29), kRed);
    EXPECT_EQ(PixelAt(shot, 30, 30), kWhite);
    EXPECT_EQ(PixelAt(shot, 19, 19), kWhite);

    EXPECT_EQ(PixelAt(shot, 55, 25), kBlue);
    EXPECT_EQ(PixelAt(shot, 50, 20), kWhite);
    EXPECT_EQ(PixelAt(shot, 59, 29), kWhite);

    EXPECT_GT(CountPixels(shot, {100, 40, 10, 14}, Ink), 10) << "text past the label's own edge";
    EXPECT_EQ(CountPixels(shot, {110, 40, 20, 14}, Ink), 0) << "no text past the panel";
    EXPECT_GT(CountPixels(shot, {50, 40, 10, 14}, Ink), 5) << "right-aligned text ends at the right edge";
    EXPECT_EQ(CountPixels(shot, {20, 40, 25, 14}, Ink), 0);

    const SDL_Rect caption{30, 84, 60, 22};
    EXPECT_GT(CountPixels(shot, caption, Dark), 20);
    button.enabled = false;
    const SDL_Surface& greyed = camera.Capture(form);
    EXPECT_EQ(CountPixels(greyed, caption, Dark), 0);
    EXPECT_GT(CountPixels(greyed, caption, Greyed), 10);
}

}  // namespace
}  // namespace kr::sdl
