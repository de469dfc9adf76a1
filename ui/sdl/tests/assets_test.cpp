#include <gtest/gtest.h>

#include <unistd.h>

#include <fstream>

#include "ui/sdl/assets.h"

namespace kr::sdl {
namespace {

using Path = std::filesystem::path;

// The build folder's files win over an install's; the install fills in what the build folder lacks; a
// folder under a file's name does not count as the file.
TEST(Assets, TakesEachFileFromTheFirstFolderHoldingIt)
{
    const Path root = std::filesystem::temp_directory_path() / ("kruszarka-assets-" + std::to_string(::getpid()));
    const Path build = root / "build";
    const Path data = root / "share" / "kruszarka";
    for (const Path& file : {build / "assets/pictures/hero.svg", data / "assets/pictures/hero.svg",
                             data / "assets/pictures/icon.svg", data / "dzwieki/bum.wav"}) {
        std::filesystem::create_directories(file.parent_path());
        std::ofstream(file) << "x";
    }
    std::filesystem::create_directories(build / "dzwieki" / "bum.wav");
    const Assets assets({build, data});

    EXPECT_EQ(assets.Picture("hero"), build / "assets/pictures/hero.svg");
    EXPECT_EQ(assets.Picture("icon"), data / "assets/pictures/icon.svg");
    EXPECT_EQ(assets.Resolve("dzwieki/bum.wav"), data / "dzwieki/bum.wav");
    EXPECT_EQ(assets.Resolve("dzwieki/start.wav"), build / "dzwieki/start.wav") << "a report names the first place";
    std::filesystem::remove_all(root);
}

}  // namespace
}  // namespace kr::sdl
