#include "ui/sdl/sound_file.h"

#include <SDL.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <memory>

#include "ui/sdl/voices.h"

namespace kr::sdl {
namespace {

// Far more than any effect needs (ten seconds of CD-quality stereo), far less than would hurt.
constexpr off_t kLargestFile = 2 * 1024 * 1024;

class FileDescriptor {
public:
    explicit FileDescriptor(int fd) : fd_(fd) {}
    ~FileDescriptor()
    {
        if (fd_ >= 0) ::close(fd_);
    }
    FileDescriptor(const FileDescriptor&) = delete;
    FileDescriptor& operator=(const FileDescriptor&) = delete;
    int get() const { return fd_; }

private:
    int fd_;
};

// The whole file, or empty with `problem` set.
std::string ReadRegularFile(const std::filesystem::path& file, std::string& problem)
{
    const FileDescriptor fd(::open(file.c_str(), O_RDONLY | O_NONBLOCK | O_NOCTTY | O_CLOEXEC));
    struct stat info {};
    if (fd.get() < 0 || ::fstat(fd.get(), &info) != 0) {
        problem = std::strerror(errno);
        return {};
    }
    if (!S_ISREG(info.st_mode)) problem = "not a regular file";
    else if (info.st_size > kLargestFile) problem = "too large";
    if (!problem.empty()) return {};
    std::string bytes(static_cast<size_t>(info.st_size), '\0');
    size_t done = 0;
    while (done < bytes.size()) {
        const ssize_t got = ::read(fd.get(), bytes.data() + done, bytes.size() - done);
        if (got < 0 && errno == EINTR) continue;
        if (got < 0) {
            problem = std::strerror(errno);
            return {};
        }
        if (got == 0) break;
        done += static_cast<size_t>(got);
    }
    bytes.resize(done);
    return bytes;
}

}  // namespace

std::vector<float> LoadSound(const std::filesystem::path& file, std::string& problem)
{
    const std::string bytes = ReadRegularFile(file, problem);
    if (!problem.empty()) return {};

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
