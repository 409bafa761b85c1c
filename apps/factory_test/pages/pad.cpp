// The multi-touch pad: every cell can be held by a finger of its own.
#include <MW/button8.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <bitset>
#include <memory>
#include <optional>
#include <string>

#include "button_row.h"
#include "current.h"
#include "language/language.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"

namespace factory_test {

namespace {

constexpr std::size_t kFingers = 2;  // that must have been down at once
constexpr int kLayouts = MW::Button8::kTwoByFour + 1;

/// Tells which cells are held. The button, or the up key, changes the layout.
class PadTest : public PageTest {
 public:
  PadTest()
      : PageTest(tr("Multi-touch pad"), tr("Hold the cells with several fingers at once.\n"
                                           "The button, or key up: the next layout.")) {}

  void enter() override {
    page.ask().otherKey = [](unsigned int code) {
      if (code == MW::kKeyUp) self().nextLayout();
    };
    const SKIA_Rect area = padArea();
    const SKIA_Text unused = {};
    pad.emplace(layout.load(), &area, &unused);
    pad->pressCallback = [](MW::mouse_event* mouse) { self().tell(mouse->state); };
    pad->clickCallback = [](MW::mouse_event* mouse) { self().tell(mouse->state); };
    pad->setActive(1);
    changer.emplace(rows().front(), kFaces);
  }

  bool isComplete() const override { return heldAtOnce >= kFingers; }

  void leave() override {
    changer.reset();
    pad.reset();
    page.endAsking();
  }

 private:
  static const std::array<ButtonRow::Face, 1> kFaces;

  static PadTest& self() { return Current<PadTest>::get(); }

  // Not wider than high: a single row of cells is as high as its width says.
  static SKIA_Rect padArea() {
    const SKIA_Rect row = rows().back();
    const int side = std::min(row.w, row.h);
    return {row.x + (row.w - side) / 2, row.y, side, row.h, kRowInk.ground};
  }

  static std::array<SKIA_Rect, 2> rows() {
    return rowsOf<2>(contentArea(), gapOf(screenSize()), {1, 7});
  }

  void nextLayout() {
    layout = (layout + 1) % kLayouts;
    const SKIA_Rect area = padArea();
    pad->hide();  // frees the cells
    pad->setRect(layout, &area);
    pad->setActive(1);
    tell(0);
  }

  void tell(uint32_t mask) {
    const std::bitset<MW::Button8::kCells> held(mask);
    heldAtOnce = std::max(heldAtOnce.load(), held.count());
    const std::string cells = held.to_string();
    page.say((tr("Layout ") + std::to_string(layout) + tr(", held ") + cells).c_str());
  }

  Current<PadTest> current{this};
  std::atomic<int> layout = MW::Button8::kOneCell;
  std::atomic<std::size_t> heldAtOnce = 0;  // the most cells so far
  std::optional<MW::Button8> pad;
  std::optional<ButtonRow> changer;
};

const std::array<ButtonRow::Face, 1> PadTest::kFaces = {{
    {msg("Next layout"), [](int) { self().nextLayout(); }},
}};

}  // namespace

std::unique_ptr<Test> makePad(const Context&) { return std::make_unique<PadTest>(); }

}  // namespace factory_test
