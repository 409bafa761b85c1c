#include "listeners.h"

#include <MW/MW.h>

namespace brimol::test {

std::function<void()> whenTold;

namespace {

// Becomes a function of whatever type a callback has.
struct Teller {
  template <typename... Told>
  using Function = void (*)(Told...);
  template <typename... Told>
  operator Function<Told...>() const {  // NOLINT(google-explicit-constructor): assigned
    return told<Told...>;
  }
};
constexpr Teller kTeller;

// The words that do not mean the same in all classes.
template <typename Touched>
void listenToTouches(MW::Widget& widget) {
  widget.pressCallback = widget.clickCallback = widget.longPressCallback = told<Touched>;
}

template <typename Panel>
void listenToPanel(MW::Widget& widget) {
  auto& own = static_cast<Panel&>(widget);
  own.press_cb = own.release_cb = own.long_press_cb = own.double_tap_cb = kTeller;
}

}  // namespace

void listenToBase(MW::Widget& widget) {
  listenToTouches<MW::mouse_event*>(widget);
  widget.hoverCallback = widget.touchPressCallback = widget.touchReleaseCallback =
      told<MW::mouse_event*>;
  widget.doubleClickCallback = widget.button1Callback = widget.button2Callback =
      widget.hookKeyCallback = widget.leftCallback = widget.rightCallback = widget.exitCallback =
          told<int>;
  widget.keyPressCallback = widget.keyReleaseCallback = widget.plugCallback =
      widget.doubleKeyCallback = widget.tripleKeyCallback = told<MW::kbd_event*>;
  widget.rowPressCallback = told<int*>;
}

void listenToButton(MW::Widget& widget) {
  listenToBase(widget);
  listenToTouches<int>(widget);
}
void listenToSlide(MW::Widget& widget) {
  listenToBase(widget);
  widget.doubleClickCallback = told<MW::mouse_event*>;
}
void listenToDialogList(MW::Widget& widget) {
  listenToBase(widget);
  widget.button1Callback = widget.button2Callback = told<int*>;
}
void listenToDialogSlide(MW::Widget& widget) {
  auto& own = static_cast<MW::DialogSlide&>(widget);
  own.leftCallback = own.rightCallback = kTeller;
  own.keyPressCallback = own.keyReleaseCallback = kTeller;
  own.touchPressCallback = own.touchReleaseCallback = own.hoverCallback = kTeller;
}
void listenToDialogSelect(MW::Widget& widget) {
  listenToBase(widget);
  auto& own = static_cast<MW::DialogSelect&>(widget);
  own.choiceCallback = own.touchPressCallback = own.touchReleaseCallback = kTeller;
  own.keyPressCallback = own.keyReleaseCallback = kTeller;
}
void listenToColorPage(MW::Widget& widget) {
  auto& own = static_cast<MW::ColorPage&>(widget);
  own.touchPressCallback = own.touchReleaseCallback = kTeller;
  own.keyPressCallback = own.keyReleaseCallback = kTeller;
  own.doubleKeyCallback = own.tripleKeyCallback = kTeller;
}
void listenToMainList(MW::Widget& widget) {
  auto& own = static_cast<MW::MainList&>(widget);
  own.clickCallback = own.pressCallback = own.releaseCallback = own.scrollCallback = kTeller;
  own.keyPressCallback = own.keyReleaseCallback = kTeller;
}
void listenToMpdWid(MW::Widget& widget) {
  auto& own = static_cast<MW::MpdWid&>(widget);
  own.click_cb = own.press_cb = own.release_cb = own.hover_cb = kTeller;
  own.key_press_cb = own.key_release_cb = kTeller;
}
void listenToIme(MW::Widget& widget) { listenToPanel<MW::Ime>(widget); }
void listenToStaticText(MW::Widget& widget) { listenToPanel<MW::StaticText>(widget); }

}  // namespace brimol::test
