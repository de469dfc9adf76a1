#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "board/fill.h"
#include "combat/outcome.h"
#include "hero/levelup.h"
#include "hero/panel.h"
#include "shell/briefing.h"
#include "shell/game.h"
#include "shell/screens.h"
#include "shell/texts.h"
#include "shell/tutorial.h"
#include "ui/sdl/caption_box.h"
#include "ui/sdl/fonts.h"
#include "ui/sdl/form_renderer.h"
#include "ui/sdl/text_cache.h"
#include "ui/sdl/tests/offscreen.h"

namespace kr::sdl {
namespace {

using testing::HeadlessGame;

// Measures what the renderer would set, with its fonts and its line breaking, at one scale.
class CaptionRuler {
public:
    explicit CaptionRuler(int scale) : scale_(scale), fonts_(scale), text_(nullptr, fonts_) {}

    // Every caption in sight that does not fit its box; each entry says which and by how much. While the
    // menu layer is up, only what lies on it is in sight.
    std::vector<std::string> Misfits(const ui::Form& form, const ui::Control& menuLayer)
    {
        std::vector<std::string> found;
        for (const auto& owned : form.All()) {
            const ui::Control& control = *owned;
            if (control.caption.empty() || !form.Shown(control)) continue;
            if (menuLayer.visible && !Within(control, menuLayer)) continue;
            if (control.kind != ui::ControlKind::Label && control.kind != ui::ControlKind::Button &&
                control.kind != ui::ControlKind::CheckBox)
                continue;
            if (ToPixels(form.VisibleBounds(control)).Empty()) continue;
            Check(control, ToPixels(form.Bounds(control)), found);
        }
        return found;
    }

    // The device-pixel columns of each line of the control's caption, as the renderer places them.
    std::vector<std::pair<int, int>> LineSpans(const ui::Form& form, const ui::Control& control)
    {
        const TextBox where = CaptionBox(control, ToPixels(form.Bounds(control)));
        std::vector<std::pair<int, int>> spans;
        const int room = where.box.w * scale_;
        for (const std::string& line : Lines(control, where)) {
            const int width = Width(line, control.font);
            int left = where.box.x * scale_;
            if (where.align == ui::Align::Centre) left += (room - width) / 2;
            else if (where.align == ui::Align::Right) left += room - width;
            spans.emplace_back(left, left + width);
        }
        return spans;
    }

    int Scale() const { return scale_; }

private:
    static bool Within(const ui::Control& control, const ui::Control& panel)
    {
        for (const ui::Control* c = &control; c; c = c->parent)
            if (c == &panel) return true;
        return false;
    }

    const std::vector<std::string>& Lines(const ui::Control& control, const TextBox& where)
    {
        return text_.Lines(control.caption, control.font, where.wrap ? std::max(where.room * scale_, 1) : 0);
    }

    int Width(const std::string& line, const ui::Font& font)
    {
        int width = 0;
        TTF_SizeUTF8(fonts_.Get(font), line.c_str(), &width, nullptr);
        return width;
    }

    void Check(const ui::Control& control, PixelRect rect, std::vector<std::string>& found)
    {
        const TextBox where = CaptionBox(control, rect);
        const std::vector<std::string>& lines = Lines(control, where);
        const int room = where.room * scale_;
        for (const std::string& line : lines) {
            const int width = Width(line, control.font);
            if (width > room)
                found.push_back(control.name + " \"" + line + "\": " + std::to_string(width) + " px wide, room for " +
                                std::to_string(room) + " at " + std::to_string(scale_) + "x");
        }
        TTF_Font* face = fonts_.Get(control.font);
        const int height = static_cast<int>(lines.size() - 1) * text_.LineHeight(control.font) + TTF_FontHeight(face);
        if (height > where.box.h * scale_)
            found.push_back(control.name + ": " + std::to_string(lines.size()) + " lines " + std::to_string(height) +
                            " px high, room for " + std::to_string(where.box.h * scale_) + " at " +
                            std::to_string(scale_) + "x");
    }

    int scale_;
    Fonts fonts_;
    TextCache text_;
};

class CaptionFit : public ::testing::TestWithParam<int> {
protected:
    HeadlessGame session;
    Game& game = *session.game;
    CaptionRuler ruler{GetParam()};

    void ExpectAllFit(const std::string& screen)
    {
        for (const std::string& misfit : ruler.Misfits(game.form, *game.screen.MenuLayer)) ADD_FAILURE() << screen << ": " << misfit;
    }

    void ExpectAllFit(const std::string& screen, ui::Control& label, const std::vector<std::string>& captions)
    {
        for (const std::string& caption : captions) {
            label.caption = caption;
            ExpectAllFit(screen + " showing \"" + caption + "\"");
        }
    }
};

TEST_P(CaptionFit, MenuScreens)
{
    ExpectAllFit("main menu");
    game.UnlockedMissions = 10;
    session.Click("Gra");
    ExpectAllFit("mission list");
    for (int16_t mission = 0; mission < 10; ++mission) {
        MissionChosen(game, mission);
        game.timers.Advance(60'000);
        ASSERT_TRUE(game.BriefingText.empty()) << "the briefing is typed out";
        ExpectAllFit("briefing of mission " + std::to_string(mission + 1));
        BriefingBackClicked(game);
    }
    MissionMenuBackClicked(game);

    game.Strength = game.Dexterity = game.Accuracy = game.Endurance = game.Intelligence = 2;
    session.Click("Opcje");
    ExpectAllFit("options");
    session.Click("Powrót");

    game.UnlockedMissions = 1;
    game.Strength = game.Dexterity = game.Accuracy = game.Endurance = game.Intelligence = 0;
    game.screen.MainMenuScreen->visible = false;
    ShowMissionComplete(game, 0);
    ExpectAllFit("mission complete");
    session.Click("Wymiatam!");
    ASSERT_TRUE(game.screen.LevelUpScreen->visible);
    ExpectAllFit("level-up", *game.screen.AttributeDescription,
                 {kAttributeDescriptions.begin(), kAttributeDescriptions.end()});
    PlusClicked(game, 0);
    ExpectAllFit("level-up after a choice");
}

TEST_P(CaptionFit, GameScreen)
{
    game.TutorialOn = 1;
    game.UnlockedMissions = 11;  // every skill slot in sight, the last one with its "5x" labels
    session.Click("Gra");
    session.Click("Misja 1");
    session.Click("Rozpocznij misję ->");
    game.timers.Advance(3000);
    ASSERT_FALSE(game.screen.MenuLayer->visible);
    ASSERT_TRUE(game.screen.SkillFrames[6]->visible);
    for (int16_t page = 1; page <= 14; ++page) {
        ShowHint(game, page);
        ExpectAllFit("tutorial page " + std::to_string(page));
    }
    game.screen.DamageLabel->visible = true;
    ExpectAllFit("hero panel", *game.screen.DamageLabel, {"18", "99"});

    // The notices lie over the board and must keep a pixel off its border ring, not just inside their labels.
    const PixelRect first = ToPixels(game.form.Bounds(*game.screen.Cells[11]));
    const PixelRect last = ToPixels(game.form.Bounds(*game.screen.Cells[18]));
    const int scale = ruler.Scale();
    const int fieldLeft = (first.x + 1) * scale, fieldRight = (last.x + last.w - 1) * scale;
    for (ui::Control* notice :
         {game.screen.StageDoneLabel, game.screen.NoMovesLabel, game.screen.MissionFailedLabel, game.screen.ReturnPrompt}) {
        notice->visible = true;
        ExpectAllFit("notice " + notice->name);
        for (const auto& [left, right] : ruler.LineSpans(game.form, *notice)) {
            EXPECT_GE(left, fieldLeft) << notice->caption << " runs onto the board's left border";
            EXPECT_LE(right, fieldRight) << notice->caption << " runs onto the board's right border";
        }
        notice->visible = false;
    }

    // The widest figures the health bar shows, a full bar late in the campaign and a death below zero, stay
    // inside the bar's outline.
    const PixelRect bar = ToPixels(game.form.Bounds(*game.screen.HealthFrame));
    for (const int16_t health : {int16_t{180}, int16_t{-11}, int16_t{-59}}) {
        game.MaxHealth = 180;
        game.Health = health;
        RefreshHeroPanel(game);
        ExpectAllFit("health " + std::to_string(health));
        for (const auto& [left, right] : ruler.LineSpans(game.form, *game.screen.HealthLabel)) {
            EXPECT_GE(left, (bar.x + 1) * scale) << health << " crosses the bar's left edge";
            EXPECT_LE(right, (bar.x + bar.w - 1) * scale) << health << " crosses the bar's right edge";
        }
    }
}

INSTANTIATE_TEST_SUITE_P(Scales, CaptionFit, ::testing::Values(1, 2),
                         [](const ::testing::TestParamInfo<int>& scale) { return std::to_string(scale.param) + "x"; });

}  // namespace
}  // namespace kr::sdl
