#include <stdexcept>
#include <string>

#include "shell/screen.h"
#include "shell/texts.h"

namespace kr {
namespace {

using ui::Align;
using ui::Colour;
using ui::Control;
using ui::ControlKind;
using ui::Face;
using ui::Font;

constexpr Colour kGrey{128, 128, 128};
constexpr Colour kDarkGrey{64, 64, 64};
constexpr Colour kButtonGrey{192, 192, 192};
constexpr Colour kBlack{0, 0, 0};
constexpr Colour kWhite{255, 255, 255};
constexpr Colour kGreen{0, 255, 0};
constexpr Colour kYellow{255, 255, 0};
constexpr Colour kGoalYellow{241, 233, 71};
constexpr Colour kWorkOrange{241, 204, 56};
constexpr Colour kBarRed{244, 71, 62};
constexpr Colour kHintGrey{224, 224, 224};

constexpr Font Mono(float points, bool bold = false) { return Font{Face::Mono, bold, points}; }
constexpr Font Sans(float points = 8.25f, bool bold = false) { return Font{Face::Sans, bold, points}; }

std::string Indexed(const char* name, int index) { return std::string(name) + "(" + std::to_string(index) + ")"; }

class Builder {
public:
    explicit Builder(ui::Form& form) : form_(form) {}

    Control& Place(Control* parent, std::string name, ControlKind kind, float left, float top, float width,
                   float height)
    {
        Control& c = form_.Add(parent, std::move(name), kind);
        c.left = left;
        c.top = top;
        c.width = width;
        c.height = height;
        return c;
    }

    Control& Panel(Control* parent, std::string name, float l, float t, float w, float h, Colour back = kGrey)
    {
        Control& c = Place(parent, std::move(name), ControlKind::Panel, l, t, w, h);
        c.back = back;
        return c;
    }

    Control& Picture(Control* parent, std::string name, float l, float t, float w, float h,
                     ui::PictureRef picture = {})
    {
        Control& c = Place(parent, std::move(name), ControlKind::Picture, l, t, w, h);
        c.picture = picture;
        return c;
    }

    Control& Label(Control* parent, std::string name, float l, float t, float w, float h, std::string caption,
                   Colour fore, Font font, Align align = Align::Left)
    {
        Control& c = Place(parent, std::move(name), ControlKind::Label, l, t, w, h);
        c.caption = std::move(caption);
        c.fore = fore;
        c.font = font;
        c.align = align;
        c.transparent = true;
        return c;
    }

    // A message over the board: big centred text on no background, hidden until needed.
    Control& Message(std::string name, float l, float t, float w, float h, std::string caption, Colour fore,
                     float points)
    {
        Control& c = Label(nullptr, std::move(name), l, t, w, h, std::move(caption), fore, Mono(points, true),
                           Align::Centre);
        c.visible = false;
        c.mouseThrough = true;
        return c;
    }

    Control& Button(Control* parent, std::string name, float l, float t, float w, float h, std::string caption,
                    Colour back, Font font)
    {
        Control& c = Place(parent, std::move(name), ControlKind::Button, l, t, w, h);
        c.caption = std::move(caption);
        c.back = back;
        c.font = font;
        c.align = Align::Centre;
        return c;
    }

    Control& CheckBox(Control* parent, std::string name, float l, float t, float w, float h, std::string caption)
    {
        Control& c = Place(parent, std::move(name), ControlKind::CheckBox, l, t, w, h);
        c.caption = std::move(caption);
        c.back = kGrey;
        c.font = Mono(9.75f, true);
        return c;
    }

    Control& Outline(Control* parent, std::string name, float l, float t, float w, float h, Colour border,
                     int width)
    {
        Control& c = Place(parent, std::move(name), ControlKind::Shape, l, t, w, h);
        c.border = border;
        c.borderWidth = width;
        return c;
    }

    Control& Solid(Control* parent, std::string name, float l, float t, float w, float h, Colour fill)
    {
        Control& c = Place(parent, std::move(name), ControlKind::Shape, l, t, w, h);
        c.outlined = false;
        c.filled = true;
        c.fill = fill;
        return c;
    }

private:
    ui::Form& form_;
};

// The cost pictures of each skill's six slots, by resource row; -1 is an empty slot.
constexpr int kCostSlots[7][6] = {
    {-1, 0, 0, -1, 3, 4},  // "Celny strzał": bullets, crosshair, grenade
    {-1, 3, 2, -1, 1, 1},  // "Teleport"
    {3, 3, 2, 1, 1, 0},    // "Bullet Time"
    {0, 0, 4, 4, 4, 4},    // "Rzut granatem"
    {1, 1, 2, 2, 2, 2},    // "Leczenie"
    {4, 4, 4, 0, 1, 3},    // "Wybuch"
    {3, -1, -1, 0, -1, -1},  // "Śmiercionośne naboje": 5x crosshair, 5x bullet
};

void BuildHeroPanel(Builder& b, Screen& s)
{
    s.HeroPanel = &b.Panel(nullptr, "Frame1", 120, 0, 1695, 2175);
    s.HeroPortrait = &b.Picture(s.HeroPanel, "Image3", 600, 240, 735, 495, {ui::PictureSet::Hero, 0});
    s.HealthFill = &b.Solid(s.HeroPanel, "Shape7(0)", 240, 240, 255, 495, kBarRed);
    s.HealthFrame = &b.Outline(s.HeroPanel, "Shape7(1)", 240, 240, 255, 495, kBlack, 1);
    s.HealthLabel = &b.Label(s.HeroPanel, "Label6", 240, 385, 255, 255, "90", kWhite,
                             Font{Face::Narrow, true, 8.25f}, Align::Centre);
    s.HealthLabel->wordWrap = false;
    for (int i = 0; i < 30; ++i) {
        const int row = i / 6, column = i % 6;
        s.ResourceIcons[static_cast<size_t>(i)] =
            &b.Picture(s.HeroPanel, Indexed("Image6", i), static_cast<float>(120 + 240 * column),
                       static_cast<float>(840 + 240 * row), 240, 240, {ui::PictureSet::Resource, int16_t(row)});
    }
    s.HeroShotFrame = &b.Outline(s.HeroPanel, "Shape8", 600, 240, 735, 495, Colour{128, 255, 128}, 2);
    s.HeroShotFrame->visible = false;
    s.DamageLabel = &b.Label(s.HeroPanel, "Label4", 240, 240, 255, 255, "90", kYellow, Mono(8.25f),
                             Align::Centre);
    s.DamageLabel->wordWrap = false;
    s.DamageLabel->visible = false;
}

void BuildSkillPanel(Builder& b, Screen& s)
{
    s.SkillPanel = &b.Panel(nullptr, "Frame2", 120, 2160, 1695, 4455);
    for (int k = 0; k < 7; ++k) {
        const size_t sk = static_cast<size_t>(k);
        Control& frame = b.Panel(s.SkillPanel, Indexed("Frame7", k), 120, static_cast<float>(120 + 600 * k), 1455,
                                 615);
        frame.visible = k == 0;
        s.SkillFrames[sk] = &frame;
        const ui::PictureRef icon{ui::PictureSet::Skill, static_cast<int16_t>(k)};
        const float side = static_cast<float>(ui::SizeOf(icon)->width * 15);
        s.SkillIcons[sk] = &b.Picture(&frame, Indexed("Image2", k), 120, 120, side, side, icon);
        for (int j = 0; j < 6; ++j) {
            const int slot = 6 * k + j;
            const int row = kCostSlots[k][j];
            const ui::PictureRef picture =
                row < 0 ? ui::PictureRef{} : ui::PictureRef{ui::PictureSet::Resource, static_cast<int16_t>(row)};
            s.CostIcons[static_cast<size_t>(slot)] =
                &b.Picture(&frame, Indexed("Image4", slot), static_cast<float>(600 + 240 * (j % 3)),
                           j < 3 ? 120.0f : 340.0f, 240, 240, picture);
        }
        if (k == 6)
            for (int n = 0; n < 2; ++n) {
                Control& label = b.Label(&frame, Indexed("Label13", n), 720, n == 0 ? 120.0f : 360.0f, 375, 255,
                                         "5x", kWhite, Sans(8.25f, true), Align::Right);
                label.wordWrap = false;
                s.FiveTimesLabels[static_cast<size_t>(n)] = &label;
            }
        s.SkillHighlight[sk] = &b.Outline(&frame, Indexed("Shape2", k), 0, 120, 1455, 495, kGreen, 2);
        s.SkillHighlight[sk]->visible = false;
    }
}

void BuildBoard(Builder& b, Screen& s)
{
    for (int i = 0; i < 100; ++i) {
        Control& cell = b.Picture(nullptr, Indexed("Image1", i), static_cast<float>(1920 + 480 * (i % 10)),
                                  static_cast<float>(120 + 480 * (i / 10)), 495, 495);
        s.Cells[static_cast<size_t>(i)] = &cell;
    }
    // Cell 0 carries the border tile from the design; start-up copies it round the ring.
    s.Cells[0]->picture = ui::Palette(14);
    s.SelectionMarker = &b.Outline(nullptr, "Shape1", 1680, 0, 495, 495, kGreen, 2);
    s.SelectionMarker->visible = false;
}

void BuildGoalPanels(Builder& b, Screen& s)
{
    constexpr const char* kPictures[3] = {"Image8", "Image9", "Image10"};
    for (int i = 0; i < 3; ++i) {
        const size_t si = static_cast<size_t>(i);
        Control& panel = b.Panel(nullptr, Indexed("Frame4", i), 6840, static_cast<float>(2220 * i), 1695, 2175);
        s.GoalPanel[si] = &panel;
        s.GoalPicture[si] = &b.Picture(&panel, kPictures[i], 480, 240, 735, 735);
        s.RequiredFrame[si] = &b.Outline(&panel, Indexed("Shape4", i), 480, 240, 735, 735, kGoalYellow, 3);
        s.DoneFrame[si] = &b.Outline(&panel, Indexed("Shape5", i), 480, 240, 735, 735, Colour{65, 79, 252}, 5);
        s.RequiredFrame[si]->visible = false;
        s.DoneFrame[si]->visible = false;
    }
    s.GoalPicture[0]->picture = {ui::PictureSet::Object, 0};
    s.GoalPicture[1]->picture = {ui::PictureSet::Portrait, 0};
    s.GoalPicture[2]->picture = {ui::PictureSet::Object, 1};

    struct IconPlace {
        int panel;
        float left;
        int16_t icon;
    };
    constexpr IconPlace kIcons[4] = {{0, 240, 0}, {0, 960, 1}, {1, 600, 2}, {2, 600, 0}};
    for (int k = 0; k < 4; ++k) {
        const IconPlace& place = kIcons[k];
        s.GoalIcons[static_cast<size_t>(k)] = &b.Picture(s.GoalPanel[static_cast<size_t>(place.panel)],
                                                         Indexed("Image7", k), place.left, 1080, 480, 480,
                                                         {ui::PictureSet::GoalIcon, place.icon});
    }

    struct BarPlace {
        int panel;
        float left;
        float width;
        Colour fill;
        Control* Screen::*member;
    };
    const BarPlace kBars[4] = {
        {0, 120, 735, kWorkOrange, &Screen::BombWorkBar},
        {0, 840, 735, Colour{9, 116, 234}, &Screen::BombTimeBar},
        {1, 120, 1455, kBarRed, &Screen::EnemyHealthBar},
        {2, 120, 1455, kWorkOrange, &Screen::TerminalWorkBar},
    };
    for (int k = 0; k < 4; ++k) {
        const BarPlace& bar = kBars[k];
        Control* panel = s.GoalPanel[static_cast<size_t>(bar.panel)];
        Control& fill = b.Solid(panel, Indexed("Shape3", 2 * k), bar.left, 1680, bar.width, 255, bar.fill);
        Control& outline = b.Outline(panel, Indexed("Shape3", 2 * k + 1), bar.left, 1680, bar.width, 255, kBlack, 1);
        s.*(bar.member) = &fill;
        s.BarOutlines[static_cast<size_t>(k)] = &outline;
    }
    s.HitMarker = &b.Solid(s.GoalPanel[1], "Shape6", 120, 1710, 15, 200, Colour{192, 192, 192});
    s.HitMarker->visible = false;
}

void BuildTutorialArea(Builder& b, Screen& s)
{
    s.TutorialArea = &b.Panel(nullptr, "Frame3", 1920, 5040, 4815, 1575);
    s.HoverLabel = &b.Label(s.TutorialArea, "Label1", 120, 240, 4575, 1215, "", kGreen, Mono(8.25f));
    s.TutorialPanel = &b.Panel(s.TutorialArea, "Frame15", 120, 120, 4575, 1335);
    Control* panel = s.TutorialPanel;
    s.HintLabel = &b.Label(panel, "Label16", 120, 280, 4335, 735, "", kBlack, Sans(8.25f));
    s.PageLabel = &b.Label(panel, "Label17", 3840, 120, 375, 255, "", kBlack, Sans(8.25f, true), Align::Right);
    b.Label(panel, "Label18", 4200, 120, 375, 255, "/14", kBlack, Sans(8.25f, true));
    s.PreviousHint = &b.Label(panel, "Label19", 600, 960, 1095, 255, "<---poprzednia", kBlack,
                              Font{Face::Narrow, false, 8.25f});
    s.NextHint = &b.Label(panel, "Label20", 2640, 960, 1095, 255, "następna--->", kBlack,
                          Font{Face::Narrow, false, 8.25f}, Align::Right);
    s.CloseHints = &b.Label(panel, "Label21", 4200, 960, 255, 255, "X", kBlack, Sans(8.25f, true), Align::Centre);
    for (Control* hint : {s.PreviousHint, s.NextHint, s.CloseHints}) {
        hint->transparent = false;
        hint->back = kHintGrey;
        hint->wordWrap = false;
    }
    s.CloseHints->bordered = true;
    b.Outline(panel, "Shape9(0)", 600, 960, 1095, 255, kBlack, 2);
    b.Outline(panel, "Shape9(1)", 2640, 960, 1095, 255, kBlack, 2);
}

void BuildMessages(Builder& b, Screen& s)
{
    s.BulletTimeBar = &b.Solid(nullptr, "Shape11", 2400, 0, 3855, 135, kGoalYellow);
    s.BulletTimeBar->visible = false;
    s.StageDoneLabel = &b.Message("Label2", 2040, 1680, 4815, 1695, "Zadanie wykonane!", kGreen, 30);
    s.NoMovesLabel = &b.Message("Label5", 2160, 1440, 4815, 2775, "Brak możliwych ruchów", Colour{255, 128, 0}, 30);
    s.MissionFailedLabel = &b.Message("Label7", 2040, 1680, 4815, 2775, "Misja nieudana!", Colour{247, 40, 102}, 30);
    s.ReturnPrompt = &b.Message("Label3", 2040, 1920, 4815, 975, "Wrócić do menu? (t/n)", kYellow, 19.5f);
}

void BuildMainAndMissionMenus(Builder& b, Screen& s)
{
    s.MainMenuScreen = &b.Panel(s.MenuLayer, "Frame6", 0, 0, 4095, 4815);
    const Font big = Mono(18, true);
    s.PlayButton = &b.Button(s.MainMenuScreen, "Command1", 360, 720, 3375, 855, "Gra", kButtonGrey, big);
    s.OptionsButton = &b.Button(s.MainMenuScreen, "Command2", 360, 1800, 3375, 855, "Opcje", kButtonGrey, big);
    s.ExitButton = &b.Button(s.MainMenuScreen, "Command3", 360, 3000, 3375, 855, "Wyjście", kButtonGrey, big);
    b.Label(s.MainMenuScreen, "Label8(0)", 360, 4440, 1335, 255, "Kruszarka v.1.0.", kYellow, Sans()).wordWrap = false;
    b.Label(s.MainMenuScreen, "Label8(1)", 2520, 4440, 1335, 255, kContactLine, kYellow, Sans()).wordWrap = false;

    s.MissionMenuScreen = &b.Panel(s.MenuLayer, "Frame9", 2520, 600, 3615, 5655);
    s.MissionMenuScreen->visible = false;
    for (int i = 0; i < 10; ++i)
        s.MissionButtons[static_cast<size_t>(i)] =
            &b.Button(s.MissionMenuScreen, Indexed("Command4", i), 1080, static_cast<float>(240 + 480 * i), 1455,
                      375, "Misja " + std::to_string(i + 1), kButtonGrey, Mono(9));
    s.MissionMenuBack = &b.Button(s.MissionMenuScreen, "Command5", 1080, 5160, 1455, 375, "Powrót", kButtonGrey,
                                  Mono(11.25f, true));

    s.BriefingScreen = &b.Panel(s.MenuLayer, "Frame10", 0, 0, 5775, 4095, kBlack);
    s.BriefingScreen->visible = false;
    s.BriefingLabel = &b.Label(s.BriefingScreen, "Label12", 240, 240, 5295, 3375, "", kGreen, Mono(9));
    s.StartMission = &b.Button(s.BriefingScreen, "Command6", 3120, 3600, 2415, 375, "Rozpocznij misję ->", kGrey,
                               Mono(8.25f));
    s.BriefingBack = &b.Button(s.BriefingScreen, "Command8", 240, 3615, 2415, 350, "<- Wróć do menu misji", kGrey,
                               Mono(8.25f));
}

void BuildOptions(Builder& b, Screen& s)
{
    s.OptionsScreen = &b.Panel(s.MenuLayer, "Frame14", 1920, 2280, 4815, 2295);
    s.OptionsScreen->visible = false;
    s.SoundBox = &b.CheckBox(s.OptionsScreen, "Check1", 2640, 240, 1695, 375, "Dźwięki");
    s.TutorialBox = &b.CheckBox(s.OptionsScreen, "Check2", 2640, 600, 1695, 375, "Samouczek");
    s.ResetButton = &b.Button(s.OptionsScreen, "Command10", 2400, 1080, 2055, 375, "Resetuj postać",
                              Colour{128, 128, 255}, Mono(11.25f, true));
    s.OptionsBack = &b.Button(s.OptionsScreen, "Command11", 2640, 1800, 1575, 375, "Powrót", kButtonGrey,
                              Mono(11.25f, true));
    s.HeroSummary = &b.Label(s.OptionsScreen, "Label14", 360, 960, 1935, 1215, "", kYellow, Mono(8.25f));
    s.HeroSummary->wordWrap = false;
    b.Picture(s.OptionsScreen, "Image13", 720, 360, 735, 495, {ui::PictureSet::Hero, 0});
}

void BuildLevelUp(Builder& b, Screen& s)
{
    s.LevelUpScreen = &b.Panel(s.MenuLayer, "Frame12", 2520, 1800, 3615, 3255, Colour{192, 139, 50});
    s.LevelUpScreen->visible = false;
    s.LevelUpLabels[0] = &b.Label(s.LevelUpScreen, "Label9(0)", 120, 240, 3375, 735,
                                  "Zyskujesz poziom! Możesz ulepszyć jedną ze swoich cech:", kBlack,
                                  Mono(8.25f, true), Align::Centre);
    for (int r = 0; r < 5; ++r) {
        const size_t sr = static_cast<size_t>(r);
        const float top = static_cast<float>(840 + 240 * r);
        s.LevelUpLabels[sr + 1] = &b.Label(s.LevelUpScreen, Indexed("Label9", r + 1), 240, top, 1575, 255,
                                           kAttributeNames[sr], kWhite, Mono(8.25f, true));
        Control& plus = b.Label(s.LevelUpScreen, Indexed("Label10", r), 3000, top, 255, 255, "+", kBlack,
                                Mono(9.75f, true), Align::Centre);
        plus.transparent = false;
        plus.back = Colour{255, 255, 192};
        plus.bordered = true;
        s.PlusLabels[sr] = &plus;
        for (int column = 0; column < 2; ++column) {
            const int k = 2 * r + column;
            Control& pip = b.Solid(s.LevelUpScreen, Indexed("Shape10", k), column == 0 ? 2160.0f : 2400.0f, top, 255,
                                   255, Colour{0, 192, 0});
            pip.shape = ui::ShapeKind::Circle;
            s.AttributePips[static_cast<size_t>(k)] = &pip;
        }
    }
    s.AttributeDescription = &b.Label(s.LevelUpScreen, "Label11", 120, 2160, 3375, 975, kAttributeDescriptions[4],
                                      kBlack, Mono(8.25f), Align::Centre);
    s.LevelUpOk = &b.Button(s.LevelUpScreen, "Command7", 1080, 2520, 1575, 375, "OK", kWorkOrange, Mono(9, true));
    s.LevelUpOk->visible = false;
}

void BuildMissionComplete(Builder& b, Screen& s)
{
    s.MissionCompleteScreen = &b.Panel(s.MenuLayer, "Frame13", 1680, 2280, 5415, 2295, kBlack);
    s.MissionCompleteScreen->visible = false;
    b.Label(s.MissionCompleteScreen, "Label15", 240, 480, 4935, 615, "MISJA UKOŃCZONA!", kGreen, Mono(24, true),
            Align::Centre);
    s.MissionCompleteButton = &b.Button(s.MissionCompleteScreen, "Command9", 1560, 1440, 2295, 495, "Wymiatam!",
                                        kGoalYellow, Mono(12, true));
}

void BuildPictureStores(Builder& b, Screen& s)
{
    for (int i = 0; i < 15; ++i) {
        s.GemPalette[static_cast<size_t>(i)] = &b.Picture(nullptr, Indexed("Image5", i), 0, 0, 480, 480, ui::Palette(i));
        s.GemPalette[static_cast<size_t>(i)]->visible = false;
    }
    for (int i = 0; i < 8; ++i) {
        Control& c = b.Picture(nullptr, Indexed("Image11", i), 0, 0, 735, 735, {ui::PictureSet::Portrait, int16_t(i)});
        c.visible = false;
        s.EnemyPortraits[static_cast<size_t>(i)] = &c;
    }
    for (int i = 0; i < 2; ++i) {
        Control& c = b.Picture(nullptr, Indexed("Image12", i), 0, 0, 735, 735, {ui::PictureSet::Object, int16_t(i)});
        c.visible = false;
        s.ObjectPictures[static_cast<size_t>(i)] = &c;
    }
}

// Gives every member of the screen its own name as a role, and refuses a screen with a member left unset.
void NameRoles(ui::Form& form, const Screen& s)
{
    const auto name = [&form](const std::string& role, Control* control) {
        if (!control) throw std::logic_error("BuildScreen: " + role + " was never built");
        form.Alias(role, *control);
    };
#define KRUSZARKA_ONE(member) name(#member, s.member);
#define KRUSZARKA_MANY(member, count) \
    for (size_t i = 0; i < (count); ++i) name(Indexed(#member, static_cast<int>(i)), s.member[i]);
    KRUSZARKA_SCREEN_CONTROLS(KRUSZARKA_ONE, KRUSZARKA_MANY)
#undef KRUSZARKA_ONE
#undef KRUSZARKA_MANY
}

}  // namespace

void BuildScreen(ui::Form& form, Screen& s)
{
    Builder b(form);
    form.caption = "Kruszarka";
    form.icon = {ui::PictureSet::WindowIcon, 0};
    form.pointer = ui::CursorPicture(ui::NormalCursor);

    BuildPictureStores(b, s);
    BuildHeroPanel(b, s);
    BuildSkillPanel(b, s);
    BuildBoard(b, s);
    BuildGoalPanels(b, s);
    BuildTutorialArea(b, s);
    BuildMessages(b, s);

    s.MenuLayer = &b.Panel(nullptr, "Frame5", 0, 0, 8655, 6735, kDarkGrey);
    BuildMainAndMissionMenus(b, s);
    BuildOptions(b, s);
    BuildLevelUp(b, s);
    BuildMissionComplete(b, s);
    NameRoles(form, s);
}

}  // namespace kr
