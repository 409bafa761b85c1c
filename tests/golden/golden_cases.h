/// What the golden files show.
#pragma once

#include <MW/MW.h>
#include <brimol3_widget_test/picture.h>

#include <climits>
#include <functional>
#include <vector>

namespace brimol::test {

/// A part of a screen: from one row of pixels up to, without it, another one.
struct ShownRows {
  int top = 0;
  int bottom = INT_MAX;
};

struct Case {
  const char* name;            // of its files
  ScreenSize screen;           // pixels
  std::function<void()> draw;  // into the frame that is recorded; GetTicks() is kNow at first
  ShownRows view = {};         // what the picture shows
};
inline std::ostream& operator<<(std::ostream& out, const Case& drawn) { return out << drawn.name; }
inline constexpr unsigned int kNow = 1000;  // milliseconds

const std::vector<Case>& goldenCases();
/// The examples of the gallery.
std::vector<Case> galleryCases();

}  // namespace brimol::test
