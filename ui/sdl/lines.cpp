#include "ui/sdl/lines.h"

namespace kr::sdl {
namespace {

std::string_view TrimTrailingSpaces(std::string_view text)
{
    while (!text.empty() && text.back() == ' ') text.remove_suffix(1);
    return text;
}

void Wrap(std::string_view paragraph, int wrapWidth, const Measure& measure, std::vector<std::string>& lines)
{
    while (!paragraph.empty()) {
        if (measure(paragraph) <= wrapWidth) {
            lines.emplace_back(paragraph);
            return;
        }
        // The longest run of whole words that fits; at least one word.
        size_t cut = std::string_view::npos;
        for (size_t space = paragraph.find(' '); space != std::string_view::npos;
             space = paragraph.find(' ', space + 1)) {
            const std::string_view head = TrimTrailingSpaces(paragraph.substr(0, space));
            if (head.empty()) continue;
            if (measure(head) > wrapWidth) break;
            cut = space;
        }
        if (cut == std::string_view::npos) {
            const size_t wordEnd = paragraph.find(' ', paragraph.find_first_not_of(' '));
            cut = wordEnd == std::string_view::npos ? paragraph.size() : wordEnd;
        }
        lines.emplace_back(TrimTrailingSpaces(paragraph.substr(0, cut)));
        const size_t next = paragraph.find_first_not_of(' ', cut);
        paragraph = next == std::string_view::npos ? std::string_view{} : paragraph.substr(next);
    }
}

}  // namespace

std::vector<std::string> SplitLines(std::string_view text, int wrapWidth, const Measure& measure)
{
    std::vector<std::string> lines;
    size_t start = 0;
    while (true) {
        const size_t end = text.find_first_of("\r\n", start);
        const std::string_view paragraph = text.substr(start, end == std::string_view::npos ? end : end - start);
        if (wrapWidth > 0 && !paragraph.empty()) Wrap(paragraph, wrapWidth, measure, lines);
        else lines.emplace_back(paragraph);
        if (end == std::string_view::npos) break;
        start = end + 1;
        if (text[end] == '\r' && start < text.size() && text[start] == '\n') ++start;
    }
    return lines;
}

}  // namespace kr::sdl
