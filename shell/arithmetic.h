#pragma once
#include <cstdint>
#include <string>

namespace kr {

// Nearest integer, exact halves to the even neighbour: the only float-to-int conversion the game uses.
double RoundHalfEven(double x);

// The game's numbers are 16-bit; a value that does not fit is a programming error and throws.
int16_t To16(long long value, const char* where);

// Rounds to nearest-even and narrows to 16 bits in one step.
int16_t Round16(double x, const char* where);

}  // namespace kr

namespace kr {

// The integer part of a number kept as text in a timer's or control's tag; 0 when it holds none.
int16_t TagNumber(const std::string& tag);

}  // namespace kr
