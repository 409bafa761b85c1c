// Calls of an application in any order: widgets of every class are made, set, registered, left,
// drawn, touched and deleted, also by callbacks, while time passes, jumps and wraps.

#include <MW/c_api.h>
#include <MW/event_service.h>
#include <MW/widget_list.h>
#include <MW/window.h>

#include <array>
#include <string>

#include "stage.h"

namespace {

using brimol::fuzz::FuzzStage;
using brimol::test::Arguments;
using MW::WidgetList;
using MW::Window;

// A call of the table of display items.
void callItems(Arguments& from) {
  const int index = from.take<int>();
  switch (from.below(12)) {
    case 0: WidgetList::init(); break;
    case 1: WidgetList::destroy(); break;
    case 2:
      MWWList_addQueue_c(index, from.take<const SKIA_Rect*>(), from.take<const SKIA_Point*>(),
                         from.take<const SKIA_Text*>());
      break;
    case 3: WidgetList::remove(index); break;
    case 4: WidgetList::show(); break;
    case 5: WidgetList::show(index); break;
    case 6: WidgetList::hide(index); break;
    case 7: {
      const std::string text = from.bytes();
      WidgetList::setText(index, text.c_str(), static_cast<unsigned int>(text.size()));
      break;
    }
    case 8: WidgetList::setRect(index, from.take<SKIA_Rect>()); break;
    case 9: {
      const auto text = from.take<unsigned int>();
      const auto fill = from.take<unsigned int>();
      WidgetList::setColor(index, text, fill, from.take<unsigned int>());
      break;
    }
    case 10: WidgetList::setFontSize(index, from.take<int>()); break;
    default: WidgetList::hideShadow(); break;
  }
}

// One thing that an application does to its widgets, in its loop or in a callback.
void changeWidgets(FuzzStage& stage, Arguments& from) {
  const std::size_t place = from.below(FuzzStage::kPlaces);
  switch (from.below(6)) {
    case 0: stage.make(place); break;
    case 1: stage.remove(place); break;
    case 2: Window::registerWidget(stage.at(place)); break;
    case 3: Window::unregisterWidget(stage.at(place)); break;
    case 4: stage.wait(); break;
    default:
      if (stage.at(place) != nullptr) stage.at(place)->hide();
  }
}

void step(FuzzStage& stage, Arguments& from) {
  switch (from.below(8)) {
    case 0: changeWidgets(stage, from); break;
    case 1:
    case 2: stage.operate(from.below(FuzzStage::kPlaces)); break;
    case 3: stage.dispatchRecord(); break;
    case 4: stage.dispatchTouch(); break;
    case 5: stage.wait(); break;
    case 6: FuzzStage::round(); break;
    default: callItems(from); break;
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, std::size_t count) {
  Arguments from({bytes, count});
  FuzzStage stage(from);
  brimol::test::whenTold = [&] {
    if (from.byte() % 2 != 0) changeWidgets(stage, from);
  };
  while (!from.isAtEnd()) {
    step(stage, from);
    from.forget();
  }
  return 0;
}
