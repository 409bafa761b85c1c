/// What the operator is told between two screens.
#pragma once

#include <cstdint>
#include <string>

#include "look.h"

namespace factory_test {

/// A screen of words that goes away by itself. Used on the main thread.
class Notice {
 public:
  /// `now`: GetTicks() milliseconds, which may wrap. `newVerdict` stands large on `newInk`; empty:
  /// none.
  Notice(std::string newTitle, std::string newVerdict, const Ink& newInk, std::string newWords,
         uint32_t now);

  /// Draws the whole screen.
  void draw() const;
  bool isOver(uint32_t now) const { return now - since >= kShownMs; }

 private:
  static constexpr uint32_t kShownMs = 2500;

  std::string title;
  std::string verdict;
  Ink ink;
  std::string words;
  uint32_t since;
};

}  // namespace factory_test
