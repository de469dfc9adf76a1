#pragma once
#include <cstddef>
#include <filesystem>
#include <string>

namespace kr::ui {

// Closes a file descriptor on every way out of the function that opened it.
class Descriptor {
public:
    explicit Descriptor(int fd = -1) : fd_(fd) {}
    ~Descriptor();
    Descriptor(Descriptor&& other) noexcept : fd_(other.Release()) {}
    Descriptor& operator=(Descriptor&& other) noexcept;
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;

    int get() const { return fd_; }
    bool valid() const { return fd_ >= 0; }
    // Hands the descriptor over to someone who closes it.
    int Release();
    // Closes now, so that a failed close can be told; returns errno or 0.
    int Close();

private:
    int fd_;
};

// A file of ours, or why not: every file the game reads may be hostile or broken.
struct FileRead {
    enum class Status { Read, Missing, Unreadable };
    Status status = Status::Missing;
    std::string bytes;   // the file's contents, when read
    std::string reason;  // why it could not be read, in the game's language
};

// Opens a regular file (or a link to one) for reading, never blocking: what lies at the name is looked at
// before it is opened, so a FIFO or a device is never opened at all, and again after, in case it was swapped.
// An invalid descriptor with `reason` set otherwise (empty reason: nothing lies at the name).
Descriptor OpenRegularFile(const std::filesystem::path& file, std::string& reason);

// The whole of a regular file of at most `limit` bytes.
FileRead ReadRegularFile(const std::filesystem::path& file, size_t limit);

// Writes all of `text`, going on after an interrupted or partial write; returns errno, or 0 when all was written.
int WriteAll(int fd, const std::string& text);

}  // namespace kr::ui
