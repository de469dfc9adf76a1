#include "ui/sdl/sound_file.h"

#include <SDL.h>

#include <algorithm>
#include <cstring>
#include <memory>

#include "ui/file_io.h"
#include "ui/sdl/voices.h"

namespace kr::sdl {
namespace {

// Far more than any effect needs (ten seconds of CD-quality stereo), far less than would hurt.
constexpr size_t kLargestFile = 2 * 1024 * 1024;

}  // namespace

std::vector<float> LoadSound(const std::filesystem::path& file, std::string& problem)
{
    const ui::FileRead read = ui::ReadRegularFile(file, kLargestFile);
    if (read.status != ui::FileRead::Status::Read) {
        problem = read.status == ui::FileRead::Status::Missing ? "brak pliku" : read.reason;
        return {};
    }
    const std::string& bytes = read.bytes;

    SDL_AudioSpec spec{};
    Uint8* buffer = nullptr;
    Uint32 length = 0;
    SDL_RWops* stream = SDL_RWFromConstMem(bytes.data(), static_cast<int>(bytes.size()));
    if (!SDL_LoadWAV_RW(stream, 1, &spec, &buffer, &length)) {
        problem = SDL_GetError();
        return {};
    }
    const std::unique_ptr<Uint8, decltype(&SDL_FreeWAV)> decoded(buffer, SDL_FreeWAV);

    // Converted in one piece: SDL's streaming resampler drops the tail of a buffer it is flushed with.
    SDL_AudioCVT convert{};
    if (SDL_BuildAudioCVT(&convert, spec.format, spec.channels, spec.freq, AUDIO_F32SYS, 1, Voices::kRate) < 0) {
        problem = SDL_GetError();
        return {};
    }
    std::vector<Uint8> work(static_cast<size_t>(length) * static_cast<size_t>(std::max(convert.len_mult, 1)));
    std::memcpy(work.data(), buffer, length);
    convert.buf = work.data();
    convert.len = static_cast<int>(length);
    if (SDL_ConvertAudio(&convert) != 0) {
        problem = SDL_GetError();
        return {};
    }
    std::vector<float> samples(static_cast<size_t>(convert.len_cvt) / sizeof(float));
    std::memcpy(samples.data(), work.data(), samples.size() * sizeof(float));
    if (samples.empty()) problem = "no samples";
    return samples;
}

}  // namespace kr::sdl
