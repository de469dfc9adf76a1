#include "ui/headless.h"

namespace kr::ui {

ScriptedMessages::Answer ScriptedMessages::Next(Answer fallback)
{
    if (answers_.empty()) return fallback;
    const Answer answer = answers_.front();
    answers_.pop_front();
    return answer;
}

void ScriptedMessages::ShowOk(const std::string& text)
{
    shown.push_back(text);
    if (onShown) onShown(text);
    Next(Answer::Ok);
}

bool ScriptedMessages::AskYesNo(const std::string&, const std::string& text)
{
    shown.push_back(text);
    if (onShown) onShown(text);
    return Next(Answer::Yes) != Answer::No;
}

void RecordedSound::Open(int channel, const std::string& fileName)
{
    if (channel >= 0 && static_cast<size_t>(channel) < files.size()) files[static_cast<size_t>(channel)] = fileName;
}

}  // namespace kr::ui
