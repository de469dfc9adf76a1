#pragma once
#include <filesystem>
#include <string>
#include <vector>

namespace kr::sdl {

// A sound file decoded to the mixer's format (mono float at Voices::kRate); empty, with `problem` saying why,
// when it could not be. Only a regular file of modest size is read and opening never blocks, so a directory,
// a FIFO or a device named like a sound is refused like a missing file.
std::vector<float> LoadSound(const std::filesystem::path& file, std::string& problem);

}  // namespace kr::sdl
