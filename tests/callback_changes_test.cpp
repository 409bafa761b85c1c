// What callbacks may do to the widget that calls them.

#include <MW/button3.h>
#include <MW/dialog.h>
#include <MW/key.h>
#include <MW/main_list.h>
#include <MW/screen.h>
#include <MW/slide.h>

#include <memory>
#include <tuple>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Callback;
using MW::Widget;

std::unique_ptr<Widget> widget;
int changes;
void (*change)();

void withInt(int) { change(); }
void withTouch(MW::mouse_event*) { change(); }
void withKey(MW::kbd_event*) { change(); }
void withRow(MW::mouse_event*, MW::MainList*) { change(); }
void withRowKey(MW::kbd_event*, MW::MainList*) { change(); }

constexpr SKIA_Rect kArea = {0, 300, 500, 500, 0};
constexpr Spot kSpot = {150, 400};  // on every widget but the dialog
constexpr Spot kOnBoth = {900, 1500};

std::unique_ptr<Widget> makeList() {
  auto list = std::make_unique<MW::MainList>("Menu");
  const SKIA_Text caption = textRecord("x");
  list->addIndex(1, &caption, 3000);
  list->initFinish();
  return list;
}

std::unique_ptr<Widget> makeSlide() {
  return std::make_unique<MW::Slide>(0, &kArea, nullptr, nullptr);
}

std::unique_ptr<Widget> makeLocked() {
  auto slide = makeSlide();
  slide->Lock();
  return slide;
}

std::unique_ptr<Widget> makeButton() {
  setScreen(1080, 900);
  return std::make_unique<MW::Button3>(7);
}

template <typename Type>
std::unique_ptr<Widget> make() {
  return std::make_unique<Type>();
}

// It answers as two buttons at once.
std::unique_ptr<Widget> makeDialog() { return std::make_unique<MW::Dialog>(6); }
std::unique_ptr<Widget> makeHook() { return std::make_unique<MW::Dialog>(13); }

template <auto word>
void setInt(Widget& of) {
  of.*word = withInt;
}
template <auto word>
void setTouch(Widget& of) {
  of.*word = withTouch;
}
template <auto word>
void setKey(Widget& of) {
  of.*word = withKey;
}
template <auto word>
void setRow(Widget& of) {
  dynamic_cast<MW::MainList&>(of).*word = withRow;
}
template <auto word>
void setRowKey(Widget& of) {
  dynamic_cast<MW::MainList&>(of).*word = withRowKey;
}

struct CallerCase : Row {
  std::unique_ptr<Widget> (*make)();
  void (*setWord)(Widget&);
  bool hasDoubleClick = false;  // another word that the same gesture may call afterwards
};

struct ChangeCase : Row {
  void (*change)();
};

class CallbackChange : public WidgetTest,
                       public testing::WithParamInterface<std::tuple<ChangeCase, CallerCase>> {
 protected:
  void SetUp() override {
    WidgetTest::SetUp();
    changes = 0;
    platform().ticks = 1000;
  }
  void TearDown() override {
    widget.reset();
    WidgetTest::TearDown();
  }
  static void offerIfThere(MW::event_data event) {
    if (widget != nullptr) offer(*widget, event);
    if (widget != nullptr) widget->show(platform().ticks);
  }
};

// Two taps, a drag, a long press, keys and a plug: as far as there is still a widget.
TEST_P(CallbackChange, FromInside) {
  const auto& [what, caller] = GetParam();
  change = what.change;
  widget = caller.make();
  widget->setActive(1);
  if (caller.hasDoubleClick) widget->doubleClickCallback = withInt;
  caller.setWord(*widget);
  for (const Spot spot : {kSpot, kOnBoth}) {
    for (const auto code : {MW::kEventPress, MW::kEventRelease, MW::kEventPress, MW::kEventRelease,
                            MW::kEventPress, MW::kEventLongPress}) {
      offerIfThere(pointerEvent(code, spot));
    }
    for (const int by : {300, -300}) {
      offerIfThere(pointerEvent(MW::kEventPress, by > 0 ? spot : Spot{400, 400}));
      offerIfThere({.type = MW::kEventMotion, .mouse = {0, 0, spot.x, spot.y, by, by}});
    }
    offerIfThere(pointerEvent(MW::kEventRelease, spot));
  }
  for (int i = 0; i < 3; ++i) {
    offerIfThere(keyEvent(MW::kEventKeyPress, i == 0 ? MW::kKeyHook : 5));
    offerIfThere(keyEvent(MW::kEventKeyRelease, 5));
  }
  offerIfThere(keyEvent(MW::kEventUser, 17));
  platform().ticks = 1101;
  if (widget != nullptr) widget->show(1101);
  EXPECT_GT(changes, 0) << "was called";
}

const auto kChanges = testing::Values(ChangeCase{"Deletes",
                                                 [] {
                                                   ++changes;
                                                   widget.reset();
                                                 }},
                                      ChangeCase{"Hides", [] {
                                                   ++changes;
                                                   widget->hide();
                                                 }});
const auto kCallers = testing::Values(
    CallerCase{"Button3Press", makeButton, setInt<&Widget::pressCallback>, true},
    CallerCase{"Button3Click", makeButton, setInt<&Widget::clickCallback>, true},
    CallerCase{"Button3Long", makeButton, setInt<&Widget::longPressCallback>},
    CallerCase{"Button3Double", makeButton, setInt<&Widget::doubleClickCallback>},
    CallerCase{"ScreenPress", make<MW::Screen>, setTouch<&Widget::pressCallback>, true},
    CallerCase{"ScreenClick", make<MW::Screen>, setTouch<&Widget::clickCallback>, true},
    CallerCase{"ScreenLong", make<MW::Screen>, setTouch<&Widget::longPressCallback>},
    CallerCase{"ScreenHover", make<MW::Screen>, setTouch<&Widget::hoverCallback>},
    CallerCase{"ScreenDouble", make<MW::Screen>, setInt<&Widget::doubleClickCallback>},
    CallerCase{"SlideRight", makeSlide, setInt<&Widget::rightCallback>},
    CallerCase{"SlideLeft", makeSlide, setInt<&Widget::leftCallback>},
    CallerCase{"SlideDouble", makeLocked, setTouch<&Widget::doubleClickCallback>},
    CallerCase{"KeyPress", make<MW::Key>, setKey<&Widget::keyPressCallback>},
    CallerCase{"KeyRelease", make<MW::Key>, setKey<&Widget::keyReleaseCallback>},
    CallerCase{"KeyDouble", make<MW::Key>, setKey<&Widget::doubleKeyCallback>},
    CallerCase{"KeyTriple", make<MW::Key>, setKey<&Widget::tripleKeyCallback>},
    CallerCase{"KeyPlug", make<MW::Key>, setKey<&Widget::plugCallback>},
    CallerCase{"KeyTouch", make<MW::Key>, setTouch<&Widget::touchPressCallback>},
    CallerCase{"KeyLong", make<MW::Key>, setTouch<&Widget::longPressCallback>},
    CallerCase{"DialogLeft", makeDialog, setInt<&Widget::button1Callback>},
    CallerCase{"DialogRight", makeDialog, setInt<&Widget::button2Callback>},
    CallerCase{"DialogPress", makeDialog, setTouch<&Widget::pressCallback>},
    CallerCase{"DialogHover", makeDialog, setTouch<&Widget::hoverCallback>},
    CallerCase{"DialogTouch", makeDialog, setTouch<&Widget::clickCallback>},
    CallerCase{"DialogDouble", makeDialog, setKey<&Widget::doubleKeyCallback>},
    CallerCase{"DialogTriple", makeDialog, setKey<&Widget::tripleKeyCallback>},
    CallerCase{"DialogKey", makeDialog, setKey<&Widget::keyReleaseCallback>},
    CallerCase{"DialogPlug", makeDialog, setKey<&Widget::plugCallback>},
    CallerCase{"DialogHook", makeHook, setInt<&Widget::hookKeyCallback>},
    CallerCase{"ListPress", makeList, setRow<&MW::MainList::pressCallback>},
    CallerCase{"ListClick", makeList, setRow<&MW::MainList::clickCallback>},
    CallerCase{"ListRelease", makeList, setRow<&MW::MainList::releaseCallback>},
    CallerCase{"ListScroll", makeList, setRow<&MW::MainList::scrollCallback>},
    CallerCase{"ListKey", makeList, setRowKey<&MW::MainList::keyReleaseCallback>});

INSTANTIATE_TEST_SUITE_P(Callers, CallbackChange, testing::Combine(kChanges, kCallers),
                         [](const auto& row) {
                           return std::string(std::get<1>(row.param).name) +
                                  std::get<0>(row.param).name;
                         });

}  // namespace
