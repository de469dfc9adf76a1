#include <gtest/gtest.h>

#include "shell/briefing.h"
#include "shell/screens.h"
#include "shell/texts.h"
#include "shell/timer_numbers.h"
#include "tests/session.h"

namespace kr {
namespace {

using testing::Session;

TEST(StartUp, ShowsTheMainMenuOverALockedBoardWithItsBorder)
{
    Session s;
    EXPECT_TRUE(s.game.screen.MenuLayer->visible);
    EXPECT_TRUE(s.game.screen.MainMenuScreen->visible);
    for (const char* hidden : {"MissionMenuScreen", "BriefingScreen", "OptionsScreen", "LevelUpScreen",
                               "MissionCompleteScreen", "ReturnPrompt", "NoMovesLabel", "StageDoneLabel",
                               "MissionFailedLabel"})
        EXPECT_EQ(s.Print(std::string(hidden) + ".Visible"), "False") << hidden;
    EXPECT_EQ(s.Print("MainMenuScreen.Left"), "2280");
    EXPECT_EQ(s.Print("MainMenuScreen.Top"), "960");
    EXPECT_EQ(s.Print("BriefingScreen.Left"), "1560");
    EXPECT_EQ(s.Print("Label10(2).Top"), "1290");
    EXPECT_EQ(s.Print("Shape10(3).Left"), "2430");
    EXPECT_EQ(s.Print("Shape10(3).Top"), "1090");
    EXPECT_EQ(s.Print("Shape10(3).Width"), "195");
    EXPECT_EQ(s.Print("Image2(0).Top"), "120");
    EXPECT_EQ(s.Print("Image2(6).Top"), "160");
    EXPECT_EQ(s.Print("Image6(29).Visible"), "False");
    EXPECT_EQ(s.Print("InputReady"), "False");
    EXPECT_EQ(s.Print("SelectedCell"), "-1");
    EXPECT_EQ(s.Print("SkillCost(4)"), "0");       // bullets for "Teleport"
    EXPECT_EQ(s.Print("SkillCost(31)"), "4");      // grenades for "Rzut granatem"
    EXPECT_EQ(s.Print("Board(19)"), "-1");
    EXPECT_EQ(s.Print("Pointer"), "NormalCursor");
    EXPECT_TRUE(s.game.timers[kHintTimer].Enabled());
    EXPECT_FALSE(s.game.timers[kFillTimer].Enabled());
    // Clicks on the border and keys on the menu do nothing.
    s.Key(kEscapeKey);
    EXPECT_EQ(s.Print("ReturnPrompt.Visible"), "False");
}

TEST(StartUp, TheFirstHintIsNeverPageFourteen)
{
    int seen[15] = {};
    for (uint32_t seed = 0; seed < 400; ++seed) {
        Session s(seed);
        const int page = s.game.TutorialPage;
        ASSERT_GE(page, 1);
        ASSERT_LE(page, 13);
        ++seen[page];
        ASSERT_EQ(s.game.screen.PageLabel->caption, std::to_string(page));
        ASSERT_EQ(s.game.screen.HintLabel->caption, kTutorialTexts[static_cast<size_t>(page)]);
    }
    for (int page = 1; page <= 13; ++page) EXPECT_GT(seen[page], 0) << page;
}

TEST(ScreenFlow, MenusLeadToEachOtherAndExitEndsAtOnce)
{
    Session s(7, " 3 \r\n 1 \r\n 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 1 \r\n");
    s.Click("\"Gra\"");
    EXPECT_FALSE(s.game.screen.MainMenuScreen->visible);
    EXPECT_TRUE(s.game.screen.MissionMenuScreen->visible);
    for (int i = 0; i < 10; ++i)
        EXPECT_EQ(s.game.screen.MissionButtons[static_cast<size_t>(i)]->enabled, i < 3) << i;
    // A disabled mission button takes no click.
    s.Click("Command4(3)");
    EXPECT_TRUE(s.game.screen.MissionMenuScreen->visible);
    s.Click("\"Powrót\"");
    EXPECT_TRUE(s.game.screen.MainMenuScreen->visible);
    s.Click("\"Opcje\"");
    EXPECT_TRUE(s.game.screen.OptionsScreen->visible);
    EXPECT_EQ(s.Print("Check1.Value"), "1");
    EXPECT_EQ(s.Print("HeroSummary.Caption"),
              "\"MOC:          1\\r\\nZRĘCZNOŚĆ:    0\\r\\nCELNOŚĆ:      0\\r\\nWYTRZYMAŁOŚĆ: 0\\r\\nINTELIGENCJA: 0\"");
    s.Click("\"Dźwięki\"");
    EXPECT_EQ(s.game.SoundOn, 0);
    s.Click("\"Powrót\"");
    EXPECT_EQ(testing::ReadFile(s.folder().File("config.cfg")),
              " 3 \r\n 0 \r\n 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 1 \r\n");
    EXPECT_TRUE(s.game.screen.MainMenuScreen->visible);
    EXPECT_FALSE(s.game.quitRequested);
    s.Click("\"Wyjście\"");
    EXPECT_TRUE(s.game.quitRequested);
}

TEST(ScreenFlow, BriefingTypesOneCharacterPerTickAndANewChoiceReplacesIt)
{
    Session s(7, " 2 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 1 \r\n 0 \r\n 0 \r\n");
    s.Click("\"Gra\"");
    s.Click("\"Misja 1\"");
    EXPECT_TRUE(s.game.screen.BriefingScreen->visible);
    EXPECT_EQ(s.game.MaxHealth, 38);
    EXPECT_EQ(s.Print("Label12.Caption"), "\"\"");
    s.Advance(30);
    EXPECT_EQ(s.Print("Label12.Caption"), "\"To \"");
    s.Advance(40);
    EXPECT_EQ(s.Print("Label12.Caption"), "\"To będz\"") << "a Polish letter is one character";
    s.Click("\"<- Wróć do menu misji\"");
    s.Advance(100);
    EXPECT_EQ(s.game.screen.BriefingLabel->caption.size(), std::string("To będzie misja s").size())
        << "typing goes on into the hidden label";
    s.Click("\"Misja 2\"");
    EXPECT_EQ(s.game.MaxHealth, 50);
    EXPECT_EQ(s.game.ChosenMission, 1);
    const std::string text = kBriefings[1];
    int characters = 0;
    for (char c : text) characters += (static_cast<unsigned char>(c) & 0xC0) != 0x80;
    s.Advance(10 * characters);
    EXPECT_EQ(s.game.screen.BriefingLabel->caption, text);
    EXPECT_TRUE(s.game.timers[kTypewriterTimer].Enabled()) << "the tick after the last character stops the typewriter";
    s.Advance(10);
    EXPECT_FALSE(s.game.timers[kTypewriterTimer].Enabled());
}

TEST(ScreenFlow, MaximumHealthForEveryMissionAndEndurance)
{
    const int expected[3][10] = {{30, 40, 50, 60, 70, 80, 90, 100, 110, 120},
                                 {38, 50, 62, 75, 88, 100, 112, 125, 138, 150},
                                 {45, 60, 75, 90, 105, 120, 135, 150, 165, 180}};
    for (int16_t endurance = 0; endurance <= 2; ++endurance)
        for (int16_t mission = 0; mission <= 9; ++mission)
            EXPECT_EQ(MaxHealthFor(mission, endurance), expected[endurance][mission]) << mission << " " << endurance;
    // The endurance at the moment of the choice counts.
    Session s(7, " 11 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 2 \r\n 0 \r\n 0 \r\n");
    s.Click("\"Gra\"");
    s.Click("\"Misja 10\"");
    EXPECT_EQ(s.game.MaxHealth, 180);
}

TEST(Keys, EscapeTogglesThePromptNHidesItTLeavesTheMission)
{
    Session s(7, " 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 1 \r\n");
    s.Click("\"Gra\"");
    s.Click("\"Misja 1\"");
    s.Click("\"Rozpocznij misję ->\"");
    EXPECT_FALSE(s.game.screen.MenuLayer->visible);
    s.Key(kEscapeKey);
    EXPECT_TRUE(s.game.screen.ReturnPrompt->visible);
    s.Key(kEscapeKey);
    EXPECT_FALSE(s.game.screen.ReturnPrompt->visible);
    s.Key(kEscapeKey);
    s.Key(kKeyN);
    EXPECT_FALSE(s.game.screen.ReturnPrompt->visible);
    s.Key(65);
    EXPECT_FALSE(s.game.screen.ReturnPrompt->visible);
    // T with the prompt hidden, in the middle of the fill with a slowed bomb clock.
    s.Advance(300);
    s.game.timers[kBombClock].SetInterval(200);
    s.game.timers[kBombClock].SetEnabled(true);
    s.Key(kKeyT);
    EXPECT_TRUE(s.game.screen.MenuLayer->visible);
    EXPECT_TRUE(s.game.screen.MainMenuScreen->visible);
    for (int timer = 1; timer <= 6; ++timer) EXPECT_FALSE(s.game.timers[timer].Enabled()) << timer;
    EXPECT_EQ(s.game.timers[kBombClock].Interval(), 100);
    EXPECT_TRUE(s.game.timers[kHintTimer].Enabled());
    EXPECT_FALSE(std::filesystem::exists(s.folder().File("config.cfg.tmp")));
    EXPECT_EQ(testing::ReadFile(s.folder().File("config.cfg")), " 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 1 \r\n");
}

TEST(Tutorial, PagesWrapAroundAndTheTimerRestartsOnAClick)
{
    Session s(7, " 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 1 \r\n");
    // With the tutorial switch on the panel comes home at a mission start.
    s.StartMission(0);
    EXPECT_EQ(s.Print("TutorialPanel.Top"), "120");
    s.Run("call ShowHint 14");
    s.Advance(20000 - 64 * 30);
    s.Click("\"następna--->\"");
    EXPECT_EQ(s.game.TutorialPage, 1);
    s.Click("\"<---poprzednia\"");
    EXPECT_EQ(s.game.TutorialPage, 14);
    s.Advance(29999);
    EXPECT_EQ(s.game.TutorialPage, 14) << "the next automatic change comes 30 s after the click";
    // The draw may land on 14 again: mark the page so that only a new draw can put a real one back.
    s.Run("set TutorialPage 0");
    s.Advance(1);
    EXPECT_GE(s.game.TutorialPage, 1);
    EXPECT_LE(s.game.TutorialPage, 14);
    s.Click("\"X\"");
    EXPECT_EQ(s.Print("TutorialPanel.Top"), "5000");
    // A new stage keeps it closed; the next mission start brings it home again.
    s.game.TerminalRequired = false;
    s.Run("call CheckStageDone");
    s.Advance(7000);
    EXPECT_EQ(s.game.MissionStage, 1);
    EXPECT_EQ(s.Print("TutorialPanel.Top"), "5000");
    s.Key(84);
    s.StartMission(0);
    EXPECT_EQ(s.Print("TutorialPanel.Top"), "120");
}

}  // namespace
}  // namespace kr
