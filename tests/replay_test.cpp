#include <gtest/gtest.h>

#include <fstream>
#include <sstream>

#include "tests/session.h"
#include "tools/script.h"

namespace kr {
namespace {

namespace fs = std::filesystem;

// Every tests/replays/NAME.script is run headless (with NAME.cfg as the starting progress file when there is
// one) and its whole printed output must equal NAME.expected.
TEST(Replays, EveryScriptPrintsItsExpectedOutput)
{
    const fs::path folder = KRUSZARKA_REPLAYS;
    int replays = 0;
    for (const fs::directory_entry& entry : fs::directory_iterator(folder)) {
        if (entry.path().extension() != ".script") continue;
        ++replays;
        const fs::path base = fs::path(entry.path()).replace_extension();
        testing::TempFolder work;
        const fs::path progress = work.File("config.cfg");
        if (fs::exists(fs::path(base).replace_extension(".cfg")))
            fs::copy_file(fs::path(base).replace_extension(".cfg"), progress);
        std::ostringstream out;
        script::ScriptRunner runner(out, 1, {}, progress);
        std::ifstream in(entry.path());
        const int code = runner.Run(in);
        EXPECT_EQ(code, 0) << entry.path() << "\n" << out.str();
        EXPECT_EQ(out.str(), testing::ReadFile(fs::path(base).replace_extension(".expected"))) << entry.path();
    }
    EXPECT_GE(replays, 2);
}

// The language itself: exit codes and the shapes of what it prints.
TEST(Replays, TheScenarioLanguageReportsFailuresAndBadLines)
{
    testing::TempFolder work;
    auto run = [&](const std::string& text, std::string* output) {
        std::ostringstream out;
        script::ScriptRunner runner(out, 5, {}, work.File("config.cfg"));
        std::istringstream in(text);
        const int code = runner.Run(in);
        *output = out.str();
        return code;
    };
    std::string output;
    EXPECT_EQ(run("seed 3\nanswer ok\nstart # first start\nprint UnlockedMissions\nexpect Frame6.Visible True\n"
                  "print Pointer\nprint Image5(7).Picture\nprint Timer16.Interval\nclick \"Gra\"\n"
                  "expect MissionMenuScreen.Visible True\nexpect Command4(1).Enabled False\ncall sprawdz\n"
                  "call MaxHealthFor 2 1\nsounds\n",
                  &output),
              0);
    EXPECT_EQ(output,
              "message: Nie moge znalezc pliku konfiguracyjnego!\nUnlockedMissions = 1\nPointer = NormalCursor\n"
              "Image5(7).Picture = palette 7\nTimer16.Interval = 30000\nsprawdz = False\nMaxHealthFor = 62\n"
              "sounds:\n");
    EXPECT_EQ(run("start\nexpect Health 5\nprint Health\n", &output), 1);
    const std::string missing = "message: Nie moge znalezc pliku konfiguracyjnego!\n";
    EXPECT_EQ(output, missing + "expect failed: line 2: Health = 0, expected 5\n");
    EXPECT_EQ(run("start\nfrobnicate\n", &output), 2);
    EXPECT_NE(output.find("line 2: frobnicate"), std::string::npos);
    EXPECT_EQ(run("print NoSuchThing\n", &output), 2);
    EXPECT_EQ(run("start\ncall ShowHint 15\n", &output), 2) << "arguments that would index past a table are refused";
    EXPECT_NE(output.find("must be a page 1..14"), std::string::npos);
    EXPECT_EQ(run("start\ncall GenerateCell 19\n", &output), 2);
    EXPECT_EQ(run("click \"Misja 4\"\n", &output), 2) << "a caption must belong to a visible control";
    EXPECT_EQ(run("start\nset Board(45) 3\nset GreenFlag(45) True\nset BriefingText \"a\\\"b\"\nprint Board(45)\n"
                  "print BriefingText\nboard\n01234012\n12340123\n23401234\n3401234g\n40123401\n01234012\n12340123\n"
                  "23401234\ndump\n",
                  &output),
              0);
    EXPECT_EQ(output,
              missing + "Board(45) = 3\nBriefingText = \"a\\\"b\"\n##########\n#01234012#\n#12340123#\n#23401234#\n#3401234g#\n"
              "#40123401#\n#01234012#\n#12340123#\n#23401234#\n##########\n");
}

// A recording names a control whose centre another control covers by the point that was pressed, and a
// press that already ran its handler finishes as a click with a bare release.
TEST(Replays, PointsAndReleasesReachTheControlsTheyName)
{
    testing::Session s;
    const ui::Rect gra = s.game.form.Bounds(*s.game.ui.PlayButton);
    EXPECT_EQ(s.Run("press Command1\nexpect MainMenuScreen.Visible True\nrelease Command2\n"
                    "expect MainMenuScreen.Visible True\n"),
              0)
        << "a release over another control is no click";
    EXPECT_EQ(s.Run("press Command1\nrelease Command1\nexpect MissionMenuScreen.Visible True\nrelease Command5\n"
                    "expect MissionMenuScreen.Visible True\n"),
              0)
        << "a release with nothing pressed is no click";
    EXPECT_EQ(s.Run("click Command5\nclick @" + std::to_string(static_cast<int>(gra.left + 1)) + "," +
                    std::to_string(static_cast<int>(gra.top + gra.height - 1)) +
                    "  # the corner of \"Gra\"\nexpect MissionMenuScreen.Visible True\n"),
              0);
    EXPECT_EQ(s.Run("click @12,x\n"), 2);
    EXPECT_EQ(s.Run("move @12\n"), 2);
}

}  // namespace
}  // namespace kr
