#include "chooser.h"

#include <MW/main_list.h>
#include <MW/window.h>

#include <atomic>

#include "main_loop.h"
#include "place.h"

namespace gallery {

namespace {

constexpr int kNothing = -1;
constexpr int kBack = -2;
constexpr uint32_t kRowColor = 0xFF787878;  // as the list draws it
constexpr uint32_t kMarkColor = 0xFF1F4E8C;
constexpr int kRowPercent = 6;  // of the screen's height

// What the list's callbacks leave behind. Rows count from 1: the first has no height.
std::atomic<int> chosen = kNothing;
int markedRow = kNothing;  // dispatch thread, once the list is active

void mark(MW::MainList& list, int row) {
  if (row < 1) return;
  if (markedRow != kNothing) list.setBGColor(markedRow, kRowColor);
  markedRow = row;
  list.setBGColor(row, kMarkColor);
}

// The list does not draw a row that stands exactly at its top, where going up may bring it.
int moveUp(MW::MainList& list) {
  const int row = list.move_key_up(0);
  const MW::mouse_event aPixelDown = {0, 0, 0, 0, 0, 1};
  if (row != MW::MainList::kNotMoved) list.onHover(aPixelDown);
  return row;
}

void followKey(MW::kbd_event* event, MW::MainList* list) {
  switch (event->code) {
    case MW::kKeyDown: mark(*list, list->move_key_down(0)); break;
    case MW::kKeyUp: mark(*list, moveUp(*list)); break;
    case MW::kKeySelect: chosen = markedRow; break;
    case BRIMOL_CODE_BACK: chosen = kBack; break;
    default: break;
  }
}

void fill(MW::MainList& list, const std::vector<std::string>& rows) {
  const int height = atLeastMm(place(0, 0, 0, kRowPercent).h, kTouchMm);
  const SKIA_Text nothing = {};
  list.addIndex(MW::MainList::kDark, &nothing, 0);
  for (const std::string& row : rows) {
    const SKIA_Text text = words("   " + row, 0, SKIA_ALIGN_LEFT);
    list.addIndex(MW::MainList::kSelectable, &text, height);
  }
  list.initFinish();
}

}  // namespace

std::optional<std::size_t> choose(const std::string& title, const std::vector<std::string>& rows,
                                  std::size_t marked) {
  MW::MainList list((" " + title).c_str(), MW::MainList::kPlain);
  fill(list, rows);
  list.clickCallback = [](MW::mouse_event* event, MW::MainList* from) {
    chosen = from->position2index(*event);
  };
  list.keyPressCallback = followKey;
  chosen = markedRow = kNothing;
  mark(list, 1);
  for (std::size_t i = 0; i < marked; ++i) mark(list, list.move_key_down(0));
  list.setActive(1);
  runMainLoop([] { return chosen != kNothing; }, [] { MW::Window::show(); });
  if (chosen < 1) return {};
  return static_cast<std::size_t>(chosen - 1);
}

}  // namespace gallery
