#include <gtest/gtest.h>

#include "shell/progress.h"
#include "tests/session.h"

namespace kr {
namespace {

using testing::ReadFile;
using testing::Session;
using testing::WriteFile;

TEST(ProgressFile, WritesSignDigitsSpaceAndCrLfPerLine)
{
    Progress p;
    p.UnlockedMissions = 1;
    p.SoundOn = 1;
    p.TutorialOn = 1;
    EXPECT_EQ(FormatProgress(p), " 1 \r\n 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 1 \r\n");
    p.UnlockedMissions = 11;
    p.Strength = -3;
    EXPECT_EQ(FormatProgress(p).substr(0, 16), " 11 \r\n 1 \r\n-3 \r\n");
}

TEST(ProgressFile, ReadsFieldsSeparatedBySpacesCommasAndLineEnds)
{
    Progress p;
    EXPECT_EQ(ParseProgress("3\n1\n2\n0\n1\n0\n2\n1\n", p), 8);
    EXPECT_EQ(p.UnlockedMissions, 3);
    EXPECT_EQ(p.Accuracy, 2);
    EXPECT_EQ(p.TutorialOn, 1);
    Progress q;
    EXPECT_EQ(ParseProgress("4,0,1 , 2 1 0\r\n\t0 ,1", q), 8);
    EXPECT_EQ(q.UnlockedMissions, 4);
    EXPECT_EQ(q.Strength, 1);
    EXPECT_EQ(q.Intelligence, 2);
    EXPECT_EQ(q.Endurance, 0);
    EXPECT_EQ(q.TutorialOn, 1);
    Progress r;
    EXPECT_EQ(ParseProgress(" 5 \r\n 1 \r\n x \r\n", r), 2) << "a field that does not convert ends the read";
    EXPECT_EQ(ParseProgress(" 5 \r\n 40000 \r\n", r), 1) << "a value past 16 bits is a failed read";
    EXPECT_EQ(ParseProgress("-32768 +32767 +7 -0", r), 4);
    EXPECT_EQ(r.UnlockedMissions, -32768);
    EXPECT_EQ(r.SoundOn, 32767);
    EXPECT_EQ(r.Strength, 7);
    for (const char* field : {"+-7", "-+7", "++7", "--7", "+", "-", "7-", "0x7", "-99999999999999999999"})
        EXPECT_EQ(ParseProgress(field, r), 0) << "a sign is one character followed by digits: " << field;
}

TEST(ProgressFile, MissingFileReportsOnceAndLeavesANewPlayer)
{
    Session s(3, "");
    EXPECT_EQ(s.TakeOutput(), "message: Nie moge znalezc pliku konfiguracyjnego!\n");
    EXPECT_EQ(s.game.UnlockedMissions, 1);
    EXPECT_EQ(s.game.SoundOn, 0);
    EXPECT_EQ(s.game.TutorialOn, 0);
    EXPECT_FALSE(std::filesystem::exists(s.folder().File("config.cfg")));
    s.Click("\"Opcje\"");
    EXPECT_EQ(s.Print("Check1.Value"), "0");
    EXPECT_EQ(s.Print("Check2.Value"), "0");
    s.Click("\"Powrót\"");
    EXPECT_EQ(ReadFile(s.folder().File("config.cfg")), " 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n");
}

TEST(ProgressFile, PartialAndOddFilesAreReadAsFarAsTheyGoThenKeptInRange)
{
    Session partial(3, " 5 \r\n 1 \r\n 2 \r\n");
    EXPECT_EQ(partial.TakeOutput(), "message: Nie moge znalezc pliku konfiguracyjnego!\n");
    EXPECT_EQ(partial.game.UnlockedMissions, 1) << "a failed read opens only the first mission";
    EXPECT_EQ(partial.game.SoundOn, 1);
    EXPECT_EQ(partial.game.Strength, 2);
    EXPECT_EQ(partial.game.Intelligence, 0);

    Session odd(3, "99\n2\n-4\n50\n1\n2\n0\n7\n");
    EXPECT_EQ(odd.TakeOutput(), "");
    EXPECT_EQ(odd.game.UnlockedMissions, 11);
    EXPECT_EQ(odd.game.SoundOn, 0) << "only 1 switches sound on";
    EXPECT_EQ(odd.game.Strength, 0);
    EXPECT_EQ(odd.game.Intelligence, 10);
    EXPECT_EQ(odd.game.Dexterity, 1);
    EXPECT_EQ(odd.game.Endurance, 2);
    EXPECT_EQ(odd.game.TutorialOn, 0);
    odd.Click("\"Opcje\"");
    EXPECT_EQ(odd.Print("Label14.Caption"),
              "\"MOC:          0\\r\\nZRĘCZNOŚĆ:    1\\r\\nCELNOŚĆ:      0\\r\\nWYTRZYMAŁOŚĆ: 2\\r\\nINTELIGENCJA: 10\"");
}

TEST(ProgressFile, AFailedSaveIsToldEachTimeLeavesTheOldFileWholeAndTheGameRunning)
{
    const std::string saved = " 4 \r\n 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 1 \r\n";
    Session s(3, saved);
    // A folder standing where config.cfg should be makes the final rename fail.
    const std::filesystem::path file = s.folder().File("config.cfg");
    std::filesystem::rename(file, s.folder().File("kept"));
    std::filesystem::create_directories(file / "inside");
    s.Click("\"Opcje\"");
    s.Click("Check1");
    s.Click("\"Powrót\"");
    EXPECT_EQ(s.TakeOutput(), "message: Nie udało się zapisać postępów gry: Is a directory\n");
    EXPECT_TRUE(s.game.screen.MainMenuScreen->visible);
    EXPECT_TRUE(std::filesystem::is_directory(file / "inside"));
    s.Click("\"Opcje\"");
    s.Click("\"Powrót\"");
    EXPECT_EQ(s.TakeOutput(), "message: Nie udało się zapisać postępów gry: Is a directory\n") << "told once per save";

    std::filesystem::remove_all(file);
    s.Click("\"Opcje\"");
    s.Click("\"Powrót\"");
    EXPECT_EQ(s.TakeOutput(), "");
    EXPECT_EQ(ReadFile(file), " 4 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 1 \r\n");
    int files = 0;
    for ([[maybe_unused]] const auto& entry : std::filesystem::directory_iterator(s.folder().path())) ++files;
    EXPECT_EQ(files, 2) << "no temporary file is left behind by failed saves";
}

TEST(ProgressFile, ResetAskedWithNoKeepsEverythingAndYesSavesAtOnce)
{
    const std::string saved = " 6 \r\n 1 \r\n 2 \r\n 1 \r\n 1 \r\n 0 \r\n 1 \r\n 0 \r\n";
    Session s(3, saved);
    s.Click("\"Opcje\"");
    s.Run("answer no");
    s.Click("\"Resetuj postać\"");
    EXPECT_EQ(s.TakeOutput(), "message: Czy na pewno chcesz zresetować postępy w grze i zacząć wszystko od nowa?\n");
    EXPECT_EQ(s.game.UnlockedMissions, 6);
    EXPECT_EQ(ReadFile(s.folder().File("config.cfg")), saved);
    s.Run("answer yes");
    s.Click("\"Resetuj postać\"");
    EXPECT_EQ(ReadFile(s.folder().File("config.cfg")), " 1 \r\n 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n");
    EXPECT_EQ(s.Print("HeroSummary.Caption"),
              "\"MOC:          0\\r\\nZRĘCZNOŚĆ:    0\\r\\nCELNOŚĆ:      0\\r\\nWYTRZYMAŁOŚĆ: 0\\r\\nINTELIGENCJA: 0\"");
}

}  // namespace
}  // namespace kr
