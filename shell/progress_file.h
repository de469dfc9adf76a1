#pragma once
#include <cstddef>
#include <filesystem>
#include <string>

#include "ui/file_io.h"

namespace kr {

// The progress file holds eight short numbers: anything longer is not ours.
inline constexpr size_t kProgressFileLimit = 4096;

// Reads a regular file (or a link to one) of at most kProgressFileLimit bytes, never blocking on open.
ui::FileRead ReadProgressFile(const std::filesystem::path& file);

// Writes `text` to a new file of a fresh name beside `file`, forces it to the disk and renames it over `file`.
// Returns the system's reason on failure, an empty string on success; `file` is untouched on failure.
std::string ReplaceProgressFile(const std::filesystem::path& file, const std::string& text);

struct MovedAside {
    std::filesystem::path to;  // empty when nothing lay at the name
    std::string error;         // empty on success
};

// Renames whatever lies at `file` to file.bak, or to the first free of file.bak.1 .. file.bak.9; never
// replaces anything that is already there.
MovedAside MoveAside(const std::filesystem::path& file);

}  // namespace kr
