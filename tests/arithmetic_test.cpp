#include <gtest/gtest.h>

#include "shell/arithmetic.h"

namespace kr {
namespace {

TEST(Arithmetic, HalvesGoToTheEvenNeighbour)
{
    EXPECT_EQ(RoundHalfEven(0.5), 0);
    EXPECT_EQ(RoundHalfEven(1.5), 2);
    EXPECT_EQ(RoundHalfEven(2.5), 2);
    EXPECT_EQ(RoundHalfEven(37.5), 38);
    EXPECT_EQ(RoundHalfEven(62.5), 62);
    EXPECT_EQ(RoundHalfEven(-2.5), -2);
    EXPECT_EQ(RoundHalfEven(-3.5), -4);
    EXPECT_EQ(RoundHalfEven(99.5), 100);
    EXPECT_EQ(RoundHalfEven(2.4999), 2);
    EXPECT_EQ(RoundHalfEven(2.5001), 3);
}

TEST(Arithmetic, SixteenBitOverflowIsAnError)
{
    EXPECT_EQ(To16(32767, "test"), 32767);
    EXPECT_THROW(To16(32768, "test"), std::overflow_error);
    EXPECT_THROW(Round16(250.0 * 1455.0, "test"), std::overflow_error);
    EXPECT_EQ(TagNumber("10"), 10);
    EXPECT_EQ(TagNumber("3.7"), 3);
    EXPECT_EQ(TagNumber(""), 0);
}

}  // namespace
}  // namespace kr
