#include "tools/record_file.h"

#include <fcntl.h>

#include <cerrno>
#include <cstring>
#include <iostream>
#include <memory>

#include "ui/file_io.h"

namespace kr::record {
namespace {

// The recording as the game goes: each line reaches the system at once, so a crash keeps everything up to it;
// a failed write is told once and ends the recording.
class RecordingDescriptor {
public:
    RecordingDescriptor(int fd, std::filesystem::path file) : fd_(fd), file_(std::move(file)) {}

    void Write(const std::string& text)
    {
        if (!fd_.valid()) return;
        if (const int error = ui::WriteAll(fd_.get(), text); error != 0) {
            std::cerr << "kruszarka: the recording stopped, " << file_.string() << ": " << std::strerror(error) << '\n';
            fd_ = ui::Descriptor{};
        }
    }

private:
    ui::Descriptor fd_;
    std::filesystem::path file_;
};

}  // namespace

std::optional<Recorder::Sink> RecordingFile(const std::filesystem::path& file, std::string& error)
{
    // O_EXCL fails on any existing name, a dangling link included, so nothing of the player's is overwritten.
    const int fd = ::open(file.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC, 0644);
    if (fd < 0) {
        error = file.string() + ": " + (errno == EEXIST ? "already exists, choose a new name" : std::strerror(errno));
        return std::nullopt;
    }
    auto descriptor = std::make_shared<RecordingDescriptor>(fd, file);
    return [descriptor](const std::string& text) { descriptor->Write(text); };
}

}  // namespace kr::record
