#include "ui/file_io.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <system_error>
#include <utility>

namespace kr::ui {
namespace {

constexpr const char* kNotRegular = "to nie jest zwykły plik";

std::string Reason(int error) { return std::system_category().message(error); }

}  // namespace

Descriptor::~Descriptor()
{
    if (fd_ >= 0) ::close(fd_);
}

Descriptor& Descriptor::operator=(Descriptor&& other) noexcept
{
    if (this != &other) {
        if (fd_ >= 0) ::close(fd_);
        fd_ = other.Release();
    }
    return *this;
}

int Descriptor::Release() { return std::exchange(fd_, -1); }

int Descriptor::Close()
{
    const int result = ::close(std::exchange(fd_, -1));
    return result == 0 ? 0 : errno;
}

Descriptor OpenRegularFile(const std::filesystem::path& file, std::string& reason)
{
    struct stat before {};
    if (::stat(file.c_str(), &before) != 0) {
        reason = errno == ENOENT ? "" : Reason(errno);
        return Descriptor{};
    }
    if (!S_ISREG(before.st_mode)) {
        reason = kNotRegular;
        return Descriptor{};
    }
    Descriptor fd{::open(file.c_str(), O_RDONLY | O_NONBLOCK | O_NOCTTY | O_CLOEXEC)};
    if (!fd.valid()) {
        reason = errno == ENOENT ? "" : Reason(errno);
        return fd;
    }
    struct stat opened {};
    if (::fstat(fd.get(), &opened) != 0) {
        reason = Reason(errno);
        return Descriptor{};
    }
    if (!S_ISREG(opened.st_mode)) {
        reason = kNotRegular;
        return Descriptor{};
    }
    return fd;
}

FileRead ReadRegularFile(const std::filesystem::path& file, size_t limit)
{
    FileRead result;
    const Descriptor fd = OpenRegularFile(file, result.reason);
    if (!fd.valid()) {
        result.status = result.reason.empty() ? FileRead::Status::Missing : FileRead::Status::Unreadable;
        return result;
    }
    // One byte past the limit tells a file that is too large from one that just fits.
    std::string bytes(limit + 1, '\0');
    size_t size = 0;
    while (size < bytes.size()) {
        const ssize_t n = ::read(fd.get(), bytes.data() + size, bytes.size() - size);
        if (n == 0) break;
        if (n > 0) {
            size += static_cast<size_t>(n);
        } else if (errno != EINTR) {
            return {FileRead::Status::Unreadable, {}, Reason(errno)};
        }
    }
    if (size > limit) return {FileRead::Status::Unreadable, {}, "plik jest za duży"};
    bytes.resize(size);
    return {FileRead::Status::Read, std::move(bytes), {}};
}

int WriteAll(int fd, const std::string& text)
{
    for (size_t done = 0; done < text.size();) {
        const ssize_t n = ::write(fd, text.data() + done, text.size() - done);
        if (n > 0) done += static_cast<size_t>(n);
        else if (n == 0) return EIO;
        else if (errno != EINTR) return errno;
    }
    return 0;
}

}  // namespace kr::ui
