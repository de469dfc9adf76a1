#include <gtest/gtest.h>

#include <unistd.h>

#include <fstream>

#include "ui/sdl/mixer_sound.h"

namespace kr::sdl {
namespace {

// A short silent 8-bit mono WAV.
void WriteWav(const std::filesystem::path& file)
{
    std::filesystem::create_directories(file.parent_path());
    const auto u32 = [](uint32_t v) { return std::string{char(v), char(v >> 8), char(v >> 16), char(v >> 24)}; };
    const auto u16 = [](uint16_t v) { return std::string{char(v), char(v >> 8)}; };
    const uint32_t samples = 4410;
    std::ofstream out(file, std::ios::binary);
    out << "RIFF" << u32(36 + samples) << "WAVEfmt " << u32(16) << u16(1) << u16(1) << u32(11025) << u32(11025)
        << u16(1) << u16(8) << "data" << u32(samples) << std::string(samples, char(128));
}

class MixerSoundTest : public ::testing::Test {
protected:
    void SetUp() override
    {
        folder = std::filesystem::temp_directory_path() / ("kruszarka-sound-" + std::to_string(::getpid()));
        here = folder / "working";
        std::filesystem::create_directories(here);
        previous = std::filesystem::current_path();
        std::filesystem::current_path(here);
    }
    void TearDown() override
    {
        std::filesystem::current_path(previous);
        std::filesystem::remove_all(folder);
    }

    std::filesystem::path folder, here, previous;
};

// Sounds beside the executable play; one lying in the working directory is not the game's. Missing ones are
// silent, never fatal.
TEST_F(MixerSoundTest, PlaysWhatItFindsAndStaysSilentOtherwise)
{
    const Assets assets{folder / "game"};
    WriteWav(folder / "game" / "dzwieki" / "bum.wav");
    WriteWav(here / "dzwieki" / "start.wav");
    EXPECT_EQ(assets.Resolve("dzwieki/bum.wav"), folder / "game" / "dzwieki" / "bum.wav");
    EXPECT_EQ(assets.Resolve("dzwieki/start.wav"), folder / "game" / "dzwieki" / "start.wav");

    MixerSound sound(assets);
    // Channels opened before the device are loaded when it starts; until then they are silent.
    sound.Open(9, "dzwieki/bum.wav");
    sound.Open(10, "dzwieki/start.wav");
    sound.Play(9);
    EXPECT_FALSE(sound.Loaded(9));
    sound.Start();
    ASSERT_TRUE(sound.HasDevice()) << "the dummy driver stands in for a missing sound card";
    EXPECT_EQ(Mix_AllocateChannels(-1), 14);
    sound.Open(11, "dzwieki/uzyj.wav");
    EXPECT_TRUE(sound.Loaded(9));
    EXPECT_FALSE(sound.Loaded(10));
    EXPECT_FALSE(sound.Loaded(11));

    sound.Prev(9);
    sound.Play(9);
    sound.Play(11);
    sound.Play(42);
    EXPECT_EQ(Mix_Playing(9), 1);
    EXPECT_EQ(Mix_Playing(11), 0);

    // Opening a channel again replaces its sound, even a playing one.
    sound.Open(9, "dzwieki/uzyj.wav");
    EXPECT_FALSE(sound.Loaded(9));
    EXPECT_EQ(Mix_Playing(9), 0);
}

}  // namespace
}  // namespace kr::sdl
