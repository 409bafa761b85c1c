/// What the golden files show.
#pragma once

#include <MW/MW.h>
#include <brimol3_widget_test/picture.h>

#include <span>

namespace brimol::test {

struct Case {
  const char* name;   // of its files
  ScreenSize screen;  // pixels
  void (*draw)();     // while GetTicks() stands at kNow
};
inline std::ostream& operator<<(std::ostream& out, const Case& drawn) { return out << drawn.name; }
inline constexpr unsigned int kNow = 1000;  // milliseconds

std::span<const Case> goldenCases();

}  // namespace brimol::test
