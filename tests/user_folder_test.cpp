#include <gtest/gtest.h>

#include <sys/stat.h>

#include <sstream>

#include "tests/session.h"
#include "tools/script.h"
#include "ui/user_folder.h"

namespace kr {
namespace {

using testing::ReadFile;
using testing::TempFolder;
using Path = std::filesystem::path;

TEST(UserFolder, FollowsXdgDataHomeElseHome)
{
    EXPECT_EQ(ui::UserFolder("/x/data", "/home/a"), Path("/x/data/kruszarka"));
    EXPECT_EQ(ui::UserFolder(nullptr, "/home/a"), Path("/home/a/.local/share/kruszarka"));
    EXPECT_EQ(ui::UserFolder("", "/home/a"), Path("/home/a/.local/share/kruszarka"));
    EXPECT_EQ(ui::UserFolder("data", "/home/a"), Path("/home/a/.local/share/kruszarka")) << "a relative one is ignored";
    EXPECT_FALSE(ui::UserFolder("data", "home"));
    EXPECT_FALSE(ui::UserFolder(nullptr, nullptr));
}

unsigned Mode(const Path& path)
{
    struct stat status {};
    ::lstat(path.c_str(), &status);
    return status.st_mode & 07777u;
}

// Each test may change the working folder; it is put back.
class EnterFolderTest : public ::testing::Test {
protected:
    void TearDown() override { std::filesystem::current_path(previous); }

    const Path previous = std::filesystem::current_path();
    TempFolder temp;
};

TEST_F(EnterFolderTest, MakesAPrivateFolderWhereTheGameThenKeepsItsProgress)
{
    const Path folder = temp.path() / "data" / "kruszarka";
    ASSERT_EQ(ui::EnterFolder(folder), "");
    EXPECT_TRUE(std::filesystem::equivalent(std::filesystem::current_path(), folder));
    EXPECT_EQ(Mode(folder), 0700u);
    EXPECT_EQ(Mode(temp.path() / "data"), 0700u);

    std::ostringstream out;
    script::ScriptRunner game(out, 7);
    std::istringstream player("answer ok\nstart\nclick \"Opcje\"\nclick \"Powrót\"\n");
    ASSERT_EQ(game.Run(player), 0) << out.str();
    EXPECT_EQ(ReadFile(folder / "config.cfg"), " 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n");

    // The next start enters the same folder and finds the progress kept.
    std::filesystem::current_path(previous);
    ASSERT_EQ(ui::EnterFolder(folder), "");
    EXPECT_TRUE(std::filesystem::exists("config.cfg"));
}

TEST_F(EnterFolderTest, RefusesALinkOrAFileAndStaysWhereItWas)
{
    const Path elsewhere = temp.path() / "elsewhere";
    std::filesystem::create_directory(elsewhere);
    std::filesystem::create_directory_symlink(elsewhere, temp.path() / "link");
    testing::WriteFile(temp.path() / "file", "x");
    std::filesystem::current_path(temp.path());

    for (const char* name : {"link", "file", "file/kruszarka"}) {
        EXPECT_NE(ui::EnterFolder(temp.path() / name), "") << name;
        EXPECT_TRUE(std::filesystem::equivalent(std::filesystem::current_path(), temp.path())) << name;
    }
    EXPECT_TRUE(std::filesystem::is_empty(elsewhere));
}

}  // namespace
}  // namespace kr
