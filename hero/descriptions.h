#pragma once
#include <cstdint>
#include <string>

namespace kr {

class Game;

// The skill's name, an empty line and what it does, with the numbers the hero's attributes give it now.
std::string SkillDescription(const Game& g, int skill);
// Five lines, a 14-character caption and the value each, in display order.
std::string HeroAttributesText(const Game& g);
// The grenade's damage per brown bullet as the game writes it, in Polish: "1", "1,5", "2".
std::string DecimalComma(double value);

// Hovering a skill or the hero panel hides the tutorial panel and describes what lies under the pointer;
// hovering the board or a background brings the panel back and empties the description.
void ShowSkillDescription(Game& g, const int16_t& skill);
void ShowHeroAttributes(Game& g);
void ClearDescription(Game& g);
// Hovering an attribute's row on the level-up screen.
void ShowAttributeDescription(Game& g, int row);

}  // namespace kr
