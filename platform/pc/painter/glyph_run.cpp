#include "painter/glyph_run.h"

#include <algorithm>

#include "painter/blend.h"

namespace brimol::pc {

namespace {

constexpr int kFull = 255;

int nearestPixel(int units) { return PANGO_PIXELS_FLOOR(units + PANGO_SCALE / 2); }

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

  void put(const GlyphImage& image, const Pixels& at) {
    for (int y = 0; y < at.height; ++y) {
      const int first = (at.y - area.y + y) * area.width + at.x - area.x;
      for (const CoveredGroup& group : image.row(static_cast<std::size_t>(y))) {
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
    isShared = isShared || sum[place] != 0;
    sum[place] = static_cast<uint8_t>(std::min(sum[place] + more, kFull));
  }

  Pixels area;
  std::vector<uint8_t> sum;
  std::vector<uint8_t> over;
  bool isShared = false;  // a pixel is covered by two of them
};

}  // namespace

void GlyphRun::add(PangoGlyph glyph, int x, int y) {
  const GlyphImage& image = known.of(face, glyph);
  if (isEmpty(image.area())) return;
  Pixels area = image.area();
  area.x += nearestPixel(x);
  area.y += nearestPixel(y);
  placed.push_back({&image, area, glyphs.size()});
  owners.push_back(glyphs.size());
  glyphs.push_back(
      {glyph, static_cast<double>(x) / PANGO_SCALE, static_cast<double>(y) / PANGO_SCALE});
}

std::optional<LineMask> GlyphRun::mask() {
  Pixels all = {};
  for (Placed& each : placed) {
    if (!isEmpty(within(each.area, all)) && !separate(each)) return std::nullopt;
    all = isEmpty(all) ? each.area : around(all, each.area);
    apart.push_back(each);
  }
  if (all.width > LineMask::kMostWidth) return std::nullopt;
  std::vector<LineMask::Part> parts;
  parts.reserve(apart.size());
  for (const Placed& each : apart) parts.push_back({each.image, each.area});
  return LineMask(parts, all);
}

// Adds the images that share pixels with this one to it. False where cairo may not add them up.
bool GlyphRun::separate(Placed& image) {
  for (auto other = apart.begin(); other != apart.end();) {
    const bool isNear = !isEmpty(within(image.area, other->area));
    const std::size_t before = sums.size();
    if (isNear && !addUp(image, *other)) return false;
    other = sums.size() == before ? other + 1 : apart.erase(other);
  }
  return true;
}

bool GlyphRun::addUp(Placed& image, const Placed& other) {
  Sheet sheet(around(image.area, other.area));
  sheet.put(*other.image, other.area);
  sheet.put(*image.image, image.area);
  if (!sheet.isShared) return true;
  std::vector<PlacedGlyph> both;
  for (std::size_t i = 0; i < glyphs.size(); ++i) {
    if (owners[i] == other.number) owners[i] = image.number;
    if (owners[i] == image.number) both.push_back(glyphs[i]);
  }
  if (sheet.sum == sheet.over || coverageOf(face, both, sheet.area) != sheet.sum) return false;
  image = {&sums.emplace_back(sheet.sum, sheet.area), sheet.area, image.number};
  image.area = image.image->area();
  return true;
}

}  // namespace brimol::pc
