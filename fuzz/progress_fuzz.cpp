// libFuzzer target for the progress-file reader: any bytes at all must parse without fault, and whatever was
// read must come back unchanged through the game's own format.
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

#include "shell/progress_text.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    kr::Progress read;
    const int count = kr::ParseProgress(std::string_view(reinterpret_cast<const char*>(data), size), read);
    if (count < 0 || count > 8) std::abort();
    const std::string written = kr::FormatProgress(read);
    kr::Progress again;
    if (kr::ParseProgress(written, again) != 8 || kr::FormatProgress(again) != written) std::abort();
    return 0;
}
