#include "ui/user_folder.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>

#include "ui/file_io.h"

namespace kr::ui {
namespace {

std::optional<std::filesystem::path> Absolute(const char* text)
{
    if (!text || !*text) return std::nullopt;
    std::filesystem::path path(text);
    if (!path.is_absolute()) return std::nullopt;
    return path;
}

std::string Failure(const std::filesystem::path& folder, int error)
{
    return folder.string() + ": " + std::strerror(error);
}

}  // namespace

std::optional<std::filesystem::path> UserFolder(const char* xdgDataHome, const char* home)
{
    if (const auto data = Absolute(xdgDataHome)) return *data / "kruszarka";
    if (const auto user = Absolute(home)) return *user / ".local" / "share" / "kruszarka";
    return std::nullopt;
}

std::string EnterFolder(const std::filesystem::path& folder)
{
    std::filesystem::path made;
    for (const std::filesystem::path& part : folder.lexically_normal()) {
        made /= part;
        if (part.empty() || made == made.root_path()) continue;
        if (::mkdir(made.c_str(), 0700) != 0 && errno != EEXIST) return Failure(made, errno);
    }
    // The folder is opened without following a link and entered through that same handle, so what was
    // checked is what the game works in.
    const Descriptor handle{::open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC)};
    if (!handle.valid()) return Failure(folder, errno);
    struct stat status {};
    if (::fstat(handle.get(), &status) != 0) return Failure(folder, errno);
    if (status.st_uid != ::geteuid()) return folder.string() + ": należy do innego użytkownika";
    if (::fchdir(handle.get()) != 0) return Failure(folder, errno);
    return {};
}

}  // namespace kr::ui
