#pragma once
#include <filesystem>
#include <string_view>
#include <vector>

namespace kr::sdl {

// Where the game's own files lie: beside the executable (the build folder), then the data folder of an
// install. Never the working folder: whatever lies where the game was started is not ours to load.
class Assets {
public:
    // Looks in each folder in turn.
    explicit Assets(std::vector<std::filesystem::path> folders);
    explicit Assets(std::filesystem::path folder);
    // The executable's folder, as SDL reports it, and the install's data folder found from there, so a
    // moved install still finds its files.
    static Assets BesideExecutable();

    // folder/relative for the first folder that holds it as a regular file; under the first folder when
    // none does, so a report names the place it was expected.
    std::filesystem::path Resolve(std::string_view relative) const;
    std::filesystem::path Picture(std::string_view stem) const;

private:
    std::vector<std::filesystem::path> folders_;
};

}  // namespace kr::sdl
