#pragma once
#include <filesystem>
#include <optional>
#include <string>

namespace kr::ui {

// The folder a game started from the desktop menu keeps its progress in: $XDG_DATA_HOME/kruszarka, or
// $HOME/.local/share/kruszarka when that is unset, empty or relative; nothing when neither is usable.
std::optional<std::filesystem::path> UserFolder(const char* xdgDataHome, const char* home);

// Creates `folder` and its missing parents (mode 0700) and makes it the working folder. Refuses a folder
// that is a link, not a folder, or another user's. Returns why it failed, or an empty text.
std::string EnterFolder(const std::filesystem::path& folder);

}  // namespace kr::ui
