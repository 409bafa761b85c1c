// How widgets start, and what callbacks may do to the widget that calls them.

#include <MW/button3.h>
#include <MW/dialog.h>
#include <MW/key.h>
#include <MW/main_list.h>
#include <MW/screen.h>
#include <MW/slide.h>
#include <MW/timed.h>

#include <memory>
#include <tuple>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Callback;
using MW::Widget;

constexpr SKIA_Rect kArea = {0, 300, 500, 500, 0};
constexpr Spot kSpot = {150, 400};  // on every widget but the dialog
constexpr Spot kOnBoth = {900, 1500};

std::unique_ptr<Widget> widget;
int changes;
void (*change)();

void withInt(int) { change(); }
void withTouch(MW::mouse_event*) { change(); }
void withKey(MW::kbd_event*) { change(); }
void withRow(MW::mouse_event*, MW::MainList*) { change(); }

std::unique_ptr<Widget> makeList() {
  auto list = std::make_unique<MW::MainList>("Menu");
  const SKIA_Text caption = textRecord("x");
  list->addIndex(1, &caption, 3000);
  list->initFinish();
  list->clickCallback = withRow;
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

std::unique_ptr<Widget> makeScreen() { return std::make_unique<MW::Screen>(); }
std::unique_ptr<Widget> makeKey() { return std::make_unique<MW::Key>(); }
std::unique_ptr<Widget> makeDialog() { return std::make_unique<MW::Dialog>(6); }

std::unique_ptr<Widget> makeToast() { return std::make_unique<MW::Toastbox>(&kArea, nullptr); }
std::unique_ptr<Widget> makeBar() { return std::make_unique<MW::Progressbar>(0, &kArea, nullptr); }
std::unique_ptr<Widget> makeFill() { return std::make_unique<MW::FullScreen>(0); }

struct CallerCase : Row {
  std::unique_ptr<Widget> (*make)();
  Callback Widget::*word;
  Callback function;
};

struct StartCase : Row {
  std::unique_ptr<Widget> (*make)();
  int layer;
  bool isActive;
};

class WidgetStart : public WidgetTest, public testing::WithParamInterface<StartCase> {};

// Registered, with a word of its class where it says one, and for most of them inactive.
TEST_P(WidgetStart, StandsInItsLayer) {
  const auto made = GetParam().make();
  const std::string line = "[" + std::string(GetParam().name) + "] call registerWidget";
  const bool isSilent = std::string(GetParam().name) == "BUTTON3" || made->type() == 0;
  const LogLine first = platform().takeLog().front();
  EXPECT_EQ(first == (LogLine{kDebug, "BRIMOL_WIDGET", line}), !isSilent) << first;
  EXPECT_EQ(made->type(), GetParam().layer);
  EXPECT_EQ(layerSize(GetParam().layer), 1);
  EXPECT_EQ(made->isActive(), GetParam().isActive);
  EXPECT_EQ(made->isSelect(), 0);
}

INSTANTIATE_TEST_SUITE_P(
    Classes, WidgetStart,
    testing::Values(StartCase{{"BUTTON3"}, makeButton, 1, false},
                    StartCase{{"BUTTON"}, makeScreen, 1, false},  // the screen's word, too
                    StartCase{{"SLIDE"}, makeSlide, 1, false}, StartCase{{"KEY"}, makeKey, 1, true},
                    StartCase{{"DIALOG"}, makeDialog, 0, false},
                    StartCase{{"TOASTBOX"}, makeToast, 1, false},
                    StartCase{{"PROGRESSBAR"}, makeBar, 1, false},
                    StartCase{{"FULLSCREEN"}, makeFill, 0, false}),
    rowName);

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
  (*widget).*caller.word = caller.function;
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

const auto kChanges = testing::Values(ChangeCase{{"Deletes"},
                                                 [] {
                                                   ++changes;
                                                   widget.reset();
                                                 }},
                                      ChangeCase{{"Hides"}, [] {
                                                   ++changes;
                                                   widget->hide();
                                                 }});
const auto kCallers = testing::Values(
    CallerCase{{"Button3Press"}, makeButton, &Widget::pressCallback, withInt},
    CallerCase{{"Button3Click"}, makeButton, &Widget::clickCallback, withInt},
    CallerCase{{"Button3Double"}, makeButton, &Widget::doubleClickCallback, withInt},
    CallerCase{{"ScreenPress"}, makeScreen, &Widget::pressCallback, withTouch},
    CallerCase{{"ScreenClick"}, makeScreen, &Widget::clickCallback, withTouch},
    CallerCase{{"ScreenDouble"}, makeScreen, &Widget::doubleClickCallback, withInt},
    CallerCase{{"SlideRight"}, makeSlide, &Widget::rightCallback, withInt},
    CallerCase{{"SlideLeft"}, makeSlide, &Widget::leftCallback, withInt},
    CallerCase{{"SlideTaps"}, makeLocked, &Widget::doubleClickCallback, withTouch},
    CallerCase{{"KeyRelease"}, makeKey, &Widget::keyReleaseCallback, withKey},
    CallerCase{{"KeyDouble"}, makeKey, &Widget::doubleKeyCallback, withKey},
    CallerCase{{"KeyPlug"}, makeKey, &Widget::plugCallback, withKey},
    CallerCase{{"DialogLeft"}, makeDialog, &Widget::button1Callback, withInt},
    CallerCase{{"DialogRight"}, makeDialog, &Widget::button2Callback, withInt},
    CallerCase{{"DialogPress"}, makeDialog, &Widget::pressCallback, withTouch},
    CallerCase{{"DialogHover"}, makeDialog, &Widget::hoverCallback, withTouch},
    CallerCase{{"DialogDouble"}, makeDialog, &Widget::doubleKeyCallback, withKey},
    // By its own word; the base's is not called.
    CallerCase{{"ListClick"}, makeList, &Widget::hoverCallback, nullptr});

INSTANTIATE_TEST_SUITE_P(Callers, CallbackChange, testing::Combine(kChanges, kCallers),
                         [](const auto& row) {
                           return std::string(std::get<1>(row.param).name) +
                                  std::get<0>(row.param).name;
                         });

}  // namespace
