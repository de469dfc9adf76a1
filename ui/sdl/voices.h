#pragma once
#include <array>
#include <cstddef>
#include <vector>

namespace kr::sdl {

// The game's own little mixer: one voice per sound channel, each playing its one sound from the start to the
// end. Mono float samples at kRate; the caller keeps the audio thread out while it starts or stops a voice.
class Voices {
public:
    static constexpr int kChannels = 14;
    static constexpr int kRate = 44100;

    // Gives a channel its sound (an empty one silences it) and stops whatever it was playing.
    void SetSound(int channel, std::vector<float> samples);
    bool HasSound(int channel) const;
    // How long a channel's sound lasts, in milliseconds.
    double Milliseconds(int channel) const;

    // Plays a channel from its start, cutting off what it was playing.
    void Start(int channel);
    void StopAll();
    bool Playing(int channel) const;

    // Writes the next `frames` samples: the sum of every playing voice, clamped to full scale.
    void Mix(float* out, size_t frames);

private:
    struct Voice {
        std::vector<float> samples;
        size_t position = 0;  // == samples.size() when silent
    };
    static bool Valid(int channel) { return channel >= 0 && channel < kChannels; }

    std::array<Voice, kChannels> voices_;
};

}  // namespace kr::sdl
