/// Steps of input that a test plays on one widget, and the journal of what the widget told.
///
///     const Steps kTap = {press(10, 20), release()};
///     EXPECT_EQ(played(makeButton, kTap), "press+ click+");
///
/// The journal has a word for each step of input: the callbacks that it caused, then + where the
/// event was taken and - where it was not.
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "support/widget_test.h"

namespace brimol::test {

/// The widget under test, the finger that plays on it, and what was told so far.
struct Stage {
  std::unique_ptr<MW::Widget> widget;
  std::string journal;
  MW::mouse_event finger = {};
  int calls = 0;         ///< callbacks so far
  int deletingCall = 0;  ///< the callback that deletes the widget; 0: none does
};
inline Stage stage;

/// What a callback writes. It may delete the widget.
inline void note(const std::string& word) {
  if (!stage.journal.empty() && stage.journal.back() != ' ') stage.journal += ' ';
  stage.journal += word;
  if (++stage.calls == stage.deletingCall) stage.widget.reset();
}

using Step = std::function<void()>;
using Steps = std::vector<Step>;

namespace detail {
inline void offerStep(MW::event_data event) {
  const bool isTaken = offer(*stage.widget, event);
  stage.journal += isTaken ? "+ " : "- ";
}
inline Step pointerStep(MW::EventCode code) {
  return [code] { offerStep({.type = code, .mouse = stage.finger}); };
}
inline Step pointerStep(MW::EventCode code, int x, int y) {
  return [code, x, y] {
    stage.finger = {0, stage.finger.finger, x, y, 0, 0};
    offerStep({.type = code, .mouse = stage.finger});
  };
}
inline Step keyStep(MW::EventCode code, unsigned int key) {
  return [code, key] { offerStep({.type = code, .key = {1, key}}); };
}
}  // namespace detail

// The finger: at a place in pixels, or where it was last.
inline Step press(int x, int y) { return detail::pointerStep(MW::kEventPress, x, y); }
inline Step press() { return detail::pointerStep(MW::kEventPress); }
inline Step release(int x, int y) { return detail::pointerStep(MW::kEventRelease, x, y); }
inline Step release() { return detail::pointerStep(MW::kEventRelease); }
inline Step longPress(int x, int y) { return detail::pointerStep(MW::kEventLongPress, x, y); }
inline Step longPress() { return detail::pointerStep(MW::kEventLongPress); }
/// Moves by so many pixels; the position stays, as for a widget that reads only the motion.
inline Step drag(int dx, int dy) {
  return [dx, dy] {
    MW::mouse_event moved = stage.finger;
    moved.xrel = dx;
    moved.yrel = dy;
    detail::offerStep({.type = MW::kEventMotion, .mouse = moved});
  };
}
/// Moves to a place.
inline Step moveTo(int x, int y) {
  return [x, y] {
    const MW::mouse_event from = stage.finger;
    stage.finger = {0, from.finger, x, y, 0, 0};
    detail::offerStep(
        {.type = MW::kEventMotion, .mouse = {0, from.finger, x, y, x - from.x, y - from.y}});
  };
}
/// The finger that the following steps are of, 0 for the first.
inline Step finger(unsigned int number) {
  return [number] { stage.finger.finger = number; };
}

inline Step keyDown(unsigned int code) { return detail::keyStep(MW::kEventKeyPress, code); }
inline Step keyUp(unsigned int code) { return detail::keyStep(MW::kEventKeyRelease, code); }
inline Step plug(unsigned int code) { return detail::keyStep(MW::kEventUser, code); }

/// The clock, in GetTicks() milliseconds.
inline Step at(unsigned int ticks) {
  return [ticks] { platform().ticks = ticks; };
}
inline Step later(unsigned int ms) {
  return [ms] { platform().ticks += ms; };
}

/// An operation on the widget.
template <typename Subject = MW::Widget>
Step call(void (*operation)(Subject&)) {
  return [operation] { operation(static_cast<Subject&>(*stage.widget)); };
}
/// Writes what is read from the widget into the journal.
template <typename Subject = MW::Widget>
Step look(std::string (*read)(Subject&)) {
  return [read] { stage.journal += '<' + read(static_cast<Subject&>(*stage.widget)) + "> "; };
}
/// Which finger holds the widget, as isSelect() says it.
inline Step lookAtHold() {
  return look(+[](MW::Widget& widget) { return "held " + std::to_string(widget.isSelect()); });
}

using Maker = std::function<std::unique_ptr<MW::Widget>()>;

/// The journal of the steps, played on a new widget; they end where the widget is deleted.
inline std::string played(const Maker& make, const Steps& steps, int deletingCall = 0) {
  stage = {};
  stage.widget = make();
  stage.deletingCall = deletingCall;
  for (const Step& step : steps) {
    if (stage.widget == nullptr) break;
    step();
  }
  stage.widget.reset();
  std::string journal = std::move(stage.journal);
  while (!journal.empty() && journal.back() == ' ') journal.pop_back();
  return journal;
}

/// Plays the steps once for each callback that they cause, which then deletes the widget: nothing
/// is told after that.
inline void expectCallbacksMayDelete(const Maker& make, const Steps& steps) {
  played(make, steps);
  for (int deleting = stage.calls; deleting > 0; --deleting) {
    played(make, steps, deleting);
    EXPECT_EQ(stage.calls, deleting) << "calls once the widget was deleted";
  }
}

/// What a widget's touch callbacks are called with.
enum class Told { Zero, Touch };
/// The widget, whose callbacks of the base write their words into the journal.
template <Told kind = Told::Touch>
std::unique_ptr<MW::Widget> heard(std::unique_ptr<MW::Widget> widget) {
  if constexpr (kind == Told::Zero) {
    widget->pressCallback = [](int) { note("press"); };
    widget->clickCallback = [](int) { note("click"); };
    widget->longPressCallback = [](int) { note("long"); };
    widget->hoverCallback = [](int) { note("hover"); };
  } else {
    widget->pressCallback = [](MW::mouse_event*) { note("press"); };
    widget->clickCallback = [](MW::mouse_event*) { note("click"); };
    widget->longPressCallback = [](MW::mouse_event*) { note("long"); };
    widget->hoverCallback = [](MW::mouse_event*) { note("hover"); };
  }
  widget->doubleClickCallback = [](int) { note("double"); };
  widget->leftCallback = [](int) { note("left"); };
  widget->rightCallback = [](int) { note("right"); };
  widget->exitCallback = [](int) { note("exit"); };
  widget->button1Callback = [](int) { note("button1"); };
  widget->button2Callback = [](int) { note("button2"); };
  widget->hookKeyCallback = [](int) { note("hook"); };
  widget->keyPressCallback = [](MW::kbd_event* key) { note("down" + std::to_string(key->code)); };
  widget->keyReleaseCallback = [](MW::kbd_event* key) { note("up" + std::to_string(key->code)); };
  widget->doubleKeyCallback = [](MW::kbd_event* key) { note("twice" + std::to_string(key->code)); };
  widget->tripleKeyCallback = [](MW::kbd_event* key) {
    note("thrice" + std::to_string(key->code));
  };
  widget->plugCallback = [](MW::kbd_event* key) { note("plug" + std::to_string(key->code)); };
  return widget;
}

}  // namespace brimol::test
