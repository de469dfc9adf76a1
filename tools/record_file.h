#pragma once
#include <filesystem>
#include <optional>
#include <string>

#include "tools/record.h"

namespace kr::record {

// A sink that writes a recording to `file`, created afresh: whatever already lies at that name (a file, a
// link) is left alone and refused. Lines go straight to the system, so a crash keeps what was recorded; a
// failed write is reported once on stderr and ends the recording. Nothing, with the reason in `error`,
// when the file cannot be created.
std::optional<Recorder::Sink> RecordingFile(const std::filesystem::path& file, std::string& error);

}  // namespace kr::record
