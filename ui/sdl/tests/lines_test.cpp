#include <gtest/gtest.h>

#include "ui/sdl/input.h"
#include "ui/sdl/lines.h"

namespace kr::sdl {
namespace {

using Lines = std::vector<std::string>;

// A monospace face one unit wide per byte.
int Mono(std::string_view text) { return static_cast<int>(text.size()); }

TEST(SplitLines, BreaksAtLineEndsAndWrapsAtSpaces)
{
    EXPECT_EQ(SplitLines("", 0, Mono), Lines{""});
    EXPECT_EQ(SplitLines("ab\r\ncd\nef\rgh", 0, Mono), (Lines{"ab", "cd", "ef", "gh"}));
    EXPECT_EQ(SplitLines("ab\r\n\r\ncd\r\n", 0, Mono), (Lines{"ab", "", "cd", ""}));
    EXPECT_EQ(SplitLines("a long line stays whole", 0, Mono), Lines{"a long line stays whole"});

    EXPECT_EQ(SplitLines("a b c", 3, Mono), (Lines{"a b", "c"}));
    EXPECT_EQ(SplitLines("abc", 3, Mono), Lines{"abc"}) << "exactly the width fits";
    // The spaces at a break belong to neither line, so centred lines sit true.
    EXPECT_EQ(SplitLines("ab   cd", 3, Mono), (Lines{"ab", "cd"}));
    EXPECT_EQ(SplitLines("abcdefgh ij", 4, Mono), (Lines{"abcdefgh", "ij"})) << "a long word keeps its own line";
    EXPECT_EQ(SplitLines("ij abcdefgh kl", 4, Mono), (Lines{"ij", "abcdefgh", "kl"}));
    EXPECT_EQ(SplitLines("aa bb\r\ncc dd", 5, Mono), (Lines{"aa bb", "cc dd"}));
    EXPECT_EQ(SplitLines("aa bb cc\r\ndd", 5, Mono), (Lines{"aa bb", "cc", "dd"}));
}

TEST(Input, KeysAndPointerInTheGamesUnits)
{
    EXPECT_EQ(GameKeyCode(SDLK_ESCAPE), 27);
    EXPECT_EQ(GameKeyCode(SDLK_a), 65);
    EXPECT_EQ(GameKeyCode(SDLK_t), 84);
    EXPECT_EQ(GameKeyCode(SDLK_z), 90);
    EXPECT_EQ(GameKeyCode(SDLK_0), 48);
    EXPECT_EQ(GameKeyCode(SDLK_9), 57);
    EXPECT_EQ(GameKeyCode(SDLK_RETURN), 13);
    EXPECT_EQ(GameKeyCode(SDLK_LSHIFT), std::nullopt);

    EXPECT_EQ(PixelToTwips(0), 7.0f);
    EXPECT_EQ(PixelToTwips(128), 1927.0f) << "inside the first board column, which starts at 1920";
}

}  // namespace
}  // namespace kr::sdl
