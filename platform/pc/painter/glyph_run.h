/// Glyphs of one font that are drawn at once, and the images that show all of them.
#pragma once

#include <pango/pango.h>

#include <vector>

#include "painter/glyph_images.h"

namespace brimol::pc {

/// A run of glyphs. Cairo puts each on the nearest whole pixel. Where no pixel belongs to two of
/// them, it is all the same whether cairo lays each over the picture or adds all of them up first.
/// It adds up if the outlines of any two come near each other; so where two glyphs share a pixel,
/// and cairo plainly adds up those two alone, it adds up in the whole run, and one image has their
/// sum. In the few other cases there are no images. One thread uses it, for one run after the
/// other.
class GlyphRun {
 public:
  /// The images outlive the run.
  explicit GlyphRun(GlyphImages& images) : known(images) {}

  /// Starts a run without glyphs.
  void begin(PangoFont* font);

  /// `x` and `y` in Pango units from the line's left end and baseline.
  void add(PangoGlyph glyph, int x, int y);

  /// What shows the glyphs that were added. False where cairo must draw them.
  bool resolve();

  /// After resolve(): images that share no pixel. They last as long as the images that are kept.
  const std::vector<PlacedImage>& images() const { return shown; }

 private:
  // An image at its place. One that is a sum shows several glyphs.
  struct Part {
    PlacedImage placed;
    std::size_t number;  // of the first glyph
    PixelPlace steps;    // where that one's origin lies
  };

  static GlyphImages::Pair pairOf(const Part& part, const Part& other);
  bool separate(Part& part);
  bool join(Part& part, const Part& other);
  GlyphImages::Sum addUp(const Part& part, const Part& other) const;

  PangoFont* face = nullptr;
  GlyphImages& known;
  std::vector<PlacedGlyph> glyphs;
  std::vector<std::size_t> owners;  // by glyph: the number of the part that shows it
  std::vector<Part> parts;
  std::vector<Part> separated;  // of the first ones, those that share no pixel
  std::vector<PlacedImage> shown;
};

}  // namespace brimol::pc
