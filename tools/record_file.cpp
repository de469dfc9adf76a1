#include "tools/record_file.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <iostream>
#include <memory>

namespace kr::record {
namespace {

class Descriptor {
public:
    Descriptor(int fd, std::filesystem::path file) : fd_(fd), file_(std::move(file)) {}
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;
    ~Descriptor()
    {
        if (fd_ >= 0) ::close(fd_);
    }

    void Write(const std::string& text)
    {
        for (size_t done = 0; fd_ >= 0 && done < text.size();) {
            const ssize_t n = ::write(fd_, text.data() + done, text.size() - done);
            if (n > 0) {
                done += static_cast<size_t>(n);
            } else if (n == 0 || errno != EINTR) {
                std::cerr << "kruszarka: the recording stopped, " << file_.string() << ": "
                          << (n == 0 ? "nothing written" : std::strerror(errno)) << '\n';
                ::close(fd_);
                fd_ = -1;
            }
        }
    }

private:
    int fd_;
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
    auto descriptor = std::make_shared<Descriptor>(fd, file);
    return [descriptor](const std::string& text) { descriptor->Write(text); };
}

}  // namespace kr::record
