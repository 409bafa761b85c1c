/// The platform's time: real, or moved by hand.
#pragma once

#include <cstdint>

namespace brimol::pc {

/// Counts milliseconds in 32 bits and wraps after 49.7 days. Not guarded: InputService is.
class Clock {
 public:
  uint32_t now() const;
  bool isByHand() const { return byHand; }

  /// Stops the clock at `start`. From here on only advance() moves it.
  void takeHand(uint32_t start);
  /// Moves the clock that is by hand. A real clock: nothing.
  void advance(uint32_t ms);
  /// Real time again, which goes on from where the hand left it. A real clock: nothing.
  void letGo();

 private:
  bool byHand = false;
  uint32_t handTime = 0;
  uint32_t offset = 0;  // what real time is ahead of the machine's own count
};

}  // namespace brimol::pc
