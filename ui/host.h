#pragma once
#include <string>

namespace kr::ui {

// Modal message boxes. A real host blocks until the player answers; a test host answers from a script.
class MessageBoxes {
public:
    virtual ~MessageBoxes() = default;
    virtual void ShowOk(const std::string& text) = 0;
    // Yes is the default button.
    virtual bool AskYesNo(const std::string& title, const std::string& text) = 0;
};

// Sound channels, one per file: opened once by name, then rewound and played without waiting.
// A channel whose file failed to open stays silent.
class SoundChannels {
public:
    virtual ~SoundChannels() = default;
    virtual void Open(int channel, const std::string& fileName) = 0;
    virtual void Prev(int channel) = 0;
    virtual void Play(int channel) = 0;
};

}  // namespace kr::ui
