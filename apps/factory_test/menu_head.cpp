#include "menu_head.h"

#include <MW/window.h>

#include <algorithm>
#include <string_view>

#include "language/language.h"
#include "layout.h"
#include "text_fit.h"

namespace factory_test {

namespace {

struct HeadLayout {
  SKIA_Rect title;
  SKIA_Rect hint;
  SKIA_Rect whose;
  SKIA_Rect count;
  SKIA_Rect line;
  SKIA_Rect bar;
  SKIA_Rect figures;
  Grid grid;
};

enum class Row { Shown, LeftOut };

constexpr Row rowFor(bool isThere) { return isThere ? Row::Shown : Row::LeftOut; }

// On a wide screen what is one above the other elsewhere stands side by side.
HeadLayout layOutHead(const SKIA_Rect& area, ScreenSize screen, Row whoseRow, Row lineRow) {
  const int gap = gapOf(screen);
  const bool isWide = isLandscape(screen);
  const auto [title, rest] = rowsOf<2>(area, 0, {2, 8});
  const SKIA_Rect body = {rest.x + 2 * gap, rest.y + gap / 2, rest.w - 4 * gap, rest.h - gap, 0};
  const int who = whoseRow == Row::Shown ? 4 : 0;
  const int line = lineRow == Row::Shown ? 4 : 0;
  const int second = std::max(who, line);  // row of a wide screen
  const auto [words, bar, figures] =
      rowsOf<3>(body, gap / 4, {isWide ? 4 + second : 8 + who + line, 1, isWide ? 6 : 8});
  if (isWide) {
    const auto [upper, lower] = rowsOf<2>(words, gap / 4, {4, second});
    const auto [hint, count] = columnsOf<2>(upper, gap, {1, 1});
    const auto [whose, sent] = columnsOf<2>(lower, gap, {1, 1});
    return {title, hint, whose, count, sent, bar, figures, {2, 3}};
  }
  const auto [hint, whose, count, sent] = rowsOf<4>(words, gap / 4, {4, who, 4, line});
  return {title, hint, whose, count, sent, bar, figures, {3, 2}};
}

struct LineWords {
  std::string words;
  Ink ink;
};

LineWords wordsOf(const LineStatus& line) {
  const auto count = static_cast<unsigned long>(std::max<std::int64_t>(line.waiting, 0));
  const std::string waiting =
      std::to_string(count) + trn(" verdict waits", " verdicts wait", count);
  if (!line.error.empty()) return {tr("Line out of reach: ") + waiting, kFailInk};
  if (count > 0) return {tr("Line: ") + waiting, kRowInk};
  return {tr("Line: all is sent"), kPassInk};
}

}  // namespace

int MenuHead::listMode() {
  constexpr int kLargeText = 36;  // pixels
  const ScreenSize screen = screenSize();
  const bool isTall = !isLandscape(screen) && textSize(screen) > kLargeText;
  return isTall ? MW::MainList::kExtended : MW::MainList::kPlain;
}

MenuHead::MenuHead() {
  const bool isTall = listMode() == MW::MainList::kExtended;
  rect = {0, 0, screenSize().width,
          isTall ? MW::MainList::kExtendedTitleHeight : MW::MainList::kTitleHeight,
          kPageInk.ground};
  setType(MW::kBaseLayer);
  MW::Window::registerWidget(this);
}

MenuHead::~MenuHead() { leaveLayers(); }

int MenuHead::show(unsigned int) {
  const ScreenSize screen = screenSize();
  const int size = textSize(screen);
  const HeadLayout place =
      layOutHead(rect, screen, rowFor(!progress.whose.empty()), rowFor(line.has_value()));
  skia_add_box_c(rect);
  skia_add_textbox_c(
      inColor(place.title, kHeadInk.ground),
      captionIn(place.title, tr("Factory test"), kHeadInk.text, percentOf(size, 120)));
  const auto put = [&](const SKIA_Rect& row, const std::string& words) {
    drawWords(row, words, kPageInk.text, leadingAlign(), size);
  };
  put(place.hint, tr("Choose a test, or Leave at the end."));
  if (!progress.whose.empty()) put(place.whose, progress.whose);
  put(place.count, progress.words());
  if (line) {
    const auto [words, ink] = wordsOf(*line);
    skia_add_textbox_c(inColor(place.line, ink.ground),
                       captionIn(place.line, words.c_str(), ink.text));
  }
  drawProgress(progress, place.bar);
  drawFigures(place.figures, place.grid);
  return 1;
}

// All in letters of one size, in which the longest has room, and the load whatever it is.
void MenuHead::drawFigures(const SKIA_Rect& area, const Grid& grid) const {
  constexpr std::string_view kLongestLoad = "Load 100.00 100.00 100.00";
  const std::array<const std::string*, 6> all = {&figures.battery,    &figures.charger,
                                                 &figures.brightness, &figures.address,
                                                 &figures.hostName,   &figures.load};
  const SKIA_Rect cell = cellOf(area, 0, grid, 0);
  const auto sizeOf = [&](std::string_view words) {
    const int size = textSize(screenSize());
    return fitted(words, size, cell.w, lineHeight(size)).size;
  };
  int size = sizeOf(kLongestLoad);
  for (const std::string* const each : all) size = std::min(size, sizeOf(*each));
  for (std::size_t i = 0; i < all.size(); ++i) {
    drawWords(cellOf(area, 0, grid, static_cast<int>(i)), *all.at(i), kPageInk.text, leadingAlign(),
              size);
  }
}

}  // namespace factory_test
