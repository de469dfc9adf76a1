#pragma once
#include <atomic>
#include <functional>
#include <map>
#include <optional>
#include <string>

#include <SDL.h>

#include "ui/host.h"
#include "ui/sdl/assets.h"
#include "ui/sdl/voices.h"

namespace kr::sdl {

// The game's sound channels: every sound decoded once into memory, mixed by our own Voices, and an output
// device that is open only while something plays. An open device costs a thread feeding it even silence
// (a whole core on some outputs), so it closes a little after the last sound ends and opens again on the
// next. With no sound device, or a missing file, the channel stays silent: sound is never worth a crash.
class MixerSound final : public ui::SoundChannels {
public:
    // Milliseconds on some steady clock; only differences count.
    using Clock = std::function<double()>;
    static constexpr int kChannels = Voices::kChannels;
    // How long the device stays open after the last sound ends, so a busy fight does not reopen it per move.
    static constexpr double kLingerMs = 2000;

    MixerSound(const Assets& assets, Clock clock);
    ~MixerSound() override;
    MixerSound(const MixerSound&) = delete;
    MixerSound& operator=(const MixerSound&) = delete;

    // Starts SDL's audio and checks once that a device opens; until then Play is silent. The host calls it
    // once the first frame is up, because on a machine without sound SDL spends a tenth of a second probing.
    void Start();

    // Loads the channel's file at once, from beside the program (or the install's data folder) only.
    void Open(int channel, const std::string& fileName) override;
    // Playing a busy channel restarts it, so there is nothing to rewind.
    void Prev(int) override {}
    void Play(int channel) override;

    // Closes the device once it has been quiet long enough. Returns how many milliseconds until it should be
    // asked again, or nothing while the device is closed (then nothing needs waking for).
    std::optional<double> CloseWhenQuiet();

    bool HasSound() const { return working_; }
    // The audio driver that worked at start, or empty.
    const std::string& Driver() const { return driver_; }
    bool DeviceOpen() const { return device_ != 0; }
    bool Loaded(int channel) const { return voices_.HasSound(channel); }
    bool Playing(int channel) const;
    // How many buffers the device has asked for since the program started.
    uint64_t BuffersFed() const { return fed_.load(); }

private:
    static void Feed(void* self, Uint8* stream, int bytes);
    bool OpenDevice();
    void CloseDevice();

    const Assets& assets_;
    Clock clock_;
    bool started_ = false;
    bool working_ = false;
    std::string driver_;
    SDL_AudioDeviceID device_ = 0;
    double quietAt_ = 0;
    Voices voices_;
    std::atomic<uint64_t> fed_{0};
};

}  // namespace kr::sdl
