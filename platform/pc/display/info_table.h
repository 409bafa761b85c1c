/// Tables of words on a dark panel.
#pragma once

#include <cairo.h>

#include <vector>

#include "input/keymap.h"
#include "painter/fonts.h"
#include "scene/geometry.h"

namespace brimol::pc {

/// Two columns, the second of which is wrapped, laid out to fit into a room in pixels. A row
/// without words is a gap. Lives no longer than the fonts.
class InfoTable {
 public:
  /// In letters of `letter` pixels, or of fewer where the room is too small for them.
  InfoTable(Fonts& fonts, const std::vector<HelpRow>& rows, int letter, Size room);

  /// Of the panel.
  Size size() const { return extent; }
  void draw(cairo_t* context, int left, int top) const;

 private:
  struct Row {
    TextLayout label;
    TextLayout meaning;
    int height;
  };

  void layOut(Fonts& fonts, const std::vector<HelpRow>& rows, int width);

  int letter;  // pixels
  int labelWidth = 0;
  std::vector<Row> lines;
  Size extent = {};
};

}  // namespace brimol::pc
