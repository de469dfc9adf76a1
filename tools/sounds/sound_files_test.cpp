#include <gtest/gtest.h>

#include <unistd.h>

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

#include "shell/texts.h"

namespace {

struct Wav {
    uint16_t format = 0, channels = 0, bits = 0, blockAlign = 0;
    uint32_t rate = 0, byteRate = 0;
    std::vector<int16_t> samples;
    double Seconds() const { return static_cast<double>(samples.size()) / rate; }
    double PeakDbfs() const
    {
        int peak = 0;
        for (int16_t s : samples) peak = std::max(peak, std::abs(static_cast<int>(s)));
        return 20 * std::log10(peak / 32768.0);
    }
};

std::string ReadAll(const std::filesystem::path& file)
{
    std::string bytes(std::filesystem::file_size(file), '\0');
    std::ifstream(file, std::ios::binary).read(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    return bytes;
}

uint32_t At(const std::string& bytes, size_t offset, int size)
{
    uint32_t value = 0;
    for (int i = size - 1; i >= 0; --i)
        value = value << 8 | static_cast<uint8_t>(bytes.at(offset + static_cast<size_t>(i)));
    return value;
}

// Reads a RIFF WAVE file chunk by chunk, failing the test on any field that disagrees with the file.
Wav Parse(const std::string& bytes)
{
    Wav wav;
    EXPECT_EQ(bytes.substr(0, 4), "RIFF");
    EXPECT_EQ(At(bytes, 4, 4), bytes.size() - 8) << "RIFF size";
    EXPECT_EQ(bytes.substr(8, 4), "WAVE");
    for (size_t chunk = 12; chunk + 8 <= bytes.size();) {
        const std::string id = bytes.substr(chunk, 4);
        const uint32_t size = At(bytes, chunk + 4, 4);
        EXPECT_LE(chunk + 8 + size, bytes.size()) << id << " runs past the end";
        if (id == "fmt ") {
            EXPECT_EQ(size, 16u);
            wav.format = static_cast<uint16_t>(At(bytes, chunk + 8, 2));
            wav.channels = static_cast<uint16_t>(At(bytes, chunk + 10, 2));
            wav.rate = At(bytes, chunk + 12, 4);
            wav.byteRate = At(bytes, chunk + 16, 4);
            wav.blockAlign = static_cast<uint16_t>(At(bytes, chunk + 20, 2));
            wav.bits = static_cast<uint16_t>(At(bytes, chunk + 22, 2));
        } else if (id == "data") {
            EXPECT_EQ(chunk + 8 + size, bytes.size()) << "nothing follows the samples";
            for (size_t i = 0; i + 1 < size && chunk + 9 + i < bytes.size(); i += 2)
                wav.samples.push_back(static_cast<int16_t>(At(bytes, chunk + 8 + i, 2)));
        }
        chunk += 8 + size + (size & 1);
    }
    return wav;
}

// Fanfares may run to two seconds; every other effect is over well within one.
double LongestSeconds(const std::string& file)
{
    return file.find("koniec") != std::string::npos ? 2.0 : 0.95;
}

TEST(SoundFiles, EveryChannelHasAShortPcmFileWithHeadroom)
{
    for (const char* name : kr::kSoundFiles) {
        SCOPED_TRACE(name);
        const std::filesystem::path file = std::filesystem::path(KRUSZARKA_SOUND_FOLDER).parent_path() / name;
        ASSERT_TRUE(std::filesystem::is_regular_file(file));
        const Wav wav = Parse(ReadAll(file));
        EXPECT_EQ(wav.format, 1) << "PCM";
        EXPECT_EQ(wav.channels, 1);
        EXPECT_EQ(wav.rate, 44100u);
        EXPECT_EQ(wav.bits, 16);
        EXPECT_EQ(wav.blockAlign, 2);
        EXPECT_EQ(wav.byteRate, wav.rate * wav.blockAlign);
        EXPECT_GE(wav.Seconds(), 0.2);
        EXPECT_LE(wav.Seconds(), LongestSeconds(name));
        // Two sounds at once must not clip.
        EXPECT_LE(wav.PeakDbfs(), -6.0);
        EXPECT_GE(wav.PeakDbfs(), -9.0) << "and none is too quiet beside the others";
        EXPECT_EQ(wav.samples.front(), 0) << "no click at the start";
        EXPECT_EQ(wav.samples.back(), 0) << "nor at the end";
    }
}

TEST(SoundFiles, TheMakerWritesTheSameBytesEveryTime)
{
    const std::filesystem::path again =
        std::filesystem::temp_directory_path() / ("kruszarka-sounds-" + std::to_string(::getpid()));
    const std::string command = std::string(KRUSZARKA_SOUND_MAKER) + " " + again.string();
    ASSERT_EQ(std::system(command.c_str()), 0);
    for (const auto& entry : std::filesystem::directory_iterator(KRUSZARKA_SOUND_FOLDER)) {
        SCOPED_TRACE(entry.path().filename().string());
        EXPECT_EQ(ReadAll(entry.path()), ReadAll(again / entry.path().filename()));
    }
    std::filesystem::remove_all(again);
}

}  // namespace
