/// What the plays of dialogs have in common.
#pragma once

#include <MW/dialog_list.h>

#include <brimol3_widget_test/drawings.h>
#include "support/play_test.h"

namespace brimol::test {

/// Makes a page or dialog with callbacks of its own in place of the base's, which are heard.
template <typename Own, typename... Arguments>
Maker makesOwn(Arguments... arguments) {
  return [=] {
    auto made = makes<Own>(arguments...)();
    auto& own = static_cast<Own&>(*made);
    own.touchPressCallback = [](MW::mouse_event* mouse) { noteTouch("touch", mouse); };
    own.touchReleaseCallback = [](MW::mouse_event* mouse) { noteTouch("lift", mouse); };
    own.keyPressCallback = [](MW::kbd_event* key) { note("down" + std::to_string(key->code)); };
    own.keyReleaseCallback = [](MW::kbd_event* key) { note("up" + std::to_string(key->code)); };
    return made;
  };
}

template <char target>
void noteRow(int* row) {  // NOLINT(readability-non-const-parameter): a callback's type
  note((stage.widget->isActive() ? "" : "hidden ") + std::string(1, target) + std::to_string(*row));
}
/// A list of three rows, the second of which is confirmed and marked.
inline std::unique_ptr<MW::Widget> threeRows() {
  auto made = makes<MW::DialogList>("Title")();
  auto& list = static_cast<MW::DialogList&>(*made);
  while (list.addIndex("row") < 2) continue;
  list.initFinish(1);
  list.rowPressCallback = noteRow<'r'>;
  list.button1Callback = noteRow<'c'>;  // CANCEL
  list.button2Callback = noteRow<'o'>;  // OK
  return made;
}

/// How many boxes are highlighted.
inline Step lookAtFaces() {
  return look([](MW::Widget& widget) {
    const auto isLit = [](const Drawing& each) { return each.rect.color == MW::kColorHighlight; };
    return "lit " + std::to_string(std::ranges::count_if(shown(widget), isLit));
  });
}
inline Step lcdOn(int on) { return call(&MW::Widget::lcdOn, on); }
inline Step hide() { return call(&MW::Widget::hide); }

inline const std::string kTooLong(128, 'x');

}  // namespace brimol::test
