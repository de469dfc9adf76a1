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

// A game procedure the scenario language can call by name, with 16-bit integer arguments.
struct Procedure {
    size_t arity = 0;
    std::function<std::optional<std::string>(Game&, const std::vector<int16_t>&)> run;
};

const Procedure* FindProcedure(std::string_view name);

}  // namespace script
}  // namespace kr
