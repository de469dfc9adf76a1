#pragma once
#include <cstdint>
#include <optional>
#include <string>

namespace kr {

class Game;

namespace soak {

// The rules that must hold between any two handlers, whatever the player did. Watch follows the game
// from one moment to the next, so it also sees sequences that restart and input that never comes back.
class Invariants {
public:
    // Input must come back, or a menu show, within this much game time.
    explicit Invariants(int64_t softLockLimit = 30'000) : softLockLimit_(softLockLimit) {}

    // Nothing while every rule holds; else the first broken one, in words.
    std::optional<std::string> Check(const Game& g);

private:
    int64_t softLockLimit_;
    int64_t lastResponsive_ = 0;
    int stageDoneStep_ = -1;  // Timer7's step at the last check, -1 when it was stopped
    int failureStep_ = -1;    // Timer9's likewise
};

// The board's own rules: the border ring, the playable values, green flags only on brown bullets.
std::optional<std::string> BoardBroken(const Game& g);

}  // namespace soak
}  // namespace kr
