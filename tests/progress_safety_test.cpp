#include <gtest/gtest.h>
#include <signal.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <filesystem>
#include <random>

#include "shell/progress.h"
#include "tests/session.h"

namespace kr {
namespace {

namespace fs = std::filesystem;
using testing::ReadFile;
using testing::Session;
using testing::TempFolder;
using testing::WriteFile;

const std::string kSaved = " 5 \r\n 1 \r\n 1 \r\n 0 \r\n 2 \r\n 0 \r\n 1 \r\n 0 \r\n";
const std::string kSavedWithSoundOff = " 5 \r\n 0 \r\n 1 \r\n 0 \r\n 2 \r\n 0 \r\n 1 \r\n 0 \r\n";
const std::string kFreshWithSoundOn = " 1 \r\n 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n";

std::string Unreadable(const std::string& why)
{
    return "message: Nie można odczytać pliku konfiguracyjnego config.cfg: " + why +
           ".\nGra zaczyna od pierwszej misji; przed następnym zapisem ten plik zostanie zachowany jako config.cfg.bak.\n";
}

void MakeFifo(const fs::path& at) { ASSERT_EQ(::mkfifo(at.c_str(), 0644), 0); }

// The switch the options screen saves, turned over and saved.
void ToggleSoundAndSave(Session& s)
{
    s.Click("\"Opcje\"");
    s.Click("Check1");
    s.Click("\"Powrót\"");
}

TEST(HostileProgressFile, OnlyABoundedRegularFileIsReadAndStartUpNeverBlocks)
{
    for (const char* device : {"/dev/zero", "/dev/urandom"}) {
        Session s(3, [&](const TempFolder& f) { fs::create_symlink(device, f.File("config.cfg")); });
        EXPECT_EQ(s.TakeOutput(), Unreadable("to nie jest zwykły plik")) << device;
        EXPECT_EQ(s.game.UnlockedMissions, 1);
    }
    Session fifo(3, [](const TempFolder& f) { MakeFifo(f.File("config.cfg")); });
    EXPECT_EQ(fifo.TakeOutput(), Unreadable("to nie jest zwykły plik"));
    Session folder(3, [](const TempFolder& f) { fs::create_directory(f.File("config.cfg")); });
    EXPECT_EQ(folder.TakeOutput(), Unreadable("to nie jest zwykły plik"));

    // Digits that go on and on: the file's first line would read, but no progress file is this long.
    Session huge(3, [](const TempFolder& f) { WriteFile(f.File("config.cfg"), kSaved + std::string(5000, ' ')); });
    EXPECT_EQ(huge.TakeOutput(), Unreadable("plik jest za duży"));
    Session justFits(3, [](const TempFolder& f) { WriteFile(f.File("config.cfg"), kSaved + std::string(4096 - 48, ' ')); });
    EXPECT_EQ(justFits.TakeOutput(), "");

    Session linked(3, [](const TempFolder& f) {
        WriteFile(f.File("elsewhere.cfg"), kSaved);
        fs::create_symlink("elsewhere.cfg", f.File("config.cfg"));
    });
    EXPECT_EQ(linked.TakeOutput(), "") << "a link to a regular file is read";
    EXPECT_EQ(linked.game.UnlockedMissions, 5);
    EXPECT_EQ(linked.game.Dexterity, 2);
}

TEST(HostileProgressFile, WhatCouldNotBeReadIsMovedAsideBeforeTheFirstSaveNeverOverAnotherBackup)
{
    Session s(3, [](const TempFolder& f) {
        fs::create_directories(f.File("config.cfg") / "precious");
        WriteFile(f.File("config.cfg.bak"), "an older backup");
    });
    EXPECT_EQ(s.TakeOutput(), Unreadable("to nie jest zwykły plik"));
    ToggleSoundAndSave(s);
    EXPECT_EQ(s.TakeOutput(), "");
    EXPECT_EQ(ReadFile(s.folder().File("config.cfg")), kFreshWithSoundOn);
    EXPECT_EQ(ReadFile(s.folder().File("config.cfg.bak")), "an older backup");
    EXPECT_TRUE(fs::is_directory(s.folder().File("config.cfg.bak.1") / "precious"));
    ToggleSoundAndSave(s);
    EXPECT_FALSE(fs::exists(s.folder().File("config.cfg.bak.2"))) << "only the unreadable file is moved aside";

    Session full(3, [](const TempFolder& f) {
        MakeFifo(f.File("config.cfg"));
        WriteFile(f.File("config.cfg.bak"), "0");
        for (int n = 1; n < 10; ++n) WriteFile(f.File(("config.cfg.bak." + std::to_string(n)).c_str()), std::to_string(n));
    });
    full.TakeOutput();
    ToggleSoundAndSave(full);
    EXPECT_EQ(full.TakeOutput(),
              "message: Nie udało się zapisać postępów gry: nie można przenieść nieczytelnego pliku config.cfg na bok "
              "(File exists)\n");
    EXPECT_TRUE(fs::is_fifo(full.folder().File("config.cfg"))) << "nothing is overwritten when no name is free";
    EXPECT_EQ(ReadFile(full.folder().File("config.cfg.bak.9")), "9");
}

TEST(HostileProgressFile, ASaveNeverFollowsNorWaitsOnWhatIsPlantedAtTheTemporaryName)
{
    Session s(3, kSaved);
    const fs::path planted = s.folder().File("config.cfg.tmp");
    const fs::path victim = s.folder().File("victim.txt");
    WriteFile(victim, "the player's other file");
    fs::create_symlink(victim, planted);
    ToggleSoundAndSave(s);
    EXPECT_EQ(s.TakeOutput(), "");
    EXPECT_EQ(ReadFile(victim), "the player's other file");
    EXPECT_FALSE(fs::is_symlink(s.folder().File("config.cfg")));
    EXPECT_EQ(ReadFile(s.folder().File("config.cfg")), kSavedWithSoundOff);

    fs::remove(planted);
    MakeFifo(planted);
    ToggleSoundAndSave(s);
    EXPECT_EQ(ReadFile(s.folder().File("config.cfg")), kSaved);
    EXPECT_TRUE(fs::is_fifo(planted));
}

TEST(HostileProgressFile, ASaveKilledAtAnyMomentLeavesTheOldOrTheNewFileWhole)
{
    Session s(3, kSaved);
    const fs::path file = s.folder().File("config.cfg");
    std::mt19937 random(2026);
    int sawNew = 0;
    for (int round = 0; round < 60; ++round) {
        const pid_t saver = ::fork();
        ASSERT_GE(saver, 0);
        if (saver == 0) {
            for (;;) {
                s.game.SoundOn = s.game.SoundOn == 1 ? 0 : 1;
                SaveProgress(s.game);
            }
        }
        ::usleep(static_cast<useconds_t>(random() % 8000));
        ::kill(saver, SIGKILL);
        int status = 0;
        ASSERT_EQ(::waitpid(saver, &status, 0), saver);
        const std::string now = ReadFile(file);
        ASSERT_TRUE(now == kSaved || now == kSavedWithSoundOff) << "round " << round << ": \"" << now << "\"";
        if (now == kSavedWithSoundOff) ++sawNew;
    }
    EXPECT_GT(sawNew, 0) << "the killed savers never got a save through";
    ToggleSoundAndSave(s);
    EXPECT_EQ(s.TakeOutput(), "") << "temporary files left by killed saves do not block saving";
    EXPECT_EQ(ReadFile(file), kSavedWithSoundOff);
}

}  // namespace
}  // namespace kr
