#include <gtest/gtest.h>

#include <sys/stat.h>
#include <unistd.h>

#include <fstream>

#include "ui/sdl/mixer_sound.h"
#include "ui/sdl/sound_file.h"
#include "ui/sdl/voices.h"

namespace kr::sdl {
namespace {

// A short 8-bit mono WAV at a rate of its own, so loading must convert it: `samples` samples of `level`.
void WriteWav(const std::filesystem::path& file, uint32_t samples = 4410, uint8_t level = 128)
{
    std::filesystem::create_directories(file.parent_path());
    const auto u32 = [](uint32_t v) { return std::string{char(v), char(v >> 8), char(v >> 16), char(v >> 24)}; };
    const auto u16 = [](uint16_t v) { return std::string{char(v), char(v >> 8)}; };
    std::ofstream out(file, std::ios::binary);
    out << "RIFF" << u32(36 + samples) << "WAVEfmt " << u32(16) << u16(1) << u16(1) << u32(11025) << u32(11025)
        << u16(1) << u16(8) << "data" << u32(samples) << std::string(samples, char(level));
}

class MixerSoundTest : public ::testing::Test {
protected:
    void SetUp() override
    {
        // No sound card needed: SDL's silent driver runs a device thread like a real one.
        SDL_SetHint(SDL_HINT_AUDIODRIVER, "dummy");
        folder = std::filesystem::temp_directory_path() / ("kruszarka-sound-" + std::to_string(::getpid()));
        here = folder / "working";
        game = folder / "game";
        std::filesystem::create_directories(here);
        previous = std::filesystem::current_path();
        std::filesystem::current_path(here);
    }
    void TearDown() override
    {
        std::filesystem::current_path(previous);
        std::filesystem::remove_all(folder);
    }

    // Waits, on the real clock, until the device has asked for `more` buffers; false after a second.
    static bool Fed(const MixerSound& sound, uint64_t more)
    {
        const uint64_t target = sound.BuffersFed() + more;
        for (int i = 0; i < 1000 && sound.BuffersFed() < target; ++i) SDL_Delay(1);
        return sound.BuffersFed() >= target;
    }

    std::filesystem::path folder, here, game, previous;
    double now = 0;
    MixerSound::Clock clock = [this] { return now; };
};

// Sounds come from beside the program only; anything else named like one is reported and stays silent.
TEST_F(MixerSoundTest, LoadsOnlyRegularFilesBesideTheProgram)
{
    const Assets assets{game};
    WriteWav(game / "dzwieki" / "bum.wav");
    WriteWav(here / "dzwieki" / "start.wav");
    std::filesystem::create_directories(game / "dzwieki" / "uzyj.wav");
    ASSERT_EQ(::mkfifo((game / "dzwieki" / "reload.wav").c_str(), 0600), 0);
    std::ofstream(game / "dzwieki" / "odglos.wav") << "RIFF but not a sound";

    MixerSound sound(assets, clock);
    sound.Open(9, "dzwieki/bum.wav");
    sound.Open(10, "dzwieki/start.wav");
    sound.Open(11, "dzwieki/uzyj.wav");
    sound.Open(4, "dzwieki/reload.wav");  // would block forever if opened for reading without O_NONBLOCK
    sound.Open(3, "dzwieki/odglos.wav");
    sound.Open(0, "dzwieki/strzal1.wav");
    EXPECT_TRUE(sound.Loaded(9)) << "decoded at start-up, before any device";
    EXPECT_FALSE(sound.Loaded(10)) << "the working directory's copy is not the game's";
    for (int missing : {11, 4, 3, 0}) EXPECT_FALSE(sound.Loaded(missing)) << missing;

    std::string problem;
    EXPECT_TRUE(LoadSound(game / "dzwieki" / "uzyj.wav", problem).empty());
    EXPECT_EQ(problem, "to nie jest zwykły plik");
    problem.clear();
    const std::vector<float> bum = LoadSound(game / "dzwieki" / "bum.wav", problem);
    EXPECT_EQ(problem, "");
    EXPECT_EQ(bum.size(), 4u * 4410) << "0.4 s at 11025 Hz become 0.4 s at 44100 Hz";

    // A missing sound silences only its own channel.
    sound.Start();
    ASSERT_TRUE(sound.HasSound()) << "the dummy driver stands in for a sound card";
    sound.Play(3);
    EXPECT_FALSE(sound.DeviceOpen()) << "nothing to play opens nothing";
    sound.Play(9);
    EXPECT_TRUE(sound.Playing(9));

    // Opening a channel again replaces its sound, even a playing one.
    sound.Open(9, "dzwieki/uzyj.wav");
    EXPECT_FALSE(sound.Loaded(9));
    EXPECT_FALSE(sound.Playing(9));
}

// The device runs only while something plays, and a little after: idle, nothing is left awake.
TEST_F(MixerSoundTest, OpensTheDeviceToPlayAndClosesItAfterASilence)
{
    const Assets assets{game};
    WriteWav(game / "dzwieki" / "bum.wav");  // 400 ms
    WriteWav(game / "dzwieki" / "start.wav", 11025);  // 1000 ms
    MixerSound sound(assets, clock);
    sound.Open(9, "dzwieki/bum.wav");
    sound.Open(10, "dzwieki/start.wav");
    sound.Play(9);
    EXPECT_FALSE(sound.DeviceOpen()) << "silent until started";

    sound.Start();
    EXPECT_FALSE(sound.DeviceOpen()) << "checked at start, then closed";
    EXPECT_FALSE(sound.CloseWhenQuiet()) << "a closed device needs no waking";
    EXPECT_EQ(SDL_WasInit(SDL_INIT_AUDIO), 0u) << "no driver thread left behind";

    sound.Play(9);
    ASSERT_TRUE(sound.DeviceOpen());
    EXPECT_TRUE(Fed(sound, 2)) << "the device runs";
    now = 300;
    sound.Play(10);
    EXPECT_EQ(sound.CloseWhenQuiet(), 1000 + MixerSound::kLingerMs) << "the longer sound counts";
    now = 800;
    sound.Play(9);
    EXPECT_EQ(sound.CloseWhenQuiet(), 500 + MixerSound::kLingerMs) << "a restart that ends sooner changes nothing";
    now = 1300 + MixerSound::kLingerMs - 1;
    EXPECT_TRUE(sound.CloseWhenQuiet());
    EXPECT_TRUE(sound.DeviceOpen());
    now += 1;
    EXPECT_FALSE(sound.CloseWhenQuiet());
    EXPECT_FALSE(sound.DeviceOpen());
    EXPECT_EQ(SDL_WasInit(SDL_INIT_AUDIO), 0u);
    const uint64_t fed = sound.BuffersFed();
    SDL_Delay(50);
    EXPECT_EQ(sound.BuffersFed(), fed) << "nothing feeds a closed device";

    // The next sound opens it again at once.
    sound.Play(10);
    EXPECT_TRUE(sound.DeviceOpen());
    EXPECT_TRUE(sound.Playing(10));
    EXPECT_TRUE(Fed(sound, 1));
}

// Our mixer sums the channels, clamps at full scale and restarts a busy channel from its beginning.
TEST(Voices, SumsClampsAndRestarts)
{
    Voices voices;
    voices.SetSound(0, {0.5f, 0.5f, 0.5f});
    voices.SetSound(1, {0.25f, 0.75f});
    voices.SetSound(13, {-0.25f});
    voices.SetSound(14, {1.0f});
    EXPECT_FALSE(voices.HasSound(14));
    EXPECT_EQ(voices.Milliseconds(0), 3000.0 / Voices::kRate);

    float out[4] = {9, 9, 9, 9};
    voices.Mix(out, 4);
    EXPECT_EQ(std::vector<float>(out, out + 4), std::vector<float>(4, 0.0f)) << "nothing started: silence";

    voices.Start(0);
    voices.Start(1);
    voices.Start(13);
    voices.Mix(out, 2);
    EXPECT_EQ(std::vector<float>(out, out + 2), (std::vector<float>{0.5f, 1.0f}));
    EXPECT_FALSE(voices.Playing(1));
    EXPECT_TRUE(voices.Playing(0));
    voices.Start(0);
    voices.Mix(out, 4);
    EXPECT_EQ(std::vector<float>(out, out + 4), (std::vector<float>{0.5f, 0.5f, 0.5f, 0.0f})) << "restarted";

    voices.SetSound(2, {0.75f, -0.75f});
    voices.SetSound(3, {0.75f, -0.75f});
    voices.Start(2);
    voices.Start(3);
    voices.Mix(out, 2);
    EXPECT_EQ(std::vector<float>(out, out + 2), (std::vector<float>{1.0f, -1.0f})) << "clamped";
}

}  // namespace
}  // namespace kr::sdl
