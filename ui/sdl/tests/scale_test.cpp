#include <gtest/gtest.h>

#include <cstdlib>

#include "ui/sdl/game_window.h"

namespace kr::sdl {
namespace {

// The window is 576 x 447 pixels at 1x, and the window manager's frame needs 64 more in height.
TEST(Scale, LargestWholeScaleThatFitsTheUsableArea)
{
    EXPECT_EQ(FittingScale(1024, 700), 1);
    EXPECT_EQ(FittingScale(1366, 768), 1);
    EXPECT_EQ(FittingScale(1920, 1040), 2);
    EXPECT_EQ(FittingScale(2560, 1408), 3) << "a 1440-line screen less a panel";
    EXPECT_EQ(FittingScale(3840, 2100), 4);
    EXPECT_EQ(FittingScale(7680, 4300), 4) << "no larger than 4x";
    EXPECT_EQ(FittingScale(800, 500), 1) << "too small for 1x still gets 1x";
    // The edges: exactly enough fits, one pixel less does not.
    EXPECT_EQ(FittingScale(1728, 3 * 447 + 64), 3);
    EXPECT_EQ(FittingScale(1727, 3 * 447 + 64), 2);
    EXPECT_EQ(FittingScale(1728, 3 * 447 + 63), 2);
}

TEST(Scale, ForcedByTheEnvironmentWhenInRange)
{
    ::unsetenv("KRUSZARKA_SCALE");
    const int fitting = ChooseScale();
    for (const char* forced : {"1", "2", "3", "4"}) {
        ASSERT_EQ(::setenv("KRUSZARKA_SCALE", forced, 1), 0);
        EXPECT_EQ(ChooseScale(), forced[0] - '0');
    }
    for (const char* ignored : {"0", "5", "x", ""}) {
        ASSERT_EQ(::setenv("KRUSZARKA_SCALE", ignored, 1), 0);
        EXPECT_EQ(ChooseScale(), fitting) << ignored;
    }
    ::unsetenv("KRUSZARKA_SCALE");
}

}  // namespace
}  // namespace kr::sdl
