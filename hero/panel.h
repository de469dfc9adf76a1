#pragma once

namespace kr {

class Game;

// Shows health, caps and shows the resources, lights the affordable skills, and turns a health of
// zero or less into the start of the failure sequence.
void RefreshHeroPanel(Game& g);

// Whether the hero can pay for skill s with the resources shown now.
bool Affordable(const Game& g, int skill);

}  // namespace kr
