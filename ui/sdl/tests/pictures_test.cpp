#include <gtest/gtest.h>
#include <sys/stat.h>

#include <filesystem>
#include <fstream>
#include <sstream>

#include "ui/sdl/pictures.h"
#include "ui/sdl/tests/offscreen.h"

namespace kr::sdl {
namespace {

namespace fs = std::filesystem;
using testing::OffscreenVideo;
using testing::SourceAssets;

// An assets folder of our own, where the test plants what it likes in place of the pictures.
class PlantedAssets {
public:
    PlantedAssets() : folder_(fs::temp_directory_path() / ("kruszarka-pictures-" + std::to_string(::getpid())))
    {
        fs::create_directories(folder_ / "assets/pictures");
    }
    ~PlantedAssets()
    {
        std::error_code ignored;
        fs::remove_all(folder_, ignored);
    }
    fs::path Picture(const char* stem) const { return folder_ / "assets/pictures" / (std::string(stem) + ".svg"); }
    Assets assets() const { return Assets(folder_); }

private:
    fs::path folder_;
};

// What the pictures report on stderr while `draw` runs.
template <typename Draw>
std::string Reported(Draw draw)
{
    std::ostringstream captured;
    std::streambuf* const previous = std::cerr.rdbuf(captured.rdbuf());
    draw();
    std::cerr.rdbuf(previous);
    return captured.str();
}

TEST(Pictures, OnlyRegularFilesAreDrawnAndAnythingElseIsReportedOnceLikeAMissingFile)
{
    const OffscreenVideo video;
    const PlantedAssets planted;
    fs::create_directory(planted.Picture("hero"));
    ASSERT_EQ(::mkfifo(planted.Picture("icon").c_str(), 0644), 0);
    fs::create_symlink(fs::absolute(SourceAssets().Picture("object-0")), planted.Picture("object-0"));
    std::ofstream(planted.Picture("object-1")) << "not a picture at all";
    const Assets assets = planted.assets();

    const std::string first = Reported([&] {
        EXPECT_EQ(RasterisePicture(assets, {ui::PictureSet::Hero, 0}, 1), nullptr);
        EXPECT_EQ(RasterisePicture(assets, {ui::PictureSet::WindowIcon, 0}, 2), nullptr);
        EXPECT_NE(RasterisePicture(assets, {ui::PictureSet::Object, 0}, 1), nullptr) << "a link to a picture is drawn";
        EXPECT_EQ(RasterisePicture(assets, {ui::PictureSet::Object, 1}, 1), nullptr);
    });
    const std::string refused = "Kruszarka: cannot draw " + planted.Picture("hero").string() + ": to nie jest zwykły plik\n" +
                                "Kruszarka: cannot draw " + planted.Picture("icon").string() + ": to nie jest zwykły plik\n";
    EXPECT_EQ(first.substr(0, refused.size()), refused);
    EXPECT_EQ(first.substr(refused.size()).rfind("Kruszarka: cannot draw " + planted.Picture("object-1").string() + ": ", 0), 0u)
        << first;
    const std::string again = Reported([&] { EXPECT_EQ(RasterisePicture(assets, {ui::PictureSet::Hero, 0}, 1), nullptr); });
    EXPECT_EQ(again, "");
}

}  // namespace
}  // namespace kr::sdl
