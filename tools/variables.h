#pragma once
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

namespace kr {

class Game;

namespace script {

// A line the scenario language cannot carry out (unknown name, bad value): the runner exits 2.
struct ScriptError : std::runtime_error {
    using std::runtime_error::runtime_error;
};

std::string FormatBool(bool value);
std::string FormatString(const std::string& value);
std::string FormatNumber(double value);

// A game variable by its name, indexed as "Board(45)"; nothing when no such variable exists.
std::optional<std::string> ReadVariable(const Game& g, std::string_view name);
// Throws ScriptError for an unknown name or a value of the wrong shape.
void WriteVariable(Game& g, std::string_view name, std::string_view value);

// "Control.Property" for a control by form name or role, or "TimerN.Property".
std::optional<std::string> ReadProperty(const Game& g, std::string_view name);

// Runs a named procedure with integer arguments; returns its printed result for procedures that have one.
std::optional<std::string> CallProcedure(Game& g, std::string_view name, const std::vector<int>& args);

// Splits "Name(12)" into the name and the index; no index gives -1.
std::pair<std::string_view, int> SplitIndex(std::string_view name);

}  // namespace script
}  // namespace kr
