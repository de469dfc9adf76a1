#include "shell/sound.h"

#include "shell/arithmetic.h"
#include "shell/game.h"
#include "shell/texts.h"

namespace kr {

void OpenSoundChannels(Game& g)
{
    for (int channel = 0; channel < static_cast<int>(kSoundFiles.size()); ++channel)
        g.host.sound.Open(channel, kSoundFiles[static_cast<size_t>(channel)]);
}

void PlayChannel(Game& g, int channel)
{
    g.host.sound.Prev(channel);
    g.host.sound.Play(channel);
}

void PlayShot(Game& g)
{
    const int16_t n = Round16(g.random.Draw() * 100.0f, "PlayShot");
    PlayChannel(g, n >= 50 ? 1 : 0);
}

void PlayMiss(Game& g) { PlayChannel(g, 2); }
void PlayImpact(Game& g) { PlayChannel(g, 3); }
void PlayReload(Game& g) { PlayChannel(g, 4); }
void PlayEngineer(Game& g) { PlayChannel(g, 5); }
void PlayHeal(Game& g) { PlayChannel(g, 6); }
void PlayGoalDone(Game& g) { PlayChannel(g, 7); }
void PlayDefeat(Game& g) { PlayChannel(g, 8); }
void PlayBoom(Game& g) { PlayChannel(g, 9); }
void PlayStart(Game& g) { PlayChannel(g, 10); }
void PlayPenalty(Game& g) { PlayChannel(g, 11); }
void PlayBulletTime(Game& g) { PlayChannel(g, 12); }
void PlayMissionDone(Game& g) { PlayChannel(g, 13); }

}  // namespace kr
