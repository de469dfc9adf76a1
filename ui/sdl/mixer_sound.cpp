#include "ui/sdl/mixer_sound.h"

#include <algorithm>
#include <iostream>

#include "ui/sdl/sound_file.h"

namespace kr::sdl {

MixerSound::MixerSound(const Assets& assets, Clock clock) : assets_(assets), clock_(std::move(clock)) {}

MixerSound::~MixerSound() { CloseDevice(); }

void MixerSound::Start()
{
    if (started_) return;
    started_ = true;
    working_ = OpenDevice();
    if (!working_) {
        std::cerr << "Kruszarka: no sound: " << SDL_GetError() << '\n';
        return;
    }
    // Later openings go straight to the driver that worked, instead of probing them all again.
    driver_ = SDL_GetCurrentAudioDriver();
    SDL_SetHint(SDL_HINT_AUDIODRIVER, driver_.c_str());
    CloseDevice();
}

bool MixerSound::OpenDevice()
{
    // SDL's audio is started only while the device is open: some drivers keep a thread of their own awake
    // (ALSA looks for new devices every second) for as long as it runs.
    if (SDL_InitSubSystem(SDL_INIT_AUDIO) != 0) return false;
    SDL_AudioSpec want{};
    want.freq = Voices::kRate;
    want.format = AUDIO_F32SYS;
    want.channels = 1;
    // About 12 ms a buffer: a sound starts soon after its move, and the callback stays cheap.
    want.samples = 512;
    want.callback = Feed;
    want.userdata = this;
    // Any output format will do: SDL converts ours, so the sounds decoded at start-up always fit.
    device_ = SDL_OpenAudioDevice(nullptr, 0, &want, nullptr, 0);
    if (device_ == 0) {
        SDL_QuitSubSystem(SDL_INIT_AUDIO);
        return false;
    }
    SDL_PauseAudioDevice(device_, 0);
    return true;
}

void MixerSound::CloseDevice()
{
    if (device_ == 0) return;
    SDL_CloseAudioDevice(device_);
    device_ = 0;
    SDL_QuitSubSystem(SDL_INIT_AUDIO);
    voices_.StopAll();
}

void MixerSound::Feed(void* self, Uint8* stream, int bytes)
{
    auto& sound = *static_cast<MixerSound*>(self);
    sound.voices_.Mix(reinterpret_cast<float*>(stream), static_cast<size_t>(bytes) / sizeof(float));
    sound.fed_.fetch_add(1);
}

void MixerSound::Open(int channel, const std::string& fileName)
{
    if (channel < 0 || channel >= kChannels) return;
    if (device_) SDL_LockAudioDevice(device_);
    voices_.SetSound(channel, {});
    if (device_) SDL_UnlockAudioDevice(device_);
    const std::filesystem::path file = assets_.Resolve(fileName);
    std::string problem;
    std::vector<float> samples = LoadSound(file, problem);
    if (samples.empty()) {
        std::cerr << "Kruszarka: no sound " << file.string()
                  << (problem.empty() ? "" : ": " + problem) << '\n';
        return;
    }
    if (device_) SDL_LockAudioDevice(device_);
    voices_.SetSound(channel, std::move(samples));
    if (device_) SDL_UnlockAudioDevice(device_);
}

void MixerSound::Play(int channel)
{
    if (!working_ || !voices_.HasSound(channel)) return;
    if (device_ == 0 && !OpenDevice()) return;
    SDL_LockAudioDevice(device_);
    voices_.Start(channel);
    SDL_UnlockAudioDevice(device_);
    quietAt_ = std::max(quietAt_, clock_() + voices_.Milliseconds(channel));
}

std::optional<double> MixerSound::CloseWhenQuiet()
{
    if (device_ == 0) return std::nullopt;
    const double left = quietAt_ + kLingerMs - clock_();
    if (left > 0) return left;
    CloseDevice();
    return std::nullopt;
}

bool MixerSound::Playing(int channel) const
{
    if (device_ == 0) return false;
    SDL_LockAudioDevice(device_);
    const bool playing = voices_.Playing(channel);
    SDL_UnlockAudioDevice(device_);
    return playing;
}

}  // namespace kr::sdl
