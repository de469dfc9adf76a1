#include "shell/progress.h"

#include <fcntl.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <charconv>
#include <fstream>
#include <sstream>
#include <system_error>

#include "shell/game.h"

namespace kr {
namespace {

std::array<int16_t*, 8> Fields(Progress& p)
{
    return {&p.UnlockedMissions, &p.SoundOn, &p.Strength, &p.Intelligence, &p.Dexterity, &p.Endurance, &p.Accuracy,
            &p.TutorialOn};
}

bool IsBlank(char c) { return c == ' ' || c == '\t' || c == '\r' || c == '\n'; }
bool EndsField(char c) { return c == ' ' || c == ',' || c == '\r' || c == '\n'; }

std::optional<int16_t> ParseField(std::string_view text)
{
    if (!text.empty() && text.front() == '+') text.remove_prefix(1);
    int16_t value = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    if (error != std::errc() || end != text.data() + text.size() || text.empty()) return std::nullopt;
    return value;
}

Progress FromGame(const Game& g)
{
    return {g.UnlockedMissions, g.SoundOn, g.Strength, g.Intelligence, g.Dexterity, g.Endurance, g.Accuracy,
            g.TutorialOn};
}

int16_t Clamp(int16_t value, int16_t low, int16_t high) { return std::clamp(value, low, high); }
int16_t Switch(int16_t value) { return value == 1 ? int16_t{1} : int16_t{0}; }

}  // namespace

int ParseProgress(std::string_view text, Progress& into)
{
    size_t at = 0;
    int read = 0;
    for (int16_t* field : Fields(into)) {
        while (at < text.size() && IsBlank(text[at])) ++at;
        if (at >= text.size()) break;
        const size_t start = at;
        while (at < text.size() && !EndsField(text[at])) ++at;
        const std::optional<int16_t> value = ParseField(text.substr(start, at - start));
        if (!value) break;
        *field = *value;
        ++read;
        // A comma closes the field; trailing spaces before it belong to the same separator.
        size_t next = at;
        while (next < text.size() && text[next] == ' ') ++next;
        if (next < text.size() && text[next] == ',') at = next + 1;
    }
    return read;
}

std::string FormatProgress(const Progress& progress)
{
    Progress copy = progress;
    std::string text;
    for (const int16_t* field : Fields(copy)) {
        const int value = *field;
        text += value < 0 ? "-" : " ";
        text += std::to_string(value < 0 ? -value : value);
        text += " \r\n";
    }
    return text;
}

bool LoadProgress(Game& g)
{
    Progress p = FromGame(g);
    int read = 0;
    if (std::ifstream file{g.progressFile, std::ios::binary}) {
        std::ostringstream text;
        text << file.rdbuf();
        read = ParseProgress(text.str(), p);
    }
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

namespace {

// Writes the whole text and forces it to the disk, so that the rename that follows can never expose an
// empty or partial file, even after a power cut.
bool WriteDurably(const std::filesystem::path& file, const std::string& text)
{
    const int fd = ::open(file.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0644);
    if (fd < 0) return false;
    bool written = true;
    for (size_t done = 0; written && done < text.size();) {
        const ssize_t n = ::write(fd, text.data() + done, text.size() - done);
        if (n > 0) done += static_cast<size_t>(n);
        else written = n < 0 && errno == EINTR;
    }
    written = written && ::fsync(fd) == 0;
    return ::close(fd) == 0 && written;
}

}  // namespace

void SaveProgress(Game& g)
{
    std::filesystem::path temporary = g.progressFile;
    temporary += ".tmp";
    std::error_code error;
    if (!WriteDurably(temporary, FormatProgress(FromGame(g)))) {
        std::filesystem::remove(temporary, error);
        return;
    }
    std::filesystem::rename(temporary, g.progressFile, error);
    if (error) std::filesystem::remove(temporary, error);
}

}  // namespace kr
