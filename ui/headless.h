#pragma once
#include <deque>
#include <functional>
#include <string>
#include <vector>

#include "ui/host.h"

namespace kr::ui {

// Message boxes answered from a queue; a box with no queued answer takes its default button.
// Every box shown is recorded and reported.
class ScriptedMessages final : public MessageBoxes {
public:
    enum class Answer { Ok, Yes, No };

    void Queue(Answer answer) { answers_.push_back(answer); }
    void ShowOk(const std::string& text) override;
    bool AskYesNo(const std::string& title, const std::string& text) override;

    std::vector<std::string> shown;
    std::function<void(const std::string&)> onShown;

private:
    Answer Next(Answer fallback);
    std::deque<Answer> answers_;
};

// Sound channels that only remember what was played.
class RecordedSound final : public SoundChannels {
public:
    void Open(int channel, const std::string& fileName) override;
    void Prev(int) override {}
    void Play(int channel) override { played.push_back(channel); }

    std::vector<std::string> files = std::vector<std::string>(14);
    std::vector<int> played;
};

}  // namespace kr::ui
