#pragma once

namespace kr {

class Game;

inline constexpr int kEscapeKey = 27;
inline constexpr int kKeyN = 78;
inline constexpr int kKeyT = 84;

// The return prompt's keys; honoured only while the game screen shows.
void KeyDown(Game& g, int keyCode);
// Key T: back to the main menu; the mission's animations and countdowns stop, nothing is saved.
void ReturnToMenu(Game& g);

void PlayClicked(Game& g);
void OptionsClicked(Game& g);
void ExitClicked(Game& g);
void MissionMenuBackClicked(Game& g);

// Options screen
void SoundBoxClicked(Game& g);
void TutorialBoxClicked(Game& g);
void ResetClicked(Game& g);
void OptionsBackClicked(Game& g);

}  // namespace kr
