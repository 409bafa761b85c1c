/// A text in one size, laid out and ready to be drawn in any colour at any place.
#pragma once

#include <optional>
#include <span>
#include <string_view>
#include <vector>

#include "painter/glyph_run.h"
#include "painter/plain_shapes.h"
#include "painter/text_handles.h"

namespace brimol::pc {

/// What the letters of a text touch.
struct TextInk {
  Edges area = {0, 0, 0, 0};  // screen pixels
  bool isWhole = true;        // false: lines are left out for lack of height
};

/// Lines of text. One thread uses it.
class LaidText {
 public:
  /// What a text is made from, and what is learnt for others meanwhile. Asked during the call; the
  /// images of the run outlive the text.
  struct Sources {
    PangoContext* context;
    GlyphRun& run;
    PlainShapes& shapes;
  };
  LaidText(const Sources& sources, std::string_view words, int size);

  /// Draws what text_painter.h describes.
  void draw(const Canvas& canvas, const Edges& box, int align, Ink& ink, const Pixels& clip) const;

  /// What draw() may change: empty for a text without letters, and nothing where Pango draws.
  std::optional<Edges> drawnArea(const Edges& box, int align) const;

  /// Where the letters' outlines lie. Only for a text that Pango has shaped.
  TextInk ink(const Edges& box, int align) const;

  std::size_t bytes() const;

 private:
  // In pixels; downwards from the text's top.
  struct Line {
    int middle;
    int baseline;
    int width;
    bool isByPango;       // it draws the line, which has no images
    std::size_t end;      // of the line's images
    Pixels letters = {};  // where the outlines lie, from the line's left end and baseline
  };

  template <typename Visit>
  bool visit(const Edges& box, int align, Visit each) const;
  bool addPlainLine(const PlainShapes::Sheet& sheet, GlyphRun& run, std::string_view words);
  void addLine(PangoLayoutIter* iter, GlyphRun& run);
  bool addImages(const PangoLayoutLine& line, GlyphRun& run);
  std::span<const PlacedImage> imagesOf(std::size_t line) const;
  void drawByPango(const Canvas& canvas, std::size_t line, const PixelPlace& place, uint32_t color,
                   const Pixels& clip) const;

  TextLayout layout;  // null where no line needs it
  int height = 0;
  std::vector<Line> lines;
  std::vector<PlacedImage> images;  // line by line
};

}  // namespace brimol::pc
