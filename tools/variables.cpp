#include "tools/variables.h"

#include <array>
#include <charconv>
#include <functional>
#include <map>

#include "shell/game.h"
#include "tools/procedures.h"

namespace kr::script {
namespace {

int ParseInt(std::string_view text)
{
    int value = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    if (error != std::errc() || end != text.data() + text.size()) throw ScriptError("not a number: " + std::string(text));
    return value;
}

int16_t ParseInt16(std::string_view text)
{
    const int value = ParseInt(text);
    if (value < INT16_MIN || value > INT16_MAX) throw ScriptError("out of 16-bit range: " + std::string(text));
    return static_cast<int16_t>(value);
}

bool ParseBool(std::string_view text)
{
    if (text == "True") return true;
    if (text == "False") return false;
    throw ScriptError("not True or False: " + std::string(text));
}

std::string ParseString(std::string_view text)
{
    if (text.size() < 2 || text.front() != '"' || text.back() != '"') throw ScriptError("not a quoted string");
    std::string value;
    for (size_t i = 1; i + 1 < text.size(); ++i) {
        if (text[i] != '\\' || i + 2 >= text.size()) {
            value += text[i];
            continue;
        }
        const char next = text[++i];
        value += next == 'r' ? '\r' : next == 'n' ? '\n' : next;
    }
    return value;
}

struct Variable {
    size_t count = 0;  // 0 for a plain variable, else the number of indexed elements
    std::function<std::string(const Game&, size_t)> read;
    std::function<void(Game&, size_t, std::string_view)> write;
};

template <typename T>
Variable Scalar(T Game::*member)
{
    Variable v;
    if constexpr (std::is_same_v<T, bool>) {
        v.read = [member](const Game& g, size_t) { return FormatBool(g.*member); };
        v.write = [member](Game& g, size_t, std::string_view text) { g.*member = ParseBool(text); };
    } else if constexpr (std::is_same_v<T, std::string>) {
        v.read = [member](const Game& g, size_t) { return FormatString(g.*member); };
        v.write = [member](Game& g, size_t, std::string_view text) { g.*member = ParseString(text); };
    } else {
        v.read = [member](const Game& g, size_t) { return std::to_string(g.*member); };
        v.write = [member](Game& g, size_t, std::string_view text) { g.*member = ParseInt16(text); };
    }
    return v;
}

template <typename T, size_t N>
Variable Indexed(std::array<T, N> Game::*member)
{
    Variable v;
    v.count = N;
    if constexpr (std::is_same_v<T, bool>) {
        v.read = [member](const Game& g, size_t i) { return FormatBool((g.*member)[i]); };
        v.write = [member](Game& g, size_t i, std::string_view text) { (g.*member)[i] = ParseBool(text); };
    } else if constexpr (std::is_same_v<T, std::string>) {
        v.read = [member](const Game& g, size_t i) { return FormatString((g.*member)[i]); };
        v.write = [member](Game& g, size_t i, std::string_view text) { (g.*member)[i] = ParseString(text); };
    } else {
        v.read = [member](const Game& g, size_t i) { return std::to_string((g.*member)[i]); };
        v.write = [member](Game& g, size_t i, std::string_view text) { (g.*member)[i] = ParseInt16(text); };
    }
    return v;
}

const std::map<std::string, Variable, std::less<>>& Variables()
{
    static const std::map<std::string, Variable, std::less<>> variables{
        {"Board", Indexed(&Game::Board)},
        {"GreenFlag", Indexed(&Game::GreenFlag)},
        {"FillCounter", Scalar(&Game::FillCounter)},
        {"InputReady", Scalar(&Game::InputReady)},
        {"SelectedCell", Scalar(&Game::SelectedCell)},
        {"SwapFrom", Scalar(&Game::SwapFrom)},
        {"SwapTo", Scalar(&Game::SwapTo)},
        {"SwapUnmatched", Scalar(&Game::SwapUnmatched)},
        {"TeleportPending", Scalar(&Game::TeleportPending)},
        {"BlastPending", Scalar(&Game::BlastPending)},
        {"GrenadePending", Scalar(&Game::GrenadePending)},
        {"Strength", Scalar(&Game::Strength)},
        {"Intelligence", Scalar(&Game::Intelligence)},
        {"Dexterity", Scalar(&Game::Dexterity)},
        {"Endurance", Scalar(&Game::Endurance)},
        {"Accuracy", Scalar(&Game::Accuracy)},
        {"Health", Scalar(&Game::Health)},
        {"MaxHealth", Scalar(&Game::MaxHealth)},
        {"Resources", Indexed(&Game::Resources)},
        {"SkillCost", Indexed(&Game::SkillCost)},
        {"DeadlyBulletsTurns", Scalar(&Game::DeadlyBulletsTurns)},
        {"ImmobilisedTurns", Scalar(&Game::ImmobilisedTurns)},
        {"EnemyAttackToggle", Scalar(&Game::EnemyAttackToggle)},
        {"BombPresent", Scalar(&Game::BombPresent)},
        {"BombRequired", Scalar(&Game::BombRequired)},
        {"BombWork", Scalar(&Game::BombWork)},
        {"BombTicks", Scalar(&Game::BombTicks)},
        {"EnemyPresent", Scalar(&Game::EnemyPresent)},
        {"EnemyRequired", Scalar(&Game::EnemyRequired)},
        {"EnemyHealth", Scalar(&Game::EnemyHealth)},
        {"EnemyAttack", Scalar(&Game::EnemyAttack)},
        {"EnemyHitChance", Scalar(&Game::EnemyHitChance)},
        {"TerminalPresent", Scalar(&Game::TerminalPresent)},
        {"TerminalRequired", Scalar(&Game::TerminalRequired)},
        {"TerminalWork", Scalar(&Game::TerminalWork)},
        {"UnlockedMissions", Scalar(&Game::UnlockedMissions)},
        {"SoundOn", Scalar(&Game::SoundOn)},
        {"TutorialOn", Scalar(&Game::TutorialOn)},
        {"TutorialPage", Scalar(&Game::TutorialPage)},
        {"TutorialTexts", Indexed(&Game::TutorialTexts)},
        {"ChosenMission", Scalar(&Game::ChosenMission)},
        {"MissionStage", Scalar(&Game::MissionStage)},
        {"BriefingText", Scalar(&Game::BriefingText)},
    };
    return variables;
}

const Variable* Lookup(std::string_view name, size_t& index)
{
    const auto [base, i] = SplitIndex(name);
    const auto it = Variables().find(base);
    if (it == Variables().end()) return nullptr;
    const Variable& v = it->second;
    if ((v.count == 0) != (i < 0) || (i >= 0 && static_cast<size_t>(i) >= v.count))
        throw ScriptError("bad index: " + std::string(name));
    index = i < 0 ? 0 : static_cast<size_t>(i);
    return &v;
}

std::string PropertyOf(const ui::Control& c, std::string_view property)
{
    if (property == "Visible") return FormatBool(c.visible);
    if (property == "Enabled") return FormatBool(c.enabled);
    if (property == "Left") return FormatNumber(c.left);
    if (property == "Top") return FormatNumber(c.top);
    if (property == "Width") return FormatNumber(c.width);
    if (property == "Height") return FormatNumber(c.height);
    if (property == "Caption") return FormatString(c.caption);
    if (property == "Picture") return ui::Describe(c.picture);
    if (property == "Value") return std::to_string(c.value);
    if (property == "Tag") return FormatString(c.tag);
    throw ScriptError("unknown property: " + std::string(property));
}

}  // namespace

std::string FormatBool(bool value) { return value ? "True" : "False"; }

std::string FormatString(const std::string& value)
{
    std::string quoted = "\"";
    for (char c : value) {
        if (c == '\r') quoted += "\\r";
        else if (c == '\n') quoted += "\\n";
        else if (c == '"' || c == '\\') (quoted += '\\') += c;
        else quoted += c;
    }
    return quoted + "\"";
}

std::string FormatNumber(double value)
{
    std::array<char, 32> text{};
    const auto result = std::to_chars(text.data(), text.data() + text.size(), static_cast<float>(value));
    return std::string(text.data(), result.ptr);
}

std::pair<std::string_view, int> SplitIndex(std::string_view name)
{
    const size_t open = name.find('(');
    if (open == std::string_view::npos || name.back() != ')') return {name, -1};
    const std::string_view digits = name.substr(open + 1, name.size() - open - 2);
    return {name.substr(0, open), ParseInt(digits)};
}

std::optional<std::string> ReadVariable(const Game& g, std::string_view name)
{
    size_t index = 0;
    const Variable* v = Lookup(name, index);
    if (!v) return std::nullopt;
    return v->read(g, index);
}

void WriteVariable(Game& g, std::string_view name, std::string_view value)
{
    size_t index = 0;
    const Variable* v = Lookup(name, index);
    if (!v) throw ScriptError("unknown variable: " + std::string(name));
    v->write(g, index, value);
}

std::optional<std::string> ReadProperty(const Game& g, std::string_view name)
{
    const size_t dot = name.rfind('.');
    if (dot == std::string_view::npos) return std::nullopt;
    const std::string_view owner = name.substr(0, dot);
    const std::string_view property = name.substr(dot + 1);
    if (owner.substr(0, 5) == "Timer" && owner.find('(') == std::string_view::npos) {
        const ui::Timer& timer = g.timers[ParseInt(owner.substr(5))];
        if (property == "Enabled") return FormatBool(timer.Enabled());
        if (property == "Interval") return std::to_string(timer.Interval());
        if (property == "Tag") return FormatString(timer.tag);
        throw ScriptError("unknown timer property: " + std::string(property));
    }
    const ui::Control* control = g.form.Find(owner);
    if (!control) throw ScriptError("unknown control: " + std::string(owner));
    return PropertyOf(*control, property);
}

std::optional<std::string> CallProcedure(Game& g, std::string_view name, const std::vector<int>& args)
{
    const Procedure* procedure = FindProcedure(name);
    if (!procedure) throw ScriptError("unknown procedure: " + std::string(name));
    if (args.size() != procedure->arity) throw ScriptError("wrong number of arguments for " + std::string(name));
    std::vector<int16_t> narrow;
    for (size_t i = 0; i < args.size(); ++i) {
        const int a = args[i];
        if (a < INT16_MIN || a > INT16_MAX) throw ScriptError("argument out of 16-bit range");
        narrow.push_back(static_cast<int16_t>(a));
        if (i < procedure->rules.size() && !procedure->rules[i].accepts(narrow.back()))
            throw ScriptError("argument " + std::to_string(i + 1) + " of " + std::string(name) + " must be " +
                              procedure->rules[i].expected);
    }
    return procedure->run(g, narrow);
}

}  // namespace kr::script
