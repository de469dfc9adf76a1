#pragma once

namespace kr {

class Game;

// Hooks every control event and timer tick of the window to the procedure that handles it.
void ConnectHandlers(Game& g);

}  // namespace kr
