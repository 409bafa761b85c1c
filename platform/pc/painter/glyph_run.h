/// Glyphs of one font that are drawn at once, and the mask of all of them.
#pragma once

#include <pango/pango.h>

#include <deque>
#include <optional>
#include <vector>

#include "painter/glyph_images.h"
#include "painter/line_mask.h"

namespace brimol::pc {

/// A run of glyphs. Cairo puts each on the nearest whole pixel. Where no pixel belongs to two of
/// them, it is all the same whether cairo lays each over the picture or adds all of them up first.
/// It adds up if the outlines of any two come near each other; so where two glyphs share a pixel,
/// and cairo plainly adds up those two alone, it adds up in the whole run, and the mask has their
/// sum. In the few other cases there is no mask. One thread uses it.
class GlyphRun {
 public:
  /// Both outlive the run.
  GlyphRun(PangoFont* font, GlyphImages& images) : face(font), known(images) {}

  /// `x` and `y` in Pango units from the line's left end and baseline.
  void add(PangoGlyph glyph, int x, int y);

  /// None where cairo must draw the glyphs. To be asked once.
  std::optional<LineMask> mask();

 private:
  // An image at its place. One that is a sum shows several glyphs.
  struct Placed {
    const GlyphImage* image;
    Pixels area;
    std::size_t number;  // of the first glyph
  };

  bool separate(Placed& image);
  bool addUp(Placed& image, const Placed& other);

  PangoFont* face;
  GlyphImages& known;
  std::vector<PlacedGlyph> glyphs;
  std::vector<std::size_t> owners;  // by glyph: the number of the image that shows it
  std::vector<Placed> placed;
  std::vector<Placed> apart;  // of the first ones, those that share no pixel
  std::deque<GlyphImage> sums;
};

}  // namespace brimol::pc
