#include "tools/script.h"

#include <charconv>
#include <sstream>
#include <vector>

#include "board/fill.h"
#include "board/grid.h"
#include "shell/startup.h"
#include "tools/variables.h"

namespace kr::script {
namespace {

std::string Trim(std::string_view text)
{
    const size_t first = text.find_first_not_of(" \t\r");
    if (first == std::string_view::npos) return {};
    const size_t last = text.find_last_not_of(" \t\r");
    return std::string(text.substr(first, last - first + 1));
}

// Splits off the first word; the rest keeps its inner spaces.
std::pair<std::string, std::string> Verb(const std::string& line)
{
    const size_t space = line.find_first_of(" \t");
    if (space == std::string::npos) return {line, {}};
    return {line.substr(0, space), Trim(line.substr(space))};
}

// The whole text as one number, or a ScriptError saying what it should have been.
template <typename Number>
Number Parse(const std::string& text, const char* expected)
{
    Number value{};
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    if (error != std::errc() || end != text.data() + text.size()) throw ScriptError(expected + (": " + text));
    return value;
}

int64_t ParseWhole(const std::string& text) { return Parse<int64_t>(text, "not a number"); }
float ParseTwips(const std::string& text) { return Parse<float>(text, "not a position"); }

std::string StripComment(const std::string& line)
{
    bool quoted = false;
    for (size_t i = 0; i < line.size(); ++i) {
        if (line[i] == '"') quoted = !quoted;
        if (line[i] == '#' && !quoted) return line.substr(0, i);
    }
    return line;
}

}  // namespace

ScriptRunner::ScriptRunner(std::ostream& out, uint32_t clockSeed, ScreenshotWriter screenshot,
                           std::filesystem::path progressFile)
    : out_(out), seed_(clockSeed), screenshot_(std::move(screenshot))
{
    messages_.onShown = [this](const std::string& text) { out_ << "message: " << text << '\n'; };
    game_ = std::make_unique<Game>(Host{messages_, sound_}, std::move(progressFile));
}

int ScriptRunner::Run(std::istream& in)
{
    std::string line;
    while (std::getline(in, line)) {
        ++lineNumber_;
        const std::string command = Trim(StripComment(line));
        if (command.empty()) continue;
        try {
            if (const std::optional<int> code = Execute(command, in)) return *code;
        } catch (const ScriptError& error) {
            out_ << "cannot understand line " << lineNumber_ << ": " << command << " (" << error.what() << ")\n";
            return 2;
        } catch (const std::out_of_range& error) {
            out_ << "cannot understand line " << lineNumber_ << ": " << command << " (" << error.what() << ")\n";
            return 2;
        }
        if (game_->quitRequested) return 0;
    }
    return 0;
}

std::optional<int> ScriptRunner::Execute(const std::string& line, std::istream& in)
{
    const auto [verb, rest] = Verb(line);
    Game& g = *game_;
    if (verb == "seed") {
        seed_ = static_cast<uint32_t>(ParseWhole(rest));
        g.random.Seed(seed_);
    } else if (verb == "start") {
        StartUp(g, seed_);
    } else if (verb == "answer") {
        if (rest == "ok") messages_.Queue(ui::ScriptedMessages::Answer::Ok);
        else if (rest == "yes") messages_.Queue(ui::ScriptedMessages::Answer::Yes);
        else if (rest == "no") messages_.Queue(ui::ScriptedMessages::Answer::No);
        else throw ScriptError("answer takes ok, yes or no");
    } else if (verb == "click" || verb == "press" || verb == "release" || verb == "move") {
        Deliver(verb, rest);
    } else if (verb == "key") {
        // "key 9 shift" is Shift+Tab.
        const auto [code, modifier] = Verb(rest);
        if (!modifier.empty() && modifier != "shift") throw ScriptError("key takes a code and optionally shift");
        g.form.KeyDown(static_cast<int>(ParseWhole(code)), !modifier.empty());
    } else if (verb == "wait") {
        const int64_t ms = ParseWhole(rest);
        if (ms < 0) throw ScriptError("wait takes a positive time");
        g.timers.Advance(ms);
    } else if (verb == "call") {
        std::istringstream words(rest);
        std::string name;
        words >> name;
        std::vector<int> args;
        for (std::string word; words >> word;) args.push_back(static_cast<int>(ParseWhole(word)));
        if (const std::optional<std::string> result = CallProcedure(g, name, args))
            out_ << name << " = " << *result << '\n';
    } else if (verb == "set") {
        const auto [name, value] = Verb(rest);
        WriteVariable(g, name, value);
    } else if (verb == "print") {
        out_ << rest << " = " << Print(rest) << '\n';
    } else if (verb == "expect") {
        const auto [name, expected] = Verb(rest);
        const std::string actual = Print(name);
        if (actual != expected) {
            out_ << "expect failed: line " << lineNumber_ << ": " << name << " = " << actual << ", expected "
                 << expected << '\n';
            return 1;
        }
    } else if (verb == "board") {
        SetBoard(in);
    } else if (verb == "dump") {
        Dump();
    } else if (verb == "sounds") {
        out_ << "sounds:";
        for (size_t i = soundsReported_; i < sound_.played.size(); ++i) out_ << ' ' << sound_.played[i];
        out_ << '\n';
        soundsReported_ = sound_.played.size();
    } else if (verb == "screenshot") {
        if (rest.empty()) throw ScriptError("screenshot needs a file name");
        if (!screenshot_ || !screenshot_(g, rest)) out_ << "screenshot failed: " << rest << '\n';
    } else {
        throw ScriptError("unknown command");
    }
    return std::nullopt;
}

void ScriptRunner::Deliver(const std::string& verb, const std::string& target)
{
    ui::Form& form = game_->form;
    const auto [x, y] = Aim(target);
    if (verb == "move") {
        form.MouseMove(x, y);
    } else if (verb == "release") {
        form.MouseUp(x, y);
    } else {
        form.MouseDown(x, y);
        if (verb == "click") form.MouseUp(x, y);
    }
}

std::pair<float, float> ScriptRunner::Aim(const std::string& target) const
{
    const ui::Form& form = game_->form;
    if (!target.empty() && target.front() == '@') {
        const size_t comma = target.find(',');
        if (comma == std::string::npos) throw ScriptError("a point is @X,Y in twips");
        return {ParseTwips(target.substr(1, comma - 1)), ParseTwips(target.substr(comma + 1))};
    }
    const ui::Control* control = nullptr;
    if (target.size() >= 2 && target.front() == '"' && target.back() == '"') {
        control = form.FindByCaption(target.substr(1, target.size() - 2));
        if (!control) throw ScriptError("no visible control with caption " + target);
    } else {
        control = form.Find(target);
        if (!control) throw ScriptError("unknown control: " + target);
    }
    const ui::Rect bounds = form.Bounds(*control);
    return {bounds.left + bounds.width / 2, bounds.top + bounds.height / 2};
}

std::string ScriptRunner::Print(const std::string& name) const
{
    const Game& g = *game_;
    if (name == "Pointer") return ui::Describe(g.form.pointer);
    if (std::optional<std::string> value = ReadVariable(g, name)) return *value;
    if (std::optional<std::string> value = ReadProperty(g, name)) return *value;
    throw ScriptError("unknown name: " + name);
}

void ScriptRunner::SetBoard(std::istream& in)
{
    Game& g = *game_;
    for (int row = 1; row <= 8; ++row) {
        std::string line;
        if (!std::getline(in, line)) throw ScriptError("board needs 8 lines");
        ++lineNumber_;
        line = Trim(line);
        if (line.size() != 8) throw ScriptError("board line needs 8 characters: " + line);
        for (int column = 1; column <= 8; ++column) {
            const char c = line[static_cast<size_t>(column - 1)];
            const int16_t cell = static_cast<int16_t>(row * 10 + column);
            const size_t i = static_cast<size_t>(cell);
            if (c == 'g') {
                g.Board[i] = kBrownBullet;
                g.GreenFlag[i] = true;
            } else if (c >= '0' && c <= '5') {
                g.Board[i] = static_cast<int16_t>(c - '0');
                g.GreenFlag[i] = false;
            } else {
                throw ScriptError(std::string("not a board character: ") + c);
            }
            ShowCell(g, cell);
        }
    }
}

void ScriptRunner::Dump() { out_ << DumpBoard(*game_); }

std::string DumpBoard(const Game& g)
{
    std::string text;
    for (int row = 0; row < 10; ++row) {
        for (int column = 0; column < 10; ++column) {
            const size_t i = static_cast<size_t>(row * 10 + column);
            const int16_t value = g.Board[i];
            if (value == BORDER) text += '#';
            else if (value == CLEARED) text += '.';
            else if (value == kBrownBullet && g.GreenFlag[i]) text += 'g';
            else if (IsGem(value)) text += static_cast<char>('0' + value);
            else text += '?';
        }
        text += '\n';
    }
    return text;
}

}  // namespace kr::script
