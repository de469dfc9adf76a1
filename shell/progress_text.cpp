#include "shell/progress_text.h"

#include <array>
#include <charconv>
#include <optional>

namespace kr {
namespace {

std::array<int16_t*, 8> Fields(Progress& p)
{
    return {&p.UnlockedMissions, &p.SoundOn, &p.Strength, &p.Intelligence, &p.Dexterity, &p.Endurance, &p.Accuracy,
            &p.TutorialOn};
}

bool IsBlank(char c) { return c == ' ' || c == '\t' || c == '\r' || c == '\n'; }
bool EndsField(char c) { return c == ' ' || c == ',' || c == '\r' || c == '\n'; }
bool IsDigit(char c) { return c >= '0' && c <= '9'; }

// One optional sign character, then nothing but digits.
std::optional<int16_t> ParseField(std::string_view text)
{
    const bool negative = !text.empty() && text.front() == '-';
    if (!text.empty() && (text.front() == '+' || negative)) text.remove_prefix(1);
    if (text.empty() || !IsDigit(text.front())) return std::nullopt;
    int32_t magnitude = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), magnitude);
    if (error != std::errc() || end != text.data() + text.size()) return std::nullopt;
    const int32_t value = negative ? -magnitude : magnitude;
    if (value < INT16_MIN || value > INT16_MAX) return std::nullopt;
    return static_cast<int16_t>(value);
}

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

}  // namespace kr
