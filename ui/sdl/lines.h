#pragma once
#include <functional>
#include <string>
#include <string_view>
#include <vector>

namespace kr::sdl {

// Width of a run of text in whatever unit the caller wraps in.
using Measure = std::function<int(std::string_view)>;

// The lines a label shows: broken at CR LF, LF and a lone CR and, when wrapWidth > 0, at spaces so each
// line fits. A word wider than the label keeps a line of its own; the spaces at a break are dropped, so
// centred and right-aligned lines sit true (SDL_ttf's own wrapping keeps them).
std::vector<std::string> SplitLines(std::string_view text, int wrapWidth, const Measure& measure);

}  // namespace kr::sdl
