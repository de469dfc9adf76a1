#pragma once
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace kr {

class Game;

namespace script {

// The values one argument may take, and how to say so when a script passes another.
struct ArgumentRule {
    bool (*accepts)(int16_t) = nullptr;
    const char* expected = "";
};

// A game procedure the scenario language can call by name, with 16-bit integer arguments.
struct Procedure {
    size_t arity = 0;
    std::function<std::optional<std::string>(Game&, const std::vector<int16_t>&)> run;
    std::vector<ArgumentRule> rules;  // one per argument, or none when any value is safe
};

const Procedure* FindProcedure(std::string_view name);

}  // namespace script
}  // namespace kr
