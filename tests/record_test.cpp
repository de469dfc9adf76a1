#include <gtest/gtest.h>

#include <sstream>

#include "shell/game.h"
#include "shell/startup.h"
#include "tests/session.h"
#include "tools/record.h"
#include "tools/record_file.h"
#include "tools/script.h"
#include "ui/headless.h"

namespace kr {
namespace {

using record::Input;
using record::InputKind;

// Handlers of the kind skills and hover texts bring: skill 0's frame answers both a press and a click,
// and moves over a cell and over the window's background leave a trace.
void AddHandlers(Game& g, std::string& trace)
{
    g.screen.SkillFrames[0]->onMouseDown = [&trace] { trace += "down "; };
    g.screen.SkillFrames[0]->onClick = [&trace] { trace += "click "; };
    g.screen.Cells[45]->onMouseMove = [&trace] { trace += "over45 "; };
    g.form.onBackgroundMouseMove = [&trace] { trace += "background "; };
}

std::pair<float, float> Centre(const Game& g, const ui::Control& control)
{
    const ui::Rect r = g.form.Bounds(control);
    return {r.left + r.width / 2, r.top + r.height / 2};
}

TEST(Recorder, WritesWhatAReplayNeedsAndNothingElse)
{
    testing::TempFolder played, replayed;
    ui::ScriptedMessages messages;
    record::AnswerLog answers(messages);
    ui::RecordedSound sound;
    Game g(Host{answers, sound}, played.File("config.cfg"));
    std::string trace, script;
    std::optional<record::Recorder> recorder;
    recorder.emplace(g, answers, [&script](const std::string& lines) { script += lines; });
    StartUp(g, 99);
    recorder->Started(99);
    // After the start-up, which connects the game's own handlers.
    AddHandlers(g, trace);
    auto send = [&](InputKind kind, std::pair<float, float> at) { recorder->Handle({kind, at.first, at.second}); };
    auto click = [&](const ui::Control& control) {
        send(InputKind::Press, Centre(g, control));
        send(InputKind::Release, Centre(g, control));
    };
    click(*g.screen.PlayButton);
    click(*g.screen.MissionButtons[0]);
    click(*g.screen.StartMission);
    g.timers.Advance(2000);

    // The frame's corner: its centre lies under a cost icon, so the point itself is written down.
    const ui::Rect frame = g.form.Bounds(*g.screen.SkillFrames[0]);
    const std::pair<float, float> corner{frame.left + 20, frame.top + 20};
    ASSERT_EQ(g.form.HitTest(corner.first, corner.second), g.screen.SkillFrames[0]);
    send(InputKind::Press, corner);
    g.timers.Advance(35);
    send(InputKind::Release, corner);

    // Two moves within cell 45 are one line; the background and the way back are one line each.
    const ui::Rect cell = g.form.Bounds(*g.screen.Cells[45]);
    send(InputKind::Move, {cell.left + 2, cell.top + 2});
    send(InputKind::Move, {cell.left + 300, cell.top + 200});
    std::optional<std::pair<float, float>> background;
    for (float y = 7; y < ui::Form::kHeight && !background; y += 15)
        for (float x = 7; x < ui::Form::kWidth && !background; x += 15)
            if (!g.form.HitTest(x, y)) background = {x, y};
    ASSERT_TRUE(background) << "some of the game screen is bare window";
    send(InputKind::Move, *background);
    g.timers.Advance(10);
    send(InputKind::Move, Centre(g, *g.screen.Cells[45]));
    // A press on a control without a handler changes nothing and is left out.
    click(*g.screen.HeroPortrait);
    g.timers.Advance(123);
    recorder.reset();
    EXPECT_EQ(trace, "down click over45 over45 background over45 ");

    EXPECT_NE(script.find("wait 35\nrelease @"), std::string::npos) << script;
    EXPECT_EQ(script.find("Image3"), std::string::npos) << script;
    EXPECT_TRUE(script.ends_with("move Image1(45)\nwait 123\n")) << script;

    std::string replayTrace;
    std::ostringstream out;
    script::ScriptRunner runner(out, 0, {}, replayed.File("config.cfg"));
    const size_t started = script.find("start\n") + 6;
    std::istringstream upToStart(script.substr(0, started)), rest(script.substr(started));
    ASSERT_EQ(runner.Run(upToStart), 0) << out.str();
    AddHandlers(runner.game(), replayTrace);
    ASSERT_EQ(runner.Run(rest), 0) << out.str();
    EXPECT_EQ(replayTrace, "down click over45 background over45 ");
    EXPECT_EQ(record::Snapshot(runner.game()), record::Snapshot(g));
}

// A recording never lands on anything that already has its name: not a file, not a link.
TEST(Recorder, WritesOnlyToAFreshFile)
{
    testing::TempFolder folder;
    std::string error;
    const std::filesystem::path fresh = folder.File("fresh.script");
    std::optional<record::Recorder::Sink> sink = record::RecordingFile(fresh, error);
    ASSERT_TRUE(sink) << error;
    (*sink)("seed 1\n");
    (*sink)("start\n");
    EXPECT_EQ(testing::ReadFile(fresh), "seed 1\nstart\n");

    EXPECT_FALSE(record::RecordingFile(fresh, error));
    EXPECT_NE(error.find("already exists"), std::string::npos) << error;
    EXPECT_EQ(testing::ReadFile(fresh), "seed 1\nstart\n");

    const std::filesystem::path link = folder.File("link.script");
    std::filesystem::create_symlink(folder.File("elsewhere.txt"), link);
    EXPECT_FALSE(record::RecordingFile(link, error));
    EXPECT_FALSE(std::filesystem::exists(folder.File("elsewhere.txt"))) << "nothing was created through the link";
}

}  // namespace
}  // namespace kr
