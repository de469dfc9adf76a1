#pragma once
#include <array>
#include <cstdint>

namespace kr {

// Cell values besides the gem kinds 0..5.
inline constexpr int16_t CLEARED = -2;  // being removed, or empty until the fall refills it
inline constexpr int16_t BORDER = -1;   // the fixed ring round the 8 x 8 field

inline constexpr int kGemKinds = 6;
inline constexpr int16_t kBrownBullet = 1;

// Palette pictures beyond the six kinds.
inline constexpr int kGreenBulletPicture = 6;
inline constexpr int kNoPicture = 10;
inline constexpr int kBorderPicture = 14;

constexpr int RowOf(int cell) { return cell / 10; }
constexpr int ColumnOf(int cell) { return cell % 10; }
constexpr bool IsBorderRing(int cell)
{
    return RowOf(cell) == 0 || RowOf(cell) == 9 || ColumnOf(cell) == 0 || ColumnOf(cell) == 9;
}
constexpr bool IsPlayable(int cell) { return cell >= 0 && cell < 100 && !IsBorderRing(cell); }
constexpr bool IsGem(int16_t value) { return value >= 0 && value < kGemKinds; }

using BoardCells = std::array<int16_t, 100>;

}  // namespace kr
