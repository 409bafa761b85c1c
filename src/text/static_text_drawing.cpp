#include <MW/static_text.h>

#include <algorithm>

#include "core/bounded_text.h"
#include "core/geometry.h"
#include "text/text_parts.h"

namespace MW {

namespace {

constexpr uint32_t kMatchColor = kColorRed;
constexpr int kMarginParts = 35;     // of the width and the height
constexpr int kNumberWidth = 4;      // font sizes
constexpr int kBarWidthParts = 25;   // of the width
constexpr int kBarHeightParts = 50;  // of the height, at least
constexpr int kHighestNumber = 99999;
constexpr Padding kNumberPadding = {'0', 5};

void drawText(const SKIA_Rect& place, SKIA_Text record, std::string_view words) {
  putText(record, words);
  skia_add_label_c(place, record);
}

}  // namespace

int StaticText::show(unsigned int) {
  const std::lock_guard guard(stateLock);
  skia_add_box_c(rect);
  if (is_setting == 1) {
    drawPlaceholder();
    return 1;
  }
  drawRows();
  if (is_scroll && line_count > 0 && rowsBeyondView() > 0) drawScrollBar();
  return 1;
}

// The row at so many pixels below the first one; its words begin behind the numbers or at once.
SKIA_Rect StaticText::rowPlace(Column column, int64_t down) const {
  const int64_t shift =
      column == Column::Words && is_line_num ? int64_t{kNumberWidth} * text.size : 0;
  return makeRect(int64_t{rect.x} + rect.w / kMarginParts + shift,
                  int64_t{rect.y} + rect.h / kMarginParts + down, rect.w, text.size, rect.color);
}

void StaticText::drawPlaceholder() const {
  if (is_line_num) drawText(rowPlace(Column::Number, 0), num_text, "00001: ");
  drawText(rowPlace(Column::Words, 0), text, "no log");
}

void StaticText::drawRows() {
  const int64_t end = std::min(int64_t{top_index} + h_count, int64_t{last_index} + 1);
  int64_t down = 0;
  SKIA_Text words = text;
  for (int64_t row = std::max(top_index, 0); row < end; ++row) {
    const int number = lines.number(row);
    if (is_line_num && number != TextLines::kContinued) {
      drawNumber(number, down);
      highlight = 0;
    }
    // Only a line number ends the red: without numbers it goes on, in later frames too.
    if (is_search_mark && std::ranges::binary_search(found_lines, number)) highlight = 1;
    words.color = is_search_mark && highlight == 1 ? kMatchColor : text.color;
    putText(words, lines.text(row));
    skia_add_label_c(rowPlace(Column::Words, down), words);
    down += text.size;
  }
}

void StaticText::drawNumber(int lineNumber, int64_t down) const {
  SKIA_Text record = num_text;
  putNumber(record, std::min(lineNumber, kHighestNumber), kNumberPadding, ":");
  skia_add_label_c(rowPlace(Column::Number, down), record);
}

void StaticText::drawScrollBar() {
  const int width = rect.w / kBarWidthParts;
  const int64_t height =
      toPixels(std::max(int64_t{rect.h} * h_count / line_count, int64_t{rect.h / kBarHeightParts}));
  const int64_t down = (rect.h - height) * top_index / rowsBeyondView();
  scroll_bar = makeRect(int64_t{rect.x} + rect.w - int64_t{width} * 3 / 2, rect.y + down, width,
                        height, kPanelGrey);
  skia_add_box_c(scroll_bar);
}

}  // namespace MW
