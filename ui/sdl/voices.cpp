#include "ui/sdl/voices.h"

#include <algorithm>

namespace kr::sdl {

void Voices::SetSound(int channel, std::vector<float> samples)
{
    if (!Valid(channel)) return;
    Voice& voice = voices_[static_cast<size_t>(channel)];
    voice.samples = std::move(samples);
    voice.position = voice.samples.size();
}

bool Voices::HasSound(int channel) const
{
    return Valid(channel) && !voices_[static_cast<size_t>(channel)].samples.empty();
}

double Voices::Milliseconds(int channel) const
{
    if (!Valid(channel)) return 0;
    return static_cast<double>(voices_[static_cast<size_t>(channel)].samples.size()) * 1000.0 / kRate;
}

void Voices::Start(int channel)
{
    if (Valid(channel)) voices_[static_cast<size_t>(channel)].position = 0;
}

void Voices::StopAll()
{
    for (Voice& voice : voices_) voice.position = voice.samples.size();
}

bool Voices::Playing(int channel) const
{
    if (!Valid(channel)) return false;
    const Voice& voice = voices_[static_cast<size_t>(channel)];
    return voice.position < voice.samples.size();
}

void Voices::Mix(float* out, size_t frames)
{
    std::fill(out, out + frames, 0.0f);
    for (Voice& voice : voices_) {
        const size_t count = std::min(frames, voice.samples.size() - voice.position);
        const float* from = voice.samples.data() + voice.position;
        for (size_t i = 0; i < count; ++i) out[i] += from[i];
        voice.position += count;
    }
    for (size_t i = 0; i < frames; ++i) out[i] = std::clamp(out[i], -1.0f, 1.0f);
}

}  // namespace kr::sdl
