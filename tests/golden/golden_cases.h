/// What the golden files show.
#pragma once

#include <MW/MW.h>

#include <span>

#include "pc/support/painting.h"

namespace brimol::pc {

struct Case {
  const char* name;  // of its files
  Size screen;       // pixels
  void (*draw)();    // into the frame that is recorded, while GetTicks() stands at kNow
};
inline std::ostream& operator<<(std::ostream& out, const Case& drawn) { return out << drawn.name; }
inline constexpr unsigned int kNow = 1000;  // milliseconds

/// First the canary: it tells whether this machine renders as the one that made the pictures did.
std::span<const Case> goldenCases();

}  // namespace brimol::pc
