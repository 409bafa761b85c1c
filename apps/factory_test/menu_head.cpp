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
  SKIA_Rect count;
  SKIA_Rect bar;
  SKIA_Rect figures;
  Grid grid;
};

// On a wide screen what is one above the other elsewhere stands side by side.
HeadLayout layOutHead(const SKIA_Rect& area, ScreenSize screen) {
  const int gap = gapOf(screen);
  const auto [title, rest] = rowsOf<2>(area, 0, {isLandscape(screen) ? 3 : 2, 8});
  const SKIA_Rect body = {rest.x + 2 * gap, rest.y + gap / 2, rest.w - 4 * gap, rest.h - gap, 0};
  if (isLandscape(screen)) {
    const auto [words, bar, figures] = rowsOf<3>(body, gap / 4, {4, 1, 5});
    const auto [hint, count] = columnsOf<2>(words, gap, {1, 1});
    return {title, hint, count, bar, figures, {2, 3}};
  }
  const auto [hint, count, bar, figures] = rowsOf<4>(body, gap / 4, {4, 4, 1, 8});
  return {title, hint, count, bar, figures, {3, 2}};
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
  const HeadLayout place = layOutHead(rect, screen);
  skia_add_box_c(rect);
  skia_add_textbox_c(
      inColor(place.title, kHeadInk.ground),
      textOf(tr("Factory test"), kHeadInk.text, SKIA_ALIGN_CENTRE, percentOf(size, 120)));
  const auto put = [&](const SKIA_Rect& row, const std::string& words) {
    drawWords(row, words, kPageInk.text, leadingAlign(), size);
  };
  put(place.hint, tr("Choose a test, or Leave at the end."));
  put(place.count, progress.words());
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
