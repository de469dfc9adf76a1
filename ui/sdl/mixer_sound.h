#pragma once
#include <map>
#include <memory>
#include <string>

#include "ui/host.h"
#include "ui/sdl/assets.h"
#include "ui/sdl/handles.h"

namespace kr::sdl {

// The game's sound channels on SDL_mixer, one chunk per channel. With no sound device, or a missing file,
// the channel stays silent: sound is never worth a crash.
class MixerSound final : public ui::SoundChannels {
public:
    static constexpr int kChannels = 14;

    // Opens no device yet: channels opened before Start are remembered and loaded by it.
    explicit MixerSound(const Assets& assets);
    ~MixerSound() override;
    MixerSound(const MixerSound&) = delete;
    MixerSound& operator=(const MixerSound&) = delete;

    // Opens the sound device (falling back to the silent dummy driver) and loads the channels opened so far;
    // until then Play is silent. The host calls it once the first frame is up, because on a machine without
    // sound SDL spends a tenth of a second probing its drivers before the fallback.
    void Start();

    void Open(int channel, const std::string& fileName) override;
    // Playing a busy channel restarts it, so there is nothing to rewind.
    void Prev(int) override {}
    void Play(int channel) override;

    bool HasDevice() const { return open_; }
    bool Loaded(int channel) const;

private:
    bool OpenDevice();
    void Load(int channel);

    const Assets& assets_;
    bool started_ = false;
    bool subsystem_ = false;
    bool open_ = false;
    std::map<int, std::string> files_;
    std::map<int, ChunkPtr> chunks_;
};

}  // namespace kr::sdl
