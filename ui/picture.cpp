#include "ui/picture.h"

#include <algorithm>
#include <array>

namespace kr::ui {
namespace {

constexpr std::array<const char*, 5> kCursorNames{
    "NormalCursor", "EnemyTurnCursor", "TargetCursorA", "TargetCursorB", "GrenadeCursor"};
constexpr std::array<const char*, 5> kCursorFiles{
    "cursor-normal", "cursor-enemy", "cursor-target-a", "cursor-target-b", "cursor-grenade"};
constexpr std::array<const char*, 3> kGoalIconFiles{"goal-wrench", "goal-clock", "goal-cross"};
constexpr std::array<int, 7> kSkillIconSizes{28, 32, 24, 24, 24, 32, 24};

struct Store {
    PictureSet set;
    const char* name;
    int count;  // 0 for a single picture
};

constexpr std::array<Store, 10> kStores{{
    {PictureSet::None, "none", 0},
    {PictureSet::Palette, "palette", 15},
    {PictureSet::Portrait, "portrait", 8},
    {PictureSet::Object, "object", 2},
    {PictureSet::GoalIcon, "goalicon", 3},
    {PictureSet::Hero, "hero", 0},
    {PictureSet::Skill, "skill", 7},
    {PictureSet::Resource, "resource", 5},
    {PictureSet::WindowIcon, "icon", 0},
    {PictureSet::Cursor, "cursor", 5},
}};

const Store& StoreOf(PictureSet set) { return kStores[static_cast<size_t>(set)]; }

bool Valid(PictureRef p)
{
    const Store& store = StoreOf(p.set);
    return store.count == 0 ? p.index == 0 : p.index >= 0 && p.index < store.count;
}

}  // namespace

std::optional<PixelSize> SizeOf(PictureRef p)
{
    if (!Valid(p)) return std::nullopt;
    switch (p.set) {
    case PictureSet::None: return std::nullopt;
    case PictureSet::Palette:
        if (p.index == 10) return std::nullopt;
        return PixelSize{32, 32};
    case PictureSet::Portrait:
    case PictureSet::Object: return PixelSize{49, 49};
    case PictureSet::GoalIcon: return PixelSize{32, 32};
    case PictureSet::Hero: return PixelSize{49, 33};
    case PictureSet::Skill: {
        const int side = kSkillIconSizes[static_cast<size_t>(p.index)];
        return PixelSize{side, side};
    }
    case PictureSet::Resource: return PixelSize{16, 16};
    case PictureSet::WindowIcon: return PixelSize{32, 32};
    case PictureSet::Cursor:
        return p.index == TargetCursorA || p.index == TargetCursorB ? PixelSize{24, 24} : PixelSize{32, 32};
    }
    return std::nullopt;
}

std::string FileStem(PictureRef p)
{
    if (!SizeOf(p)) return {};
    const std::string number = std::to_string(p.index);
    switch (p.set) {
    case PictureSet::Palette: return "palette-" + number;
    case PictureSet::Portrait: return "portrait-" + number;
    case PictureSet::Object: return "object-" + number;
    case PictureSet::GoalIcon: return kGoalIconFiles[static_cast<size_t>(p.index)];
    case PictureSet::Hero: return "hero";
    case PictureSet::Skill: return "skill-" + number;
    case PictureSet::Resource: return "resource-" + number;
    case PictureSet::WindowIcon: return "icon";
    case PictureSet::Cursor: return kCursorFiles[static_cast<size_t>(p.index)];
    case PictureSet::None: break;
    }
    return {};
}

std::vector<PictureRef> AllPictures()
{
    std::vector<PictureRef> pictures;
    for (const Store& store : kStores)
        for (int index = 0; index < std::max(store.count, 1); ++index) {
            const PictureRef picture{store.set, static_cast<int16_t>(index)};
            if (SizeOf(picture)) pictures.push_back(picture);
        }
    return pictures;
}

std::string Describe(PictureRef p)
{
    if (p.set == PictureSet::Cursor && Valid(p)) return kCursorNames[static_cast<size_t>(p.index)];
    const Store& store = StoreOf(p.set);
    if (store.count == 0) return store.name;
    return std::string(store.name) + " " + std::to_string(p.index);
}

std::optional<PictureRef> ParsePicture(std::string_view text)
{
    for (size_t i = 0; i < kCursorNames.size(); ++i)
        if (text == kCursorNames[i]) return CursorPicture(static_cast<Cursor>(i));
    for (const Store& store : kStores) {
        const std::string_view name = store.name;
        if (store.count == 0) {
            if (text == name) return PictureRef{store.set, 0};
            continue;
        }
        if (text.size() <= name.size() + 1 || text.substr(0, name.size()) != name || text[name.size()] != ' ')
            continue;
        int index = 0;
        for (char c : text.substr(name.size() + 1)) {
            if (c < '0' || c > '9' || index > 1000) return std::nullopt;
            index = index * 10 + (c - '0');
        }
        const PictureRef picture{store.set, static_cast<int16_t>(index)};
        if (Valid(picture)) return picture;
    }
    return std::nullopt;
}

}  // namespace kr::ui
