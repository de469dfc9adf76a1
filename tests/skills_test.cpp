// The seven skills as a player meets them: what each costs and from where it is used, what it does at once,
// the targets it waits for on the board, the effects that last for turns or seconds, and what the pointer and
// the description panel show meanwhile.
#include <gtest/gtest.h>

#include <map>
#include <set>
#include <string>

#include "board/grid.h"
#include "board/resolve.h"
#include "hero/skills.h"
#include "shell/timer_numbers.h"
#include "tests/fight_helpers.h"
#include "tests/session.h"

namespace kr {
namespace {

using namespace testing;

// Every skill open, sound on, tutorial on, every attribute 0.
const std::string kEverySkill = " 10 \r\n 1 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 1 \r\n";

// What each skill costs, by gem kind (grey bullet 0, grenade 2, crosshair 3, wrench 4, red cross 5).
const std::map<int, int> kPrice[7] = {
    {{0, 2}, {3, 1}, {2, 1}},          // "Celny strzał"
    {{3, 1}, {5, 1}, {4, 2}},          // "Teleport"
    {{0, 1}, {5, 1}, {4, 2}, {3, 2}},  // "Bullet Time"
    {{0, 2}, {2, 4}},                  // "Rzut granatem"
    {{4, 2}, {5, 4}},                  // "Leczenie"
    {{0, 1}, {2, 3}, {3, 1}, {4, 1}},  // "Wybuch"
    {{0, 5}, {3, 5}},                  // "Śmiercionośne naboje"
};

// Sets every resource counter and lights the panel as a refresh does.
void GiveResources(Session& s, int each)
{
    for (int kind = 0; kind < 6; ++kind) s.Run("set Resources(" + std::to_string(kind) + ") " + std::to_string(each));
    s.Run("call RefreshHeroPanel");
}

// Exactly the price of `skill`, `times` over, and nothing else.
void Afford(Session& s, int skill, int times = 1)
{
    for (int kind = 0; kind < 6; ++kind) {
        const auto price = kPrice[skill].find(kind);
        const int count = price == kPrice[skill].end() ? 0 : price->second * times;
        s.Run("set Resources(" + std::to_string(kind) + ") " + std::to_string(count));
    }
    s.Run("call RefreshHeroPanel");
}

void Use(Session& s, int skill) { s.Press("Image2(" + std::to_string(skill) + ")"); }

// A press on a frame's own background, left of its icon, where no child lies.
void PressFrameBackground(Session& s, int skill)
{
    const ui::Rect frame = s.game.form.Bounds(s.game.form["Frame7(" + std::to_string(skill) + ")"]);
    s.game.form.MouseDown(frame.left + 45, frame.top + 45);
    ASSERT_EQ(s.game.form.HitTest(frame.left + 45, frame.top + 45)->name, "Frame7(" + std::to_string(skill) + ")");
    s.game.form.MouseUp(frame.left + 45, frame.top + 45);
}

// The pointer over a panel's own background, inside its top-left corner where no child lies.
void MoveOverBackground(Session& s, const std::string& panel)
{
    const ui::Rect bounds = s.game.form.Bounds(s.game.form[panel]);
    s.game.form.MouseMove(bounds.left + 45, bounds.top + 45);
}

std::string Pointer(Session& s) { return s.Print("Pointer"); }

bool Highlighted(Session& s, int skill) { return s.Print("SkillHighlight(" + std::to_string(skill) + ").Visible") == "True"; }

// The cells of the board holding CLEARED right now.
std::set<int> ClearedCells(const Session& s)
{
    std::set<int> cleared;
    for (int cell = 0; cell < 100; ++cell)
        if (s.game.Board[static_cast<size_t>(cell)] == CLEARED) cleared.insert(cell);
    return cleared;
}

void ExpectBorderIntact(Session& s)
{
    for (int cell = 0; cell < 100; ++cell) {
        if (!IsBorderRing(cell)) continue;
        EXPECT_EQ(s.game.Board[static_cast<size_t>(cell)], BORDER) << "cell " << cell;
        EXPECT_EQ(s.Print("Image1(" + std::to_string(cell) + ").Picture"), "palette 14") << "cell " << cell;
    }
}

// --- Prices, entry points, the gate ------------------------------------------------------------------------

TEST(SkillPanel, EverySkillChargesItsPriceFromEveryEntryPointAndOnlyWhenItsBorderShows)
{
    // Each entry point: the frame's background, the icon, a price slot, a "5x" label.
    const std::string entries[7] = {"frame", "Image2(1)", "Image4(12)", "Image4(23)", "Image4(27)", "frame",
                                    "Label13(1)"};
    for (int skill = 0; skill < 7; ++skill) {
        SCOPED_TRACE("skill " + std::to_string(skill));
        Session s(5, kEverySkill);
        Enter(s, 1, 0);  // "Misja 2": an enemy, so every skill can be used
        Set(s, {"EnemyHitChance 0", "Health 10"});
        GiveResources(s, 6);
        ASSERT_TRUE(Highlighted(s, skill));
        if (entries[skill] == "frame")
            PressFrameBackground(s, skill);
        else if (entries[skill].rfind("Label13", 0) == 0)
            s.Click(entries[skill]);
        else
            s.Press(entries[skill]);
        for (int kind = 0; kind < 6; ++kind) {
            const auto price = kPrice[skill].find(kind);
            const int paid = price == kPrice[skill].end() ? 0 : price->second;
            EXPECT_EQ(s.game.Resources[static_cast<size_t>(kind)], 6 - paid) << "kind " << kind;
        }
    }

    Session s(5, kEverySkill);
    Enter(s, 1, 0);
    // One short of the price: no border, and a press does nothing.
    Afford(s, kBulletTime);
    s.Run("set Resources(3) 1");
    s.Run("call RefreshHeroPanel");
    EXPECT_FALSE(Highlighted(s, kBulletTime));
    Use(s, kBulletTime);
    EXPECT_FALSE(s.game.timers[kBulletTimeDuration].Enabled());
    EXPECT_EQ(s.game.Resources[0], 1);
    // While the board is locked nothing is used either.
    Afford(s, kBulletTime);
    s.game.InputReady = false;
    Use(s, kBulletTime);
    EXPECT_FALSE(s.game.timers[kBulletTimeDuration].Enabled());
    EXPECT_EQ(s.game.Resources[0], 1);
}

TEST(SkillPanel, ThePanelShowsWhatIsOpenWhatIsAffordableAndThePricesDrawn)
{
    // Three missions open: three skills in every mission, "Misja 1" included.
    Session s(5, " 3 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n");
    Enter(s, 0, 0);  // "Misja 1": a door, no enemy
    for (int skill = 0; skill < 7; ++skill)
        EXPECT_EQ(s.Print("Frame7(" + std::to_string(skill) + ").Visible"), skill < 3 ? "True" : "False");

    // Without an enemy the two shooting skills stay dark however rich the hero; the others light up.
    GiveResources(s, 9);
    EXPECT_EQ(s.game.Resources[0], 6) << "counters are capped at six";
    EXPECT_EQ(s.Print("Image6(5).Visible"), "True");
    for (int skill = 0; skill < 7; ++skill)
        EXPECT_EQ(Highlighted(s, skill), skill != kAimedShot && skill != kDeadlyBullets) << "skill " << skill;
    Use(s, kAimedShot);
    EXPECT_EQ(s.game.Resources[0], 6);

    // The price slots, two rows of three, by resource row: grey bullet 0, wrench 1, red cross 2, crosshair 3,
    // grenade 4; -1 an empty slot.
    const int slots[7][6] = {{-1, 0, 0, -1, 3, 4}, {-1, 3, 2, -1, 1, 1}, {3, 3, 2, 1, 1, 0}, {0, 0, 4, 4, 4, 4},
                             {1, 1, 2, 2, 2, 2},   {4, 4, 4, 0, 1, 3},   {3, -1, -1, 0, -1, -1}};
    for (int skill = 0; skill < 7; ++skill)
        for (int j = 0; j < 6; ++j) {
            const std::string picture = s.Print("Image4(" + std::to_string(6 * skill + j) + ").Picture");
            EXPECT_EQ(picture, slots[skill][j] < 0 ? "none" : "resource " + std::to_string(slots[skill][j]))
                << "slot " << 6 * skill + j;
        }
}

// --- Acting at once ----------------------------------------------------------------------------------------

TEST(AimedShot, HitsForOneToThreePlusStrengthAndTheEnemySkipsTwoTurns)
{
    std::set<int> seen;
    for (uint32_t seed = 1; seed <= 40; ++seed) {
        Session s(seed, kEverySkill);
        Enter(s, 1, 0);
        Set(s, {"Strength 1", "Accuracy 2"});
        Afford(s, kAimedShot);
        s.Sounds();
        Use(s, kAimedShot);
        const int damage = 40 - s.game.EnemyHealth;
        EXPECT_GE(damage, 2);
        EXPECT_LE(damage, 4) << "accuracy adds nothing to the shot";
        seen.insert(damage);
        EXPECT_EQ(s.game.ImmobilisedTurns, 2);
        EXPECT_TRUE(IsShot(s.Sounds()));
        EXPECT_EQ(s.game.Resources[0] + s.game.Resources[2] + s.game.Resources[3], 0);
        EXPECT_TRUE(s.game.InputReady) << "the shot is not a move";
    }
    EXPECT_EQ(seen, (std::set<int>{2, 3, 4}));

    Session s(5, kEverySkill);
    Enter(s, 1, 0);
    Set(s, {"EnemyHitChance 0", "DeadlyBulletsTurns 3"});
    Afford(s, kAimedShot);
    Use(s, kAimedShot);
    EXPECT_EQ(s.game.DeadlyBulletsTurns, 3) << "nor does it use up a deadly-bullets move";
    // Two moves without an answer; the third goes through the gate as usual.
    for (int move = 1; move <= 3; ++move) {
        StartRun(s, "000");
        const int64_t start = Now(s);
        s.AdvanceUntil([&] { return s.game.timers[kAttackTimer].Enabled() || (Now(s) > start + 240 && s.game.InputReady &&
                                                                             NothingRunning(s.game.timers)); });
        EXPECT_EQ(s.game.timers[kAttackTimer].Enabled(), move == 3) << "move " << move;
        Settle(s);
    }
    EXPECT_EQ(s.game.ImmobilisedTurns, 0);

    // With the last enemy dead the stage is won at once.
    Session last(5, kEverySkill);
    Enter(last, 0, 1);  // "Misja 1": the robot
    Set(last, {"EnemyHealth 1"});
    Afford(last, kAimedShot);
    Use(last, kAimedShot);
    EXPECT_TRUE(last.game.timers[kStageDonePause].Enabled());
    EXPECT_EQ(last.Print("StageDoneLabel.Visible"), "True");
}

TEST(Healing, HealsItsRangeAndCostsATurnInAFight)
{
    for (int intelligence : {0, 2}) {
        std::set<int> healed;
        for (uint32_t seed = 1; seed <= 60; ++seed) {
            Session s(seed, kEverySkill);
            Enter(s, 0, 0);  // no enemy: no turn is lost
            Set(s, {"Intelligence " + std::to_string(intelligence), "Health 1", "MaxHealth 100"});
            Afford(s, kHealing);
            Use(s, kHealing);
            healed.insert(s.game.Health - 1);
            EXPECT_TRUE(s.game.InputReady);
            EXPECT_FALSE(s.game.timers[kAttackTimer].Enabled());
        }
        // The roll, the base, and the intelligence added once more by the heal.
        const int low = intelligence * 5 + 10 + intelligence;
        const int high = low + (intelligence + 1) * 5;
        EXPECT_EQ(*healed.begin(), low) << "intelligence " << intelligence;
        EXPECT_EQ(*healed.rbegin(), high) << "intelligence " << intelligence;
    }

    // Capped at the maximum, with the clink of a full hero.
    Session full(5, kEverySkill);
    Enter(full, 0, 0);
    Afford(full, kHealing);
    full.Sounds();
    Use(full, kHealing);
    EXPECT_EQ(full.game.Health, full.game.MaxHealth);
    EXPECT_EQ(full.Sounds(), std::vector<int>{3});

    // In a fight the enemy answers, unless it is immobilised; no deadly-bullets move is used up.
    Session fight(5, kEverySkill);
    Enter(fight, 1, 0);
    Set(fight, {"Health 10", "DeadlyBulletsTurns 2", "ImmobilisedTurns 2"});
    Afford(fight, kHealing);
    Use(fight, kHealing);
    EXPECT_EQ(fight.game.ImmobilisedTurns, 1);
    EXPECT_FALSE(fight.game.timers[kAttackTimer].Enabled());
    EXPECT_TRUE(fight.game.InputReady);
    Set(fight, {"ImmobilisedTurns 0"});
    Afford(fight, kHealing);
    Use(fight, kHealing);
    EXPECT_TRUE(fight.game.timers[kAttackTimer].Enabled());
    EXPECT_FALSE(fight.game.InputReady);
    EXPECT_EQ(Pointer(fight), "EnemyTurnCursor");
    EXPECT_EQ(fight.game.DeadlyBulletsTurns, 2);
}

TEST(DeadlyBullets, MultiplyBulletDamageForExactlyThreeMovesCascadesIncluded)
{
    Session s(5, kEverySkill);
    Enter(s, 1, 0);  // an enemy of 40
    Set(s, {"EnemyHitChance 0", "Health 100", "MaxHealth 100"});
    Afford(s, kDeadlyBullets);
    s.Sounds();
    s.Click("Label13(0)");
    EXPECT_EQ(s.game.DeadlyBulletsTurns, 3);
    EXPECT_EQ(s.Sounds(), std::vector<int>{4});

    // Move 1: the run of red crosses in row 3 drops two brown bullets onto a third in column 1, a second run
    // in the same move. Both hit twice as hard (Strength 0: x 2); the move counts once.
    Lay(s, Board({"1.......", "1.......", "55353...", "1......."}));
    Swap(s, 33, 34);
    Settle(s);
    const int first = 40 - s.game.EnemyHealth;
    EXPECT_GE(first, 4) << "the cascading run of at least three bullets, multiplied";
    EXPECT_EQ(s.game.DeadlyBulletsTurns, 2);
    // Moves 2 and 3 still multiply, the fourth does not.
    for (int move = 2; move <= 4; ++move) {
        const int before = s.game.EnemyHealth;
        PlayRun(s, "111");
        EXPECT_EQ(before - s.game.EnemyHealth, move <= 3 ? 4 : 2) << "move " << move;
        Settle(s);
    }
    EXPECT_EQ(s.game.DeadlyBulletsTurns, 0);
}

// --- Targets on the board ----------------------------------------------------------------------------------

TEST(Grenade, ClearsThirteenCellsKeepsTheBorderAndHitsOncePerBrownBullet)
{
    const std::map<int, std::set<int>> areas = {
        {11, {11, 12, 13, 21, 22, 31}},
        {18, {16, 17, 18, 27, 28, 38}},
        {81, {61, 71, 72, 81, 82, 83}},
        {88, {68, 77, 78, 86, 87, 88}},
        {44, {24, 33, 34, 35, 42, 43, 44, 45, 46, 53, 54, 55, 64}},
    };
    for (const auto& [cell, area] : areas) {
        SCOPED_TRACE("cell " + std::to_string(cell));
        Session s(5, kEverySkill);
        Enter(s, 1, 0);
        Lay(s, Board({}));
        Afford(s, kGrenade);
        s.Press(45 == cell ? 46 : 45);  // a selection made before the throw stays
        Use(s, kGrenade);
        EXPECT_EQ(Pointer(s), "GrenadeCursor");
        EXPECT_TRUE(s.game.InputReady);
        s.Press(cell);
        EXPECT_EQ(ClearedCells(s), area);
        ExpectBorderIntact(s);
        EXPECT_EQ(Pointer(s), "NormalCursor");
        EXPECT_FALSE(s.game.InputReady);
        EXPECT_EQ(s.Print("SelectionMarker.Visible"), "True");
    }

    // Three brown bullets, one green-tipped, with Strength 1: 1.5 x 3 = 4.5, rounded to the even 4; accuracy
    // and the green tip add nothing. The blast, the fall and one turn end follow as after a swap.
    Session s(5, kEverySkill);
    Enter(s, 1, 0);
    Set(s, {"Strength 1", "Accuracy 2", "EnemyHitChance 0", "ImmobilisedTurns 3", "SwapUnmatched False"});
    Lay(s, Board({"........", "...1g...", "....1..."}));
    Afford(s, kGrenade);
    s.Sounds();
    Use(s, kGrenade);
    s.Press(34);
    EXPECT_EQ(s.game.EnemyHealth, 36);
    EXPECT_EQ(s.Sounds(), std::vector<int>{9});
    EXPECT_TRUE(s.game.timers[kBlastTimer].Enabled());
    const int health = s.game.Health;
    Settle(s);
    EXPECT_EQ(s.game.ImmobilisedTurns, 2) << "exactly one turn end";
    EXPECT_EQ(s.game.Health, health) << "no penalty: the last swap had matched";
}

TEST(Blast, ClearsEveryIconOfThePressedKindWithNoEffectOfItsOwnAndIsPaidOnce)
{
    Session s(5, kEverySkill);
    Enter(s, 1, 0);
    Set(s, {"EnemyHitChance 0", "ImmobilisedTurns 3"});
    Lay(s, Board({"1g......", "......1.", "....g..."}));
    Afford(s, kBlast, 2);
    const auto resources = s.game.Resources;
    Use(s, kBlast);
    EXPECT_EQ(Pointer(s), "TargetCursorA");
    EXPECT_FALSE(Highlighted(s, kBlast)) << "armed: not again until its target is pressed";
    Use(s, kBlast);  // a double click
    for (int kind = 0; kind < 6; ++kind) {
        const auto price = kPrice[kBlast].find(kind);
        const int paid = price == kPrice[kBlast].end() ? 0 : price->second;
        EXPECT_EQ(s.game.Resources[static_cast<size_t>(kind)], resources[static_cast<size_t>(kind)] - paid);
    }
    s.Press(12);  // a green-tipped bullet: red and green tips go alike
    EXPECT_EQ(ClearedCells(s), (std::set<int>{11, 12, 27, 35}));
    for (int cell : {11, 12, 27, 35}) EXPECT_FALSE(s.game.GreenFlag[static_cast<size_t>(cell)]);
    EXPECT_EQ(s.game.EnemyHealth, 40) << "the cleared bullets shoot nobody";
    EXPECT_FALSE(s.game.BlastPending);
    EXPECT_EQ(Pointer(s), "NormalCursor");
    EXPECT_FALSE(s.game.timers[kTargetBlinkTimer].Enabled());
    Settle(s);
    EXPECT_EQ(s.game.ImmobilisedTurns, 2) << "exactly one turn end";
    EXPECT_TRUE(Highlighted(s, kBlast)) << "paid once: the second price is still there";
}

TEST(Teleport, SwapsAnyTwoCellsAndAnUnmatchedOneCostsAThird)
{
    Session s(5, kEverySkill);
    Enter(s, 1, 0);
    Set(s, {"EnemyHitChance 0", "Health 60", "MaxHealth 60"});
    Lay(s, Board({}));
    Afford(s, kTeleport, 2);
    Use(s, kTeleport);
    EXPECT_TRUE(s.game.TeleportPending);
    EXPECT_FALSE(Highlighted(s, kTeleport)) << "armed, although a second price is there";
    // The blink alternates the two target frames every 150 ms.
    EXPECT_EQ(Pointer(s), "TargetCursorA");
    s.Advance(150);
    EXPECT_EQ(Pointer(s), "TargetCursorB");
    s.Advance(150);
    EXPECT_EQ(Pointer(s), "TargetCursorA");
    // Selecting and deselecting keeps it armed; then opposite corners swap.
    s.Press(11);
    s.Press(11);
    EXPECT_TRUE(s.game.TeleportPending);
    const int16_t corner = s.game.Board[11], other = s.game.Board[88];
    Swap(s, 11, 88);
    EXPECT_FALSE(s.game.TeleportPending);
    EXPECT_EQ(Pointer(s), "NormalCursor");
    EXPECT_FALSE(s.game.timers[kTargetBlinkTimer].Enabled());
    s.Advance(240);
    EXPECT_EQ(s.game.Board[11], other);
    EXPECT_EQ(s.game.Board[88], corner);
    EXPECT_EQ(s.game.Health, 40) << "nothing lined up: a third of 60 is lost";
    EXPECT_TRUE(Highlighted(s, kTeleport)) << "the turn's refresh lights it again";
}

TEST(Targeting, EachPressServesOneArmedSkillAndThePointerAlwaysTellsWhich)
{
    Session s(5, kEverySkill);
    Enter(s, 1, 0);
    Set(s, {"EnemyHitChance 0", "Health 60", "MaxHealth 60"});
    Lay(s, Board({}));
    GiveResources(s, 6);
    Use(s, kBlast);
    Use(s, kTeleport);
    // "Wybuch" takes the press; the teleport waits on, and the pointer keeps blinking for it.
    s.Press(11);
    EXPECT_TRUE(ClearedCells(s).count(11));
    EXPECT_TRUE(s.game.TeleportPending);
    EXPECT_TRUE(s.game.timers[kTargetBlinkTimer].Enabled());
    EXPECT_EQ(Pointer(s), "TargetCursorA");
    Settle(s);
    EXPECT_TRUE(s.game.TeleportPending);

    // A grenade bought meanwhile goes first, and the pointer shows it, not the blink.
    GiveResources(s, 6);
    Use(s, kGrenade);
    EXPECT_EQ(Pointer(s), "GrenadeCursor");
    s.Advance(450);
    EXPECT_EQ(Pointer(s), "GrenadeCursor");
    // Healing hands the enemy a turn: its cursor shows while it shoots, and the grenade is still there after.
    Use(s, kHealing);
    EXPECT_EQ(Pointer(s), "EnemyTurnCursor");
    Settle(s);
    EXPECT_TRUE(s.game.GrenadePending);
    EXPECT_EQ(Pointer(s), "GrenadeCursor");
    s.Press(55);
    EXPECT_FALSE(s.game.GrenadePending);
    EXPECT_TRUE(s.game.TeleportPending);
    EXPECT_EQ(Pointer(s), "TargetCursorA");
}

// --- Bullet Time -------------------------------------------------------------------------------------------

TEST(BulletTime, SlowsTheBombForFifteenSecondsWithTheSoundAtTheStartAndTheHalf)
{
    Session s(5, kEverySkill);
    Enter(s, 2, 2);  // "Misja 3": the bomb of 1500 ticks
    ASSERT_TRUE(s.game.timers[kBombClock].Enabled());
    Afford(s, kBulletTime);
    s.Sounds();
    const int16_t ticks = s.game.BombTicks;
    Use(s, kBulletTime);
    const int64_t start = Now(s);
    EXPECT_EQ(s.Sounds(), std::vector<int>{12});
    EXPECT_EQ(s.game.timers[kBombClock].Interval(), 200);
    EXPECT_EQ(s.Print("BulletTimeBar.Visible"), "True");
    EXPECT_EQ(s.Print("BulletTimeBar.Left"), "2400");
    EXPECT_EQ(s.Print("BulletTimeBar.Width"), "3855");
    s.Advance(1000);
    EXPECT_EQ(s.game.BombTicks, ticks - 5) << "one bomb tick per 200 ms";
    EXPECT_EQ(s.Print("BulletTimeBar.Width"), "3595");
    EXPECT_EQ(s.Print("BulletTimeBar.Left"), "2530");
    s.Advance(static_cast<int>(start + 7499 - Now(s)));
    EXPECT_TRUE(s.Sounds().empty());
    s.Advance(1);
    EXPECT_EQ(s.Sounds(), std::vector<int>{12});
    s.Advance(static_cast<int>(start + 14999 - Now(s)));
    EXPECT_TRUE(s.game.timers[kBulletTimeDuration].Enabled());
    s.Advance(1);
    EXPECT_FALSE(s.game.timers[kBulletTimeDuration].Enabled());
    EXPECT_FALSE(s.game.timers[kBulletTimeBar].Enabled());
    EXPECT_EQ(s.Print("BulletTimeBar.Visible"), "False");
    EXPECT_EQ(s.game.timers[kBombClock].Interval(), 100);
    EXPECT_TRUE(s.Sounds().empty());

    // Used again right after its half, it lasts two more duration ticks; the bar, restarted on a running
    // clock, runs out before the end and stops at nothing.
    Afford(s, kBulletTime, 2);
    Use(s, kBulletTime);
    const int64_t second = Now(s);
    s.Advance(7500);
    Use(s, kBulletTime);
    EXPECT_EQ(s.Print("BulletTimeBar.Width"), "3855");
    s.Advance(static_cast<int>(second + 22499 - Now(s)));
    EXPECT_TRUE(s.game.timers[kBulletTimeDuration].Enabled());
    EXPECT_EQ(s.Print("BulletTimeBar.Width"), "0");
    EXPECT_EQ(s.Print("BulletTimeBar.Left"), "4327.5");
    s.Advance(1);
    EXPECT_FALSE(s.game.timers[kBulletTimeDuration].Enabled());
}

TEST(BulletTime, AnExplodingBombEndsItWithBothSounds)
{
    Session s(5, kEverySkill);
    Enter(s, 2, 2);
    Afford(s, kBulletTime);
    Use(s, kBulletTime);
    Set(s, {"BombTicks 1"});
    s.Sounds();
    s.Advance(199);
    EXPECT_FALSE(s.game.timers[kFailureTimer].Enabled());
    s.Advance(1);
    EXPECT_TRUE(s.game.timers[kFailureTimer].Enabled());
    EXPECT_EQ(s.Print("MissionFailedLabel.Visible"), "True");
    EXPECT_EQ(s.Sounds(), (std::vector<int>{8, 9}));
    EXPECT_FALSE(s.game.timers[kBulletTimeDuration].Enabled());
    EXPECT_FALSE(s.game.timers[kBulletTimeBar].Enabled());
    EXPECT_EQ(s.Print("BulletTimeBar.Visible"), "False");
    EXPECT_EQ(s.game.timers[kBombClock].Interval(), 100);
}

TEST(BulletTime, TheEnemyAnswersEverySecondMoveBeginningWithTheFirst)
{
    Session s(5, kEverySkill);
    Enter(s, 1, 0);
    Set(s, {"EnemyHitChance 0", "EnemyAttackToggle True"});
    Afford(s, kBulletTime);
    Use(s, kBulletTime);
    EXPECT_FALSE(s.game.EnemyAttackToggle);
    for (int move = 1; move <= 5; ++move) {
        StartRun(s, "000");
        const int64_t start = Now(s);
        s.AdvanceUntil([&] { return s.game.timers[kAttackTimer].Enabled() || (Now(s) > start + 240 && s.game.InputReady &&
                                                                             NothingRunning(s.game.timers)); });
        EXPECT_EQ(s.game.timers[kAttackTimer].Enabled(), move % 2 == 1) << "move " << move;
        Settle(s);
    }
    ASSERT_LT(Now(s), 15000) << "all five moves fell within the slow time";
}

// --- Descriptions ------------------------------------------------------------------------------------------

TEST(Descriptions, SkillsAndTheHeroAreDescribedWithTheNumbersOfTheirAttributes)
{
    Session s(5, kEverySkill);
    Enter(s, 1, 0);
    const auto text = [&](int skill) {
        s.Run("move Image2(" + std::to_string(skill) + ")");
        return s.Print("HoverLabel.Caption");
    };
    EXPECT_EQ(text(kAimedShot), "\"Celny strzał\\r\\n\\r\\nZadaje obrażenia 1-3 i unieruchamia wroga na 2 tury.\"");
    EXPECT_EQ(s.Print("TutorialPanel.Visible"), "False");
    EXPECT_EQ(text(kTeleport), "\"Teleport\\r\\n\\r\\nZamienia miejscami dwa dowolne pola na planszy (uwzględnia karę "
                               "za niepołączenie ikon).\"");
    EXPECT_EQ(text(kBulletTime), "\"Bullet Time\\r\\n\\r\\nCzas leci wolniej! Masz więcej czasu na rozbrajanie bomb, a "
                                 "przeciwnicy atakują z 2x mniejszą częstotliwością.\"");
    EXPECT_EQ(text(kBlast), "\"Wybuch\\r\\n\\r\\nUsuwa wszystkie elementy wybranego typu z planszy.\"");
    const std::string grenade = "\"Rzut granatem\\r\\n\\r\\nNiszczy spory obszar na planszy. Każdy zniszczony brązowy "
                                "pocisk zadaje przeciwnikowi ";
    const std::string values[3][4] = {{"1-3", "1", "10-15", "2"}, {"2-4", "1,5", "15-25", "3"},
                                      {"3-5", "2", "20-35", "4"}};
    for (int level = 0; level <= 2; ++level) {
        Set(s, {"Strength " + std::to_string(level), "Intelligence " + std::to_string(level)});
        const auto& v = values[level];
        EXPECT_EQ(text(kAimedShot), "\"Celny strzał\\r\\n\\r\\nZadaje obrażenia " + v[0] +
                                        " i unieruchamia wroga na 2 tury.\"");
        EXPECT_EQ(text(kGrenade), grenade + v[1] + " pkt obrażeń.\"");
        EXPECT_EQ(text(kHealing), "\"Leczenie\\r\\n\\r\\nLeczy " + v[2] + " obrażeń.\"");
        EXPECT_EQ(text(kDeadlyBullets),
                  "\"Śmiercionośne naboje\\r\\n\\r\\nPrzez 3 tury zadajesz " + v[3] + "x więcej obrażeń od naboi.\"");
    }

    // Price slots and the "5x" labels describe their skill too.
    s.Run("move Image4(20)");
    EXPECT_EQ(s.Print("HoverLabel.Caption").substr(0, 15), "\"Rzut granatem\\");
    s.Run("move Label13(1)");
    EXPECT_EQ(s.Print("HoverLabel.Caption").rfind("\"Śmiercionośne naboje", 0), 0u);

    // Straight from a skill onto the hero: the attributes in one column; onto the board: nothing, and the
    // tutorial panel is back.
    Set(s, {"Strength 2", "Dexterity 1", "Accuracy 0", "Endurance 2", "Intelligence 1"});
    s.Run("move Image3");
    EXPECT_EQ(s.Print("HoverLabel.Caption"), "\"MOC:          2\\r\\nZRĘCZNOŚĆ:    1\\r\\nCELNOŚĆ:      0\\r\\n"
                                             "WYTRZYMAŁOŚĆ: 2\\r\\nINTELIGENCJA: 1\"");
    EXPECT_EQ(s.Print("TutorialPanel.Visible"), "False");
    s.Run("move Image1(45)");
    EXPECT_EQ(s.Print("HoverLabel.Caption"), "\"\"");
    EXPECT_EQ(s.Print("TutorialPanel.Visible"), "True");
    s.Run("move Frame1");
    EXPECT_EQ(s.Print("TutorialPanel.Visible"), "False");
    MoveOverBackground(s, "Frame2");
    EXPECT_EQ(s.Print("TutorialPanel.Visible"), "True");
    EXPECT_EQ(s.Print("HoverLabel.Caption"), "\"\"");
}

TEST(Descriptions, TheLevelUpScreenDescribesTheRowUnderThePointer)
{
    Session s(5, " 2 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n 0 \r\n");
    s.Run("call PrepareLevelUp 1");
    ASSERT_EQ(s.Print("LevelUpScreen.Visible"), "True");
    EXPECT_EQ(s.Print("Label11.Caption"), "\"\"");
    s.Run("move Label9(2)");
    EXPECT_EQ(s.Print("Label11.Caption"),
              "\"ZRĘCZNOŚĆ zwiększa Twoje zdolności inżynieryjne, łączenie kluczy daje teraz lepsze efekty (+50% od "
              "wartości bazowej)\"");
    s.Run("move Label10(3)");
    EXPECT_EQ(s.Print("Label11.Caption"), "\"WYTRZYMAŁOŚĆ powiększa Twoje punkty życia o 25%\"");
    s.Run("move Label9(0)");
    EXPECT_EQ(s.Print("Label11.Caption"), "\"WYTRZYMAŁOŚĆ powiększa Twoje punkty życia o 25%\"");
}

// --- What carries over -------------------------------------------------------------------------------------

TEST(SkillLifetimes, StagesCarryArmedSkillsButLeavingOrStartingAMissionClearsThem)
{
    Session s(5, kEverySkill);
    Enter(s, 1, 0);
    Set(s, {"EnemyHitChance 0"});
    GiveResources(s, 6);
    Use(s, kDeadlyBullets);
    GiveResources(s, 6);
    Use(s, kBulletTime);
    GiveResources(s, 6);
    Use(s, kTeleport);
    Use(s, kBlast);
    GiveResources(s, 6);
    Use(s, kGrenade);

    // Into the next stage: all of it stays.
    s.Run("set MissionStage 1");
    s.Run("call SetUpStage 1 1");
    s.Advance(64 * 30);
    EXPECT_TRUE(s.game.GrenadePending && s.game.BlastPending && s.game.TeleportPending);
    EXPECT_EQ(Pointer(s), "GrenadeCursor");
    EXPECT_EQ(s.game.DeadlyBulletsTurns, 3);
    EXPECT_TRUE(s.game.timers[kBulletTimeDuration].Enabled());

    // T: nothing armed is left, the pointer is the ordinary one, slow time is over.
    s.Key(27);
    s.Key(84);
    EXPECT_FALSE(s.game.GrenadePending || s.game.BlastPending || s.game.TeleportPending);
    EXPECT_EQ(Pointer(s), "NormalCursor");
    EXPECT_FALSE(s.game.timers[kTargetBlinkTimer].Enabled());
    EXPECT_FALSE(s.game.timers[kBulletTimeDuration].Enabled());

    // A new mission also starts without deadly bullets, slow time or an armed target left from the last.
    s.Run("set DeadlyBulletsTurns 2");
    s.Run("set BlastPending True");
    s.Run("call StartBulletTime");
    s.Run("call ShowBoardPointer");
    s.Click("\"Gra\"");
    s.Click("Command4(2)");
    s.Click("\"Rozpocznij misję ->\"");
    EXPECT_EQ(s.game.DeadlyBulletsTurns, 0);
    EXPECT_FALSE(s.game.BlastPending);
    EXPECT_EQ(Pointer(s), "NormalCursor");
    EXPECT_FALSE(s.game.timers[kBulletTimeDuration].Enabled());
    EXPECT_EQ(s.game.timers[kBombClock].Interval(), 100);
}

}  // namespace
}  // namespace kr
