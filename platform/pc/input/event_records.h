/// Builds the input records of fingers and keys.
#pragma once

#include <brimol/input.h>

namespace brimol::pc {

/// A position in screen pixels.
struct ScreenPoint {
  int x;
  int y;
  friend bool operator==(const ScreenPoint&, const ScreenPoint&) = default;
};

/// A record of type 4, 5, 6 or 18 without relative motion. Its state byte is 0 for an up, else 1.
/// `finger` is 0 to 255, `at` within 0 to 65535.
Event pointerRecord(BrimolEventType type, int finger, ScreenPoint at);

/// A record of type 24.
Event userRecord(uint32_t word1, uint32_t word2);

/// A record of type 2 or 3. Its state byte is 1 for a down, 0 for an up.
Event keyRecord(BrimolEventType type, uint32_t code);

}  // namespace brimol::pc
