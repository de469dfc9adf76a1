#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/session.h"

namespace kr {
namespace {

using testing::Session;

constexpr int kTab = 9, kEnter = 13, kSpace = 32, kLeft = 37, kUp = 38, kRight = 39, kDown = 40;
constexpr int kEscape = 27, kKeyN = 78, kKeyT = 84;

std::string Focus(const Game& g)
{
    const ui::Control* focused = g.form.Focused();
    return focused ? focused->caption : "(none)";
}

std::vector<std::string> Order(const Game& g)
{
    std::vector<std::string> captions;
    for (const ui::Control* control : g.form.FocusOrder()) captions.push_back(control->caption);
    return captions;
}

using Captions = std::vector<std::string>;

// The main menu and the options from the keyboard alone: the focus walks the buttons in reading order and
// wraps round, Shift+Tab walks back, Enter and Space press as a click does and the new screen gets the focus.
TEST(Keyboard, MainMenuAndOptions)
{
    Session s;
    Game& g = s.game;
    EXPECT_EQ(Order(g), (Captions{"Gra", "Opcje", "Wyjście"}));
    EXPECT_EQ(Focus(g), "(none)") << "no focus until a key asks for one";
    ASSERT_EQ(s.Run("key 9 shift"), 0);
    EXPECT_EQ(Focus(g), "Wyjście");
    s.Key(kTab);
    EXPECT_EQ(Focus(g), "Gra");
    s.Key(kDown);
    EXPECT_EQ(Focus(g), "Opcje");
    s.Key(kRight);
    EXPECT_EQ(Focus(g), "Wyjście");
    s.Key(kUp);
    s.Key(kLeft);
    EXPECT_EQ(Focus(g), "Gra");
    s.Key(kTab);
    s.Key(kEnter);
    ASSERT_TRUE(g.screen.OptionsScreen->visible);

    EXPECT_EQ(Order(g), (Captions{"Dźwięki", "Samouczek", "Resetuj postać", "Powrót"}));
    EXPECT_EQ(Focus(g), "Dźwięki");
    ASSERT_EQ(g.SoundOn, 0);
    s.Key(kSpace);
    EXPECT_EQ(g.screen.SoundBox->value, 1);
    EXPECT_EQ(g.SoundOn, 1) << "the check box's own click handler ran";
    s.Key(kEnter);
    EXPECT_EQ(g.SoundOn, 0);
    s.Key(kTab);
    s.Key(kSpace);
    EXPECT_EQ(g.TutorialOn, 1);
    ASSERT_EQ(s.Run("key 9 shift\nkey 9 shift"), 0);
    EXPECT_EQ(Focus(g), "Powrót");
    s.Key(kEnter);
    EXPECT_TRUE(g.screen.MainMenuScreen->visible);
    EXPECT_FALSE(g.screen.OptionsScreen->visible);
    EXPECT_EQ(Focus(g), "Gra");
    EXPECT_EQ(testing::ReadFile(s.folder().File("config.cfg")), " 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 1 \r\n")
        << "options saved on leaving";

    // A mouse press puts the keyboard focus away; the next Tab starts again from the top.
    s.Press("Label8(0)");
    EXPECT_EQ(Focus(g), "(none)");
    s.Key(kTab);
    EXPECT_EQ(Focus(g), "Gra");
    s.Key(kTab);
    s.Key(kTab);
    s.Key(kSpace);
    EXPECT_TRUE(g.quitRequested) << "Wyjście pressed from the keyboard";
}

// Into a mission and out again by keyboard: locked missions are passed over, the briefing offers the start
// first, and on the game screen, with nothing to focus, Escape, N and T are the game's own keys again.
TEST(Keyboard, MissionListBriefingAndTheGameScreen)
{
    Session s;
    Game& g = s.game;
    s.Key(kTab);
    s.Key(kEnter);
    ASSERT_TRUE(g.screen.MissionMenuScreen->visible);
    EXPECT_EQ(Order(g), (Captions{"Misja 1", "Powrót"})) << "nine locked missions are disabled";
    EXPECT_EQ(Focus(g), "Misja 1");
    s.Key(kUp);
    EXPECT_EQ(Focus(g), "Powrót");
    s.Key(kDown);
    s.Key(kEnter);
    ASSERT_TRUE(g.screen.BriefingScreen->visible);

    EXPECT_EQ(Order(g), (Captions{"Rozpocznij misję ->", "<- Wróć do menu misji"}));
    EXPECT_EQ(Focus(g), "Rozpocznij misję ->");
    s.Key(kTab);
    s.Key(kSpace);
    ASSERT_TRUE(g.screen.MissionMenuScreen->visible);
    EXPECT_FALSE(g.screen.BriefingScreen->visible);
    EXPECT_EQ(Focus(g), "Misja 1");
    s.Key(kEnter);
    s.Key(kEnter);
    ASSERT_FALSE(g.screen.MenuLayer->visible) << "the mission started";
    EXPECT_EQ(Focus(g), "(none)");
    s.Advance(3000);

    for (int key : {kTab, kEnter, kSpace, kDown}) s.Key(key);
    EXPECT_EQ(Focus(g), "(none)");
    EXPECT_FALSE(g.screen.MenuLayer->visible);
    EXPECT_FALSE(g.screen.ReturnPrompt->visible);
    s.Key(kEscape);
    EXPECT_TRUE(g.screen.ReturnPrompt->visible);
    s.Key(kKeyN);
    EXPECT_FALSE(g.screen.ReturnPrompt->visible);
    s.Key(kEscape);
    s.Key(kKeyT);
    ASSERT_TRUE(g.screen.MainMenuScreen->visible);
    EXPECT_EQ(Focus(g), "(none)");
    s.Key(kTab);
    EXPECT_EQ(Focus(g), "Gra");
}

// The focus never rests on a control the player cannot press: hidden, disabled, or lying under another panel.
TEST(Keyboard, FocusLeavesWhatCannotBePressed)
{
    ui::Form form;
    const auto button = [&form](ui::Control* parent, const char* name, float left, float top) -> ui::Control& {
        ui::Control& c = form.Add(parent, name, ui::ControlKind::Button);
        c.caption = name;
        c.left = left, c.top = top, c.width = 600, c.height = 300;
        return c;
    };
    ui::Control& panel = form.Add(nullptr, "Panel", ui::ControlKind::Panel);
    panel.width = 3000, panel.height = 3000;
    ui::Control& lower = button(&panel, "lower", 0, 1000);
    ui::Control& right = button(&panel, "right", 1000, 0);
    ui::Control& left = button(&panel, "left", 0, 0);
    int clicks = 0;
    right.onClick = [&clicks] { ++clicks; };
    int passedOn = 0;
    form.onKeyDown = [&passedOn](int) { ++passedOn; };

    ASSERT_EQ(form.FocusOrder(), (std::vector<ui::Control*>{&left, &right, &lower}));
    form.KeyDown(kTab);
    form.KeyDown(kTab);
    ASSERT_EQ(form.Focused(), &right);
    form.KeyDown(kEnter);
    EXPECT_EQ(clicks, 1);
    EXPECT_EQ(passedOn, 0) << "keys the focus used are not passed on";

    right.visible = false;
    EXPECT_EQ(form.Focused(), nullptr);
    form.KeyDown(kEnter);
    EXPECT_EQ(clicks, 1);
    EXPECT_EQ(passedOn, 1) << "Enter with nothing focused is the game's";
    right.visible = true;
    form.KeyDown(kTab);
    form.KeyDown(kTab);
    ASSERT_EQ(form.Focused(), &right);

    panel.enabled = false;
    EXPECT_EQ(form.Focused(), nullptr) << "disabled with its panel";
    EXPECT_FALSE(form.MoveFocus(1));
    panel.enabled = true;
    lower.enabled = false;
    EXPECT_EQ(form.FocusOrder(), (std::vector<ui::Control*>{&left, &right}));

    ui::Control& cover = form.Add(nullptr, "Cover", ui::ControlKind::Panel);
    cover.left = 900, cover.width = 1000, cover.height = 1000;
    EXPECT_EQ(form.FocusOrder(), (std::vector<ui::Control*>{&left})) << "right lies under the cover";
    cover.visible = false;
    EXPECT_EQ(form.FocusOrder(), (std::vector<ui::Control*>{&left, &right}));
    EXPECT_EQ(form.Focused(), nullptr);
    form.KeyDown(kTab, true);
    EXPECT_EQ(form.Focused(), &right);
}

}  // namespace
}  // namespace kr
