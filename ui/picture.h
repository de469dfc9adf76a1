#pragma once
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace kr::ui {

// The picture stores of the game; a picture is a store plus an index into it.
enum class PictureSet : uint8_t {
    None,       // no picture at all
    Palette,    // the board's gem palette, 0..14 (10 is the empty cell)
    Portrait,   // enemy portraits, 0..7
    Object,     // 0 bomb, 1 terminal
    GoalIcon,   // 0 wrench, 1 clock, 2 red cross
    Hero,       // the hero's portrait
    Skill,      // skill icons, 0..6
    Resource,   // resource and cost icons by resource row, 0..4
    WindowIcon,
    Cursor,     // pointer pictures, see Cursor below
};

enum Cursor : int16_t {
    NormalCursor = 0,
    EnemyTurnCursor = 1,
    TargetCursorA = 2,
    TargetCursorB = 3,
    GrenadeCursor = 4,
};

struct PictureRef {
    PictureSet set = PictureSet::None;
    int16_t index = 0;

    friend bool operator==(const PictureRef&, const PictureRef&) = default;
};

constexpr PictureRef Palette(int index) { return {PictureSet::Palette, static_cast<int16_t>(index)}; }
constexpr PictureRef CursorPicture(Cursor c) { return {PictureSet::Cursor, c}; }

struct PixelSize {
    int width = 0;
    int height = 0;
};

// Pixel size at 1x, or nothing for "no picture" (the empty palette entry included).
std::optional<PixelSize> SizeOf(PictureRef picture);

// The asset file stem under assets/pictures, empty for "no picture".
std::string FileStem(PictureRef picture);

// Every picture the game can show, each once.
std::vector<PictureRef> AllPictures();

// How scripts and tests name a picture: "palette 7", "portrait 3", "hero", "NormalCursor".
std::string Describe(PictureRef picture);
std::optional<PictureRef> ParsePicture(std::string_view text);

}  // namespace kr::ui
