#include "shell/progress_file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <chrono>
#include <cstdio>
#include <system_error>

namespace kr {
namespace {

std::string Reason(int error) { return std::system_category().message(error); }


// A name no one has used: a planted file or link at a guessable name can neither be followed nor block saving.
std::filesystem::path FreshTemporaryName(const std::filesystem::path& file)
{
    static unsigned counter = 0;
    const auto now = std::chrono::steady_clock::now().time_since_epoch().count();
    std::filesystem::path name = file;
    name += ".tmp-" + std::to_string(::getpid()) + "-" + std::to_string(counter++) + "-" +
            std::to_string(static_cast<unsigned long long>(now) % 1000000007ULL);
    return name;
}

// Makes the rename itself durable; a folder that cannot be synced still holds the renamed file.
void SyncFolder(const std::filesystem::path& file)
{
    const std::filesystem::path folder = file.has_parent_path() ? file.parent_path() : ".";
    const ui::Descriptor fd{::open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC)};
    if (fd.get() >= 0) ::fsync(fd.get());
}

// rename() that fails with EEXIST instead of replacing what lies at `to`.
int RenameNoReplace(const std::filesystem::path& from, const std::filesystem::path& to)
{
    if (::renameat2(AT_FDCWD, from.c_str(), AT_FDCWD, to.c_str(), RENAME_NOREPLACE) == 0) return 0;
    if (errno != EINVAL) return errno;
    // A file system without the flag: check, then rename; a race here can only lose a name, not a file's bytes.
    struct stat taken{};
    if (::lstat(to.c_str(), &taken) == 0) return EEXIST;
    return ::rename(from.c_str(), to.c_str()) == 0 ? 0 : errno;
}

}  // namespace

ui::FileRead ReadProgressFile(const std::filesystem::path& file) { return ui::ReadRegularFile(file, kProgressFileLimit); }

std::string ReplaceProgressFile(const std::filesystem::path& file, const std::string& text)
{
    std::filesystem::path temporary;
    int fd = -1;
    for (int attempt = 0; fd < 0 && attempt < 100; ++attempt) {
        temporary = FreshTemporaryName(file);
        fd = ::open(temporary.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC, 0644);
        if (fd < 0 && errno != EEXIST) return Reason(errno);
    }
    if (fd < 0) return Reason(EEXIST);

    ui::Descriptor out{fd};
    int error = ui::WriteAll(out.get(), text);
    // On the disk before the rename, so a power cut can never expose an empty or partial file.
    if (error == 0 && ::fsync(out.get()) != 0) error = errno;
    const int closeError = out.Close();
    if (error == 0) error = closeError;
    if (error == 0 && ::rename(temporary.c_str(), file.c_str()) != 0) error = errno;
    if (error != 0) {
        ::unlink(temporary.c_str());
        return Reason(error);
    }
    SyncFolder(file);
    return {};
}

MovedAside MoveAside(const std::filesystem::path& file)
{
    MovedAside result;
    for (int number = 0; number < 10; ++number) {
        std::filesystem::path to = file;
        to += number == 0 ? std::string(".bak") : ".bak." + std::to_string(number);
        const int error = RenameNoReplace(file, to);
        if (error == 0) {
            result.to = to;
            return result;
        }
        if (error == ENOENT) return result;
        if (error != EEXIST) {
            result.error = Reason(error);
            return result;
        }
    }
    result.error = Reason(EEXIST);
    return result;
}

}  // namespace kr
