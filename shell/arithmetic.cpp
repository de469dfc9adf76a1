#include "shell/arithmetic.h"

#include <cmath>
#include <stdexcept>
#include <string>

namespace kr {

double RoundHalfEven(double x)
{
    const double floor = std::floor(x);
    const double diff = x - floor;
    if (diff < 0.5) return floor;
    if (diff > 0.5) return floor + 1.0;
    return std::fmod(floor, 2.0) == 0.0 ? floor : floor + 1.0;
}

int16_t To16(long long value, const char* where)
{
    if (value < INT16_MIN || value > INT16_MAX)
        throw std::overflow_error(std::string(where) + ": 16-bit overflow (" + std::to_string(value) + ")");
    return static_cast<int16_t>(value);
}

int16_t Round16(double x, const char* where)
{
    const double rounded = RoundHalfEven(x);
    if (!(rounded >= INT16_MIN && rounded <= INT16_MAX))
        throw std::overflow_error(std::string(where) + ": 16-bit overflow");
    return static_cast<int16_t>(rounded);
}

}  // namespace kr

namespace kr {

int16_t TagNumber(const std::string& tag)
{
    try {
        return To16(static_cast<long long>(std::stod(tag)), "TagNumber");
    } catch (const std::invalid_argument&) {
        return 0;
    } catch (const std::out_of_range&) {
        return 0;
    }
}

}  // namespace kr
