#include "painter/glyph_run.h"

#include <algorithm>
#include <cmath>

#include "painter/blend.h"

namespace brimol::pc {

namespace {

constexpr int kFull = 255;

int nearestPixel(int units) { return PANGO_PIXELS_FLOOR(units + PANGO_SCALE / 2); }

// Cairo's own: a 256th of a pixel, halves to the even one.
int nearestStep(int units) {
  constexpr double kStep = 4;
  static_assert(PANGO_SCALE == 256 * kStep);
  return static_cast<int>(std::lrint(units / kStep));
}

PixelPlace operator-(const PixelPlace& one, const PixelPlace& other) {
  return {one.x - other.x, one.y - other.y};
}

Pixels around(const Pixels& one, const Pixels& other) {
  const int left = std::min(one.x, other.x);
  const int top = std::min(one.y, other.y);
  return {left, top, std::max(one.x + one.width, other.x + other.width) - left,
          std::max(one.y + one.height, other.y + other.height) - top};
}

// Images on one sheet of paper: by adding up, and by laying one over the other.
struct Sheet {
  explicit Sheet(const Pixels& bounds)
      : area(bounds),
        sum(static_cast<std::size_t>(bounds.width) * static_cast<std::size_t>(bounds.height)),
        over(sum) {}

  void put(const PlacedImage& placed) {
    for (int y = 0; y < placed.image->area().height; ++y) {
      const int first = (placed.corner.y - area.y + y) * area.width + placed.corner.x - area.x;
      for (const CoveredGroup& group : placed.image->row(static_cast<std::size_t>(y))) {
        putGroup(static_cast<std::size_t>(first) + group.x, group);
      }
    }
  }

  void putGroup(std::size_t place, const CoveredGroup& group) {
    for (const uint8_t share : group.coverage) {
      if (share != 0) putPixel(place, share);
      ++place;
    }
  }

  void putPixel(std::size_t place, uint8_t more) {
    const int left = (kFull - over[place]) * (kFull - more);
    over[place] = static_cast<uint8_t>(kFull - overFull(static_cast<uint16_t>(left + kHalf)));
    sum[place] = static_cast<uint8_t>(std::min(sum[place] + more, kFull));
  }

  Pixels area;
  std::vector<uint8_t> sum;
  std::vector<uint8_t> over;
};

bool isKeepable(const Pixels& area) {
  constexpr int64_t kMostPixels = int64_t{1} << 19;  // of a sum, which would fill what is kept
  return area.width <= GlyphImage::kMostWidth && int64_t{area.width} * area.height <= kMostPixels;
}

}  // namespace

void GlyphRun::begin(PangoFont* font) {
  face = font;
  glyphs.clear();
  owners.clear();
  parts.clear();
  separated.clear();
  shown.clear();
}

void GlyphRun::add(PangoGlyph glyph, int x, int y) {
  GlyphImage& image = known.of(face, glyph);
  const Pixels& area = image.area();
  if (isEmpty(area)) return;
  const PixelPlace corner = {area.x + nearestPixel(x), area.y + nearestPixel(y)};
  parts.push_back({{&image, corner}, glyphs.size(), {nearestStep(x), nearestStep(y)}});
  owners.push_back(glyphs.size());
  glyphs.push_back(
      {glyph, static_cast<double>(x) / PANGO_SCALE, static_cast<double>(y) / PANGO_SCALE});
}

bool GlyphRun::resolve() {
  Pixels all = {};
  for (Part& part : parts) {
    const Pixels area = part.placed.area();
    if (!isEmpty(within(area, all)) && !separate(part)) return false;
    all = isEmpty(all) ? area : around(all, area);
    separated.push_back(part);
  }
  for (const Part& part : separated) shown.push_back(part.placed);
  return true;
}

// Adds the images that share pixels with this one to it. False where cairo may not add them up.
bool GlyphRun::separate(Part& part) {
  for (auto other = separated.begin(); other != separated.end();) {
    if (!sharePixels(part.placed, other->placed)) {
      ++other;
      continue;
    }
    if (!join(part, *other)) return false;
    other = separated.erase(other);
  }
  return true;
}

GlyphImages::Pair GlyphRun::pairOf(const Part& part, const Part& other) {
  return {part.placed.image, other.placed.image, other.placed.corner - part.placed.corner,
          other.steps - part.steps};
}

// Makes the part show the other one's glyphs as well.
bool GlyphRun::join(Part& part, const Part& other) {
  std::ranges::replace(owners, other.number, part.number);
  const GlyphImages::Pair pair = pairOf(part, other);
  GlyphImages::Sum* sum = known.sumOf(pair);
  if (sum == nullptr) sum = &known.keepSum(pair, addUp(part, other));
  if (!*sum) return false;
  const Pixels& area = (*sum)->area();
  part.placed = {&**sum, {part.placed.corner.x + area.x, part.placed.corner.y + area.y}};
  return true;
}

// Its place is counted from the part's corner.
GlyphImages::Sum GlyphRun::addUp(const Part& part, const Part& other) const {
  const Pixels area = around(part.placed.area(), other.placed.area());
  if (!isKeepable(area)) return std::nullopt;
  Sheet sheet(area);
  sheet.put(other.placed);
  sheet.put(part.placed);
  if (sheet.sum == sheet.over) return std::nullopt;
  std::vector<PlacedGlyph> both;
  for (std::size_t i = 0; i < glyphs.size(); ++i) {
    if (owners[i] == part.number) both.push_back(glyphs[i]);
  }
  if (coverageOf(face, both, area) != sheet.sum) return std::nullopt;
  const PixelPlace& corner = part.placed.corner;
  return GlyphImage(sheet.sum, {area.x - corner.x, area.y - corner.y, area.width, area.height});
}

}  // namespace brimol::pc
