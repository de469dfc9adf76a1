#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include "tests/session.h"
#include "tools/script.h"

namespace kr {
namespace {

namespace fs = std::filesystem;

// The replays in tests/replays: each NAME.script runs headless (with NAME.cfg as the starting progress file when
// there is one), and its whole printed output must equal NAME.expected. With KRUSZARKA_REWRITE_REPLAYS=1 in the
// environment the expected files are written anew instead, for a change that is meant to alter them.
std::vector<std::string> ReplayNames()
{
    std::vector<std::string> names;
    for (const fs::directory_entry& entry : fs::directory_iterator(KRUSZARKA_REPLAYS))
        if (entry.path().extension() == ".script") names.push_back(entry.path().stem().string());
    std::sort(names.begin(), names.end());
    return names;
}

class Replay : public ::testing::TestWithParam<std::string> {};

TEST_P(Replay, PrintsItsExpectedOutput)
{
    const fs::path base = fs::path(KRUSZARKA_REPLAYS) / GetParam();
    testing::TempFolder work;
    const fs::path progress = work.File("config.cfg");
    if (fs::exists(fs::path(base).replace_extension(".cfg")))
        fs::copy_file(fs::path(base).replace_extension(".cfg"), progress);
    std::ostringstream out;
    script::ScriptRunner runner(out, 1, {}, progress);
    std::ifstream in(fs::path(base).replace_extension(".script"));
    const int code = runner.Run(in);
    EXPECT_EQ(code, 0) << out.str();
    const fs::path expected = fs::path(base).replace_extension(".expected");
    const char* rewrite = std::getenv("KRUSZARKA_REWRITE_REPLAYS");
    if (rewrite && std::string(rewrite) == "1") testing::WriteFile(expected, out.str());
    EXPECT_EQ(out.str(), testing::ReadFile(expected));
}

INSTANTIATE_TEST_SUITE_P(Replays, Replay, ::testing::ValuesIn(ReplayNames()),
                         [](const ::testing::TestParamInfo<std::string>& replay) { return replay.param; });

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
    EXPECT_EQ(run("start\nkey 9 ctrl\n", &output), 2) << "shift is the one modifier a key takes";
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
    const ui::Rect gra = s.game.form.Bounds(*s.game.screen.PlayButton);
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
