#include "notice.h"

#include <brimol/scene.h>

#include <utility>

#include "layout.h"

namespace factory_test {

Notice::Notice(std::string newTitle, std::string newVerdict, const Ink& newInk,
               std::string newWords, uint32_t now)
    : title(std::move(newTitle)),
      verdict(std::move(newVerdict)),
      ink(newInk),
      words(std::move(newWords)),
      since(now) {}

void Notice::draw() const {
  constexpr int kLargePercent = 120;
  constexpr int kHugePercent = 300;
  const ScreenSize screen = screenSize();
  const int size = textSize(screen);
  const SKIA_Rect whole = {0, 0, screen.width, screen.height, kPageInk.ground};
  skia_add_box_c(whole);
  const auto [above, head, face, lines, under] =
      rowsOf<5>(within(whole, 2 * gapOf(screen)), gapOf(screen), {2, 1, 2, 4, 2});
  drawWords(head, title, kPageInk.text, SKIA_ALIGN_CENTRE, percentOf(size, kLargePercent));
  if (!verdict.empty()) {
    skia_add_textbox_c(inColor(face, ink.ground),
                       captionIn(face, verdict.c_str(), ink.text, percentOf(size, kHugePercent)));
  }
  drawWords(lines, words, kPageInk.text, SKIA_ALIGN_CENTRE, size);
}

}  // namespace factory_test
