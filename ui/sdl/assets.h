#pragma once
#include <filesystem>
#include <string_view>

namespace kr::sdl {

// Where the game's own files lie: first the folder of the executable, then the working directory,
// so the game runs from its build folder, from an installed folder and from a copy of the sources.
class Assets {
public:
    explicit Assets(std::filesystem::path folder);
    // The executable's folder, as SDL reports it.
    static Assets BesideExecutable();

    // The first existing of folder/relative and ./relative; folder/relative when neither exists.
    std::filesystem::path Resolve(std::string_view relative) const;
    std::filesystem::path Picture(std::string_view stem) const;

    const std::filesystem::path& Folder() const { return folder_; }

private:
    std::filesystem::path folder_;
};

}  // namespace kr::sdl
