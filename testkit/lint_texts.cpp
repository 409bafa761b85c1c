#include <algorithm>
#include <array>
#include <cmath>
#include <iomanip>
#include <optional>
#include <sstream>

#include "lint_view.h"
#include "scene/item.h"

namespace brimol::test {

namespace {

using pc::Edges;

constexpr double kSmallestTextMm = 1.5;
constexpr double kEdgeMm = 0.5;
constexpr double kTouchMm = 0.2;  // by which letters of two texts may reach into each other
constexpr double kContrast = 3;

int64_t widthOf(const Edges& edges) { return edges.right - edges.left; }

std::string quoted(const std::string& text) { return '"' + text + '"'; }

// A colour by its channels, 0 to 1.
using Color = std::array<double, 3>;

Color colorOf(uint32_t word) {
  constexpr double kMost = 255;
  constexpr uint32_t kByte = 0xFF;
  return {(word >> 16 & kByte) / kMost, (word >> 8 & kByte) / kMost, (word & kByte) / kMost};
}

Color over(uint32_t word, const Color& below) {
  constexpr double kMost = 255;
  const double share = pc::alphaOf(word) / kMost;
  Color mixed = colorOf(word);
  for (std::size_t i = 0; i < mixed.size(); ++i)
    mixed[i] = mixed[i] * share + below[i] * (1 - share);
  return mixed;
}

// The relative luminance of an sRGB colour.
double luminanceOf(const Color& color) {
  const auto linear = [](double channel) {
    return channel <= 0.04045 ? channel / 12.92 : std::pow((channel + 0.055) / 1.055, 2.4);
  };
  return 0.2126 * linear(color[0]) + 0.7152 * linear(color[1]) + 0.0722 * linear(color[2]);
}

double contrastOf(const Color& one, const Color& other) {
  constexpr double kGlare = 0.05;
  const auto [dark, light] = std::minmax({luminanceOf(one), luminanceOf(other)});
  return (light + kGlare) / (dark + kGlare);
}

// What lies below the middle of the letters. Nothing: a picture, or what cannot be told.
std::optional<Color> groundBelow(const View& view, const SeenText& seen) {
  const pc::Pixels middle = {static_cast<int>((seen.ink.left + seen.ink.right) / 2),
                             static_cast<int>((seen.ink.top + seen.ink.bottom) / 2), 1, 1};
  Color ground = {0, 0, 0};
  for (std::size_t i = 0; i <= seen.item; ++i) {
    const SKIA_Item& item = view.item(i);
    if (!pc::covers(pc::edgesOf(item.rect), middle)) continue;
    if (pc::figureOf(item) == pc::Figure::Picture) return {};
    if (pc::groundOf(item) != pc::Ground::None) ground = over(item.rect.color, ground);
  }
  return ground;
}

void lintContrast(const View& view, const SeenText& seen, Findings& findings) {
  const auto ground = groundBelow(view, seen);
  if (!ground) return;
  const double contrast = contrastOf(over(view.item(seen.item).text.color, *ground), *ground);
  if (contrast >= kContrast) return;
  std::ostringstream detail;
  detail << std::fixed << std::setprecision(1) << contrast << " to 1, at least 3 to 1 wanted";
  findings.add(Check::Contrast, view, seen.item, detail.str());
}

void lintSize(const View& view, const SeenText& seen, const Scale& scale, Findings& findings) {
  const int size = pc::textSizeOf(view.item(seen.item).text);
  if (scale.mm(size) >= kSmallestTextMm) return;
  findings.add(Check::SmallText, view, seen.item,
               scale.text(size) + " high, at least 1.5 mm wanted");
}

void lintCut(const View& view, const SeenText& seen, Findings& findings) {
  const int64_t lost = widthOf(seen.whole.area) - widthOf(seen.ink);
  if (!seen.whole.isWhole) {
    findings.add(Check::Cut, view, seen.item, "lines of it find no room");
  } else if (lost > 1) {  // where letters are placed is rounded
    findings.add(Check::Cut, view, seen.item,
                 std::to_string(lost) + " of " + std::to_string(widthOf(seen.whole.area)) +
                     " pixels of its width find no room");
  }
}

void lintPlace(const View& view, const SeenText& seen, const Scale& scale, Findings& findings) {
  const Edges screen = pc::edgesOf(pc::wholeOf(scale.screen));
  const Edges& ink = seen.ink;
  const bool isInside = ink.left >= screen.left && ink.right <= screen.right &&
                        ink.top >= screen.top && ink.bottom <= screen.bottom;
  if (!isInside) {
    findings.add(Check::OffScreen, view, seen.item, "a part of it is not on the screen");
    return;
  }
  findings.addGood(Check::OffScreen, view, seen.item);
  const auto gap = static_cast<double>(std::min(ink.left, screen.right - ink.right));
  if (scale.mm(gap) < kEdgeMm) {
    findings.add(Check::AtEdge, view, seen.item, scale.text(gap) + " from the edge of the screen");
  }
}

// By how much the two reach into each other, at its narrowest; not positive: not at all.
int64_t overlapOf(const Edges& one, const Edges& other) {
  return std::min(std::min(one.right, other.right) - std::max(one.left, other.left),
                  std::min(one.bottom, other.bottom) - std::max(one.top, other.top));
}

// What of the text is touched or hidden by what is drawn later. Empty: nothing.
std::string whatOverlaps(const View& view, const SeenText& seen, const Scale& scale) {
  const auto touches = [&](const Edges& other) {
    const int64_t depth = overlapOf(seen.ink, other);
    return depth > 1 && scale.mm(static_cast<double>(depth)) > kTouchMm;
  };
  for (const SeenText& later : view.texts) {
    if (later.item > seen.item && touches(later.ink)) return "overlaps " + quoted(later.text);
  }
  for (std::size_t i = seen.item + 1; i < view.frame().size(); ++i) {
    const SKIA_Item& item = view.item(i);
    const bool isBox = pc::groundOf(item) != pc::Ground::None && pc::alphaOf(item.rect.color) != 0;
    if (isBox && touches(pc::edgesOf(item.rect)))
      return "partly hidden by " + quoted(view.nameOf(i));
  }
  return {};
}

void lintOverlap(const View& view, const SeenText& seen, const Scale& scale, Findings& findings) {
  const std::string what = whatOverlaps(view, seen, scale);
  if (what.empty()) {
    findings.addGood(Check::Overlap, view, seen.item);
  } else {
    findings.add(Check::Overlap, view, seen.item, what);
  }
}

}  // namespace

void lintTexts(const View& view, const Scale& scale, Findings& findings) {
  for (const SeenText& seen : view.texts) {
    lintCut(view, seen, findings);
    lintOverlap(view, seen, scale, findings);
    lintPlace(view, seen, scale, findings);
    lintSize(view, seen, scale, findings);
    lintContrast(view, seen, findings);
  }
}

}  // namespace brimol::test
