// When the game asks for sounds: each play procedure's channel at its moment, and nothing with sound off.
#include <gtest/gtest.h>

#include <cmath>
#include <vector>

#include "shell/sound.h"
#include "tests/fight_helpers.h"
#include "tests/session.h"

namespace kr {
namespace {

using namespace testing;

// Mission 1 open, the sound switch as given, every attribute 0, tutorial off.
std::string Progress(int soundSwitch) { return " 1 \r\n " + std::to_string(soundSwitch) + " \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n"; }

// Mission 1 from the menu to the mission-complete screen, with the sound switch on and off.
TEST(Sound, EachMomentPlaysItsChannelAndOnlyWithTheSwitchOn)
{
    for (int soundSwitch : {1, 0}) {
        SCOPED_TRACE(soundSwitch);
        const auto expect = [&](std::vector<int> channels) { return soundSwitch == 1 ? channels : std::vector<int>{}; };
        Session s(41, Progress(soundSwitch));
        s.StartMission(0);
        EXPECT_EQ(s.Sounds(), expect({10})) << "the stage is set up";

        PlayRun(s, "000");
        EXPECT_EQ(s.Sounds(), expect({4})) << "grey bullets reload";
        Settle(s);
        s.Sounds();
        PlayRun(s, "222");
        EXPECT_EQ(s.Sounds(), expect({4})) << "so do grenades";
        Settle(s);
        s.Sounds();

        s.Run("set TerminalWork 1");
        PlayRun(s, "444");
        EXPECT_EQ(s.Sounds(), expect({5})) << "the door needs work";
        s.AdvanceUntil([&] { return s.game.screen.StageDoneLabel->visible; });
        EXPECT_EQ(s.Sounds(), expect({7})) << "the door was the stage's goal";
        s.AdvanceUntil([&] { return s.game.MissionStage == 1; });
        EXPECT_EQ(s.Sounds(), expect({10})) << "the next stage";

        Settle(s);
        s.Run("set EnemyHealth 1");
        PlayRun(s, "111");
        const std::vector<int> shot = s.Sounds();
        if (soundSwitch == 1) EXPECT_TRUE(shot == std::vector<int>{0} || shot == std::vector<int>{1});
        else EXPECT_TRUE(shot.empty());
        s.AdvanceUntil([&] { return s.game.screen.MissionCompleteScreen->visible; });
        EXPECT_EQ(s.Sounds(), expect({7, 13})) << "the last stage's goal, then the mission";
    }
}

// The shot draws n = round(r x 100), halves to even, and takes the second sound from 50 up.
TEST(Sound, TheShotTakesTheSecondSoundFromFiftyUp)
{
    Session s(43, Progress(1));
    s.Sounds();
    int seconds = 0;
    for (int i = 0; i < 2000; ++i) {
        Random next = s.game.random;
        const float n = std::nearbyint(next.Draw() * 100.0f);
        PlayShot(s.game);
        const std::vector<int> played = s.Sounds();
        ASSERT_EQ(played, std::vector<int>{n >= 50 ? 1 : 0}) << "draw " << i << ", n = " << n;
        seconds += played[0];
    }
    EXPECT_NEAR(seconds, 1010, 100) << "a chance of 0.505";
}

}  // namespace
}  // namespace kr
