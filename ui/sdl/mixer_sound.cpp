#include "ui/sdl/mixer_sound.h"

#include <iostream>

namespace kr::sdl {
namespace {

// Fourteen sounds at full volume clip when a few overlap.
constexpr int kChannelVolume = MIX_MAX_VOLUME * 5 / 8;

}  // namespace

MixerSound::MixerSound(const Assets& assets) : assets_(assets) {}

void MixerSound::Start()
{
    if (started_) return;
    started_ = true;
    open_ = OpenDevice();
    if (!open_) return;
    Mix_AllocateChannels(kChannels);
    Mix_Volume(-1, kChannelVolume);
    for (const auto& [channel, file] : files_) Load(channel);
}

MixerSound::~MixerSound()
{
    if (open_) Mix_HaltChannel(-1);
    chunks_.clear();
    if (open_) Mix_CloseAudio();
    if (subsystem_) SDL_QuitSubSystem(SDL_INIT_AUDIO);
}

bool MixerSound::OpenDevice()
{
    const auto tryOpen = [this] {
        subsystem_ = SDL_InitSubSystem(SDL_INIT_AUDIO) == 0;
        if (subsystem_ && Mix_OpenAudio(MIX_DEFAULT_FREQUENCY, MIX_DEFAULT_FORMAT, 2, 1024) == 0) return true;
        if (subsystem_) SDL_QuitSubSystem(SDL_INIT_AUDIO);
        subsystem_ = false;
        return false;
    };
    if (tryOpen()) return true;
    // No sound card: the dummy driver keeps the mixer working, and silent.
    SDL_SetHint(SDL_HINT_AUDIODRIVER, "dummy");
    if (tryOpen()) return true;
    std::cerr << "Kruszarka: no sound: " << Mix_GetError() << '\n';
    return false;
}

void MixerSound::Open(int channel, const std::string& fileName)
{
    if (channel < 0 || channel >= kChannels) return;
    files_[channel] = fileName;
    if (open_) Load(channel);
}

void MixerSound::Load(int channel)
{
    Mix_HaltChannel(channel);
    chunks_.erase(channel);
    const std::string file = assets_.Resolve(files_[channel]).string();
    ChunkPtr chunk{Mix_LoadWAV(file.c_str())};
    // SDL_mixer's own message for a missing file is misleading: name the file.
    if (!chunk) {
        std::cerr << "Kruszarka: no sound " << file << '\n';
        return;
    }
    chunks_.emplace(channel, std::move(chunk));
}

void MixerSound::Play(int channel)
{
    const auto found = chunks_.find(channel);
    if (found == chunks_.end()) return;
    Mix_PlayChannel(channel, found->second.get(), 0);
}

bool MixerSound::Loaded(int channel) const { return chunks_.count(channel) != 0; }

}  // namespace kr::sdl
