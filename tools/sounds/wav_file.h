#pragma once
#include <filesystem>
#include <vector>

namespace kr::sounds {

// Writes 16-bit PCM mono at kRate. Returns false if the file could not be written whole.
bool WriteWav(const std::filesystem::path& file, const std::vector<float>& samples);

}  // namespace kr::sounds
