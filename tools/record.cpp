#include "tools/record.h"

#include <utility>

#include "shell/game.h"
#include "tools/script.h"
#include "tools/variables.h"

namespace kr::record {
namespace {

std::string Point(const Input& input)
{
    return "@" + script::FormatNumber(input.x) + "," + script::FormatNumber(input.y);
}

bool Clickable(const ui::Control& control)
{
    return control.onClick || control.kind == ui::ControlKind::CheckBox;
}

constexpr const char* kSnapshotNames[] = {
    "Health", "MaxHealth", "Resources(0)", "Resources(1)", "Resources(2)", "Resources(3)", "Resources(4)",
    "Resources(5)", "ChosenMission", "MissionStage", "EnemyHealth", "TerminalWork", "BombWork", "BombTicks",
    "InputReady", "SelectedCell", "UnlockedMissions", "SoundOn", "TutorialOn", "TutorialPage", "Strength",
    "Intelligence", "Dexterity", "Endurance", "Accuracy", "MenuLayer.Visible", "MainMenuScreen.Visible",
    "MissionMenuScreen.Visible", "BriefingScreen.Visible", "OptionsScreen.Visible", "LevelUpScreen.Visible",
    "MissionCompleteScreen.Visible", "ReturnPrompt.Visible"};

}  // namespace

std::string Snapshot(const Game& g)
{
    std::string text = script::DumpBoard(g);
    text += "Now = " + std::to_string(g.timers.Now()) + "\nTicks = " + std::to_string(g.timers.TicksRun()) + "\n";
    text += "Pointer = " + ui::Describe(g.form.pointer) + "\n";
    for (const char* name : kSnapshotNames) {
        std::optional<std::string> value = script::ReadVariable(g, name);
        if (!value) value = script::ReadProperty(g, name);
        text += std::string(name) + " = " + value.value_or("?") + "\n";
    }
    return text;
}

void Deliver(ui::Form& form, const Input& input)
{
    switch (input.kind) {
    case InputKind::Press: form.MouseDown(input.x, input.y); break;
    case InputKind::Release: form.MouseUp(input.x, input.y); break;
    case InputKind::Move: form.MouseMove(input.x, input.y); break;
    case InputKind::Key: form.KeyDown(input.key, input.shift); break;
    }
}

void AnswerLog::ShowOk(const std::string& text)
{
    boxes_.ShowOk(text);
    answers_.emplace_back("ok");
}

bool AnswerLog::AskYesNo(const std::string& title, const std::string& text)
{
    const bool yes = boxes_.AskYesNo(title, text);
    answers_.emplace_back(yes ? "yes" : "no");
    return yes;
}

std::vector<std::string> AnswerLog::Take() { return std::exchange(answers_, {}); }

Recorder::Recorder(Game& game, AnswerLog& answers, Sink sink)
    : game_(game), answers_(answers), sink_(std::move(sink))
{
}

Recorder::~Recorder() { Write({}); }

void Recorder::Started(uint32_t seed)
{
    std::string text = "# Recorded by kruszarka --record; replay with kruszarka-script in an empty folder.\n";
    text += "seed " + std::to_string(seed) + "\n";
    for (const std::string& answer : answers_.Take()) text += "answer " + answer + "\n";
    text += "start\n# The progress the game read at start-up.\n";
    const Game& g = game_;
    const std::pair<const char*, int16_t> progress[] = {
        {"UnlockedMissions", g.UnlockedMissions}, {"SoundOn", g.SoundOn},     {"Strength", g.Strength},
        {"Intelligence", g.Intelligence},         {"Dexterity", g.Dexterity}, {"Endurance", g.Endurance},
        {"Accuracy", g.Accuracy},                 {"TutorialOn", g.TutorialOn}};
    for (const auto& [name, value] : progress) text += "set " + std::string(name) + " " + std::to_string(value) + "\n";
    written_ = g.timers.Now();
    sink_(text);
}

void Recorder::Handle(const Input& input)
{
    const std::optional<std::string> line = LineFor(input);
    Deliver(game_.form, input);
    if (line) Write(*line);
}

std::optional<std::string> Recorder::LineFor(const Input& input)
{
    const ui::Form& form = game_.form;
    if (input.kind == InputKind::Key) return "key " + std::to_string(input.key) + (input.shift ? " shift" : "");
    const ui::Control* hit = form.HitTest(input.x, input.y);
    switch (input.kind) {
    case InputKind::Press:
        pressed_ = hit;
        if (hit && hit->onMouseDown) return "press " + Target(*hit, input);
        break;
    case InputKind::Release:
        // A press that ran a handler is already written down; the click then needs only the release.
        if (std::exchange(pressed_, nullptr) == hit && hit && Clickable(*hit))
            return (hit->onMouseDown ? "release " : "click ") + Target(*hit, input);
        break;
    case InputKind::Move:
        if (under_ == hit) break;
        under_ = hit;
        if (!hit && form.onBackgroundMouseMove) return "move " + Point(input) + "  # the window's background";
        if (hit && hit->onMouseMove) return "move " + Target(*hit, input);
        break;
    case InputKind::Key: break;
    }
    return std::nullopt;
}

std::string Recorder::Target(const ui::Control& control, const Input& input) const
{
    const ui::Form& form = game_.form;
    const ui::Rect bounds = form.Bounds(control);
    if (form.HitTest(bounds.left + bounds.width / 2, bounds.top + bounds.height / 2) != &control)
        return Point(input) + "  # " + control.name;
    std::string target = control.name;
    if (!control.caption.empty() && control.caption.find_first_of("\r\n") == std::string::npos)
        target += "  # \"" + control.caption + "\"";
    return target;
}

void Recorder::Write(const std::string& line)
{
    std::string text;
    // Boxes take queued answers in turn, so every answer goes ahead of the wait in which its box showed.
    for (const std::string& answer : answers_.Take()) text += "answer " + answer + "\n";
    const int64_t now = game_.timers.Now();
    if (now > written_) text += "wait " + std::to_string(now - written_) + "\n";
    written_ = now;
    if (!line.empty()) text += line + "\n";
    if (!text.empty()) sink_(text);
}

}  // namespace kr::record
