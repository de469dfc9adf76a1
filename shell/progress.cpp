#include "shell/progress.h"

#include <algorithm>

#include "shell/game.h"
#include "shell/progress_file.h"
#include "shell/texts.h"

namespace kr {
namespace {

const std::string kSaveFailed = "Nie udało się zapisać postępów gry: ";

Progress FromGame(const Game& g)
{
    return {g.UnlockedMissions, g.SoundOn, g.Strength, g.Intelligence, g.Dexterity, g.Endurance, g.Accuracy,
            g.TutorialOn};
}

int16_t Clamp(int16_t value, int16_t low, int16_t high) { return std::clamp(value, low, high); }
int16_t Switch(int16_t value) { return value == 1 ? int16_t{1} : int16_t{0}; }

std::string FileName(const Game& g) { return g.progressFile.filename().string(); }

}  // namespace

bool LoadProgress(Game& g)
{
    Progress p = FromGame(g);
    int read = 0;
    const ui::FileRead file = ReadProgressFile(g.progressFile);
    if (file.status == ui::FileRead::Status::Read) read = ParseProgress(file.bytes, p);
    if (file.status == ui::FileRead::Status::Unreadable) g.progressUnreadable = file.reason;
    const bool complete = read == 8;
    if (!complete) p.UnlockedMissions = 1;
    // Hand-edited files may hold anything: keep values where no later rule can overflow or lock up.
    g.UnlockedMissions = Clamp(p.UnlockedMissions, 1, 11);
    g.SoundOn = Switch(p.SoundOn);
    g.Strength = Clamp(p.Strength, 0, 10);
    g.Intelligence = Clamp(p.Intelligence, 0, 10);
    g.Dexterity = Clamp(p.Dexterity, 0, 10);
    g.Endurance = Clamp(p.Endurance, 0, 10);
    g.Accuracy = Clamp(p.Accuracy, 0, 10);
    g.TutorialOn = Switch(p.TutorialOn);
    return complete;
}

std::string LoadFailureMessage(const Game& g)
{
    if (g.progressUnreadable.empty()) return kMissingProgressMessage;
    return "Nie można odczytać pliku konfiguracyjnego " + FileName(g) + ": " + g.progressUnreadable +
           ".\nGra zaczyna od pierwszej misji; przed następnym zapisem ten plik zostanie zachowany jako " + FileName(g) +
           ".bak.";
}

void SaveProgress(Game& g)
{
    if (!g.progressUnreadable.empty()) {
        // What could not be read may still be the player's: set it aside rather than write over it.
        const MovedAside moved = MoveAside(g.progressFile);
        if (!moved.error.empty()) {
            g.host.messages.ShowOk(kSaveFailed + "nie można przenieść nieczytelnego pliku " + FileName(g) + " na bok (" +
                                   moved.error + ")");
            return;
        }
        g.progressUnreadable.clear();
    }
    const std::string error = ReplaceProgressFile(g.progressFile, FormatProgress(FromGame(g)));
    if (!error.empty()) g.host.messages.ShowOk(kSaveFailed + error);
}

}  // namespace kr
