/// Steps of input that a test plays on one widget, and the journal of what the widget told.
///
///     const Steps kTap = {press(10, 20), release()};
///     EXPECT_EQ(played(makes<MW::Screen>(), kTap), "press+ click+");
///
/// The journal has a word for each step of input: the callbacks that it caused, then + where the
/// event was taken and - where it was not. Callbacks of other steps stand as they are, and what is
/// looked at stands in angle brackets.
#pragma once

#include <MW/window.h>

#include <functional>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include <brimol3_widget_test/input.h>

namespace brimol::test {

/// The widget under test, the finger that plays on it, and what was told so far.
struct Stage {
  std::unique_ptr<MW::Widget> widget;  ///< under test
  std::string journal;                 ///< what was told so far
  MW::mouse_event finger = {};         ///< where it was last
  int calls = 0;                       ///< callbacks so far
  int deletingCall = 0;                ///< the callback that deletes the widget; 0: none does
};
/// The stage of the process.
inline Stage stage;

/// Begins a word of the journal, where one has not just begun.
inline void space() {
  if (!stage.journal.empty() && stage.journal.back() != ' ') stage.journal += ' ';
}

/// What a callback writes. It may delete the widget.
inline void note(const std::string& word) {
  space();
  stage.journal += word;
  if (++stage.calls == stage.deletingCall) stage.widget.reset();
}
/// The same with a "!" where the record is not the finger's.
inline void noteTouch(const std::string& word, const MW::mouse_event* mouse) {
  const MW::mouse_event& finger = stage.finger;
  const bool isHis = mouse->finger == finger.finger && mouse->x == finger.x && mouse->y == finger.y;
  note(word + (isHis ? "" : "!"));
}
/// The same with a "!" where the value is not 0.
inline void noteZero(const std::string& word, int value) { note(word + (value == 0 ? "" : "!")); }

/// Something that a test does on the stage; several in a row.
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

/// A key goes down, and up; a user event; an application event.
inline Step keyDown(unsigned int code) { return detail::keyStep(MW::kEventKeyPress, code); }
inline Step keyUp(unsigned int code) { return detail::keyStep(MW::kEventKeyRelease, code); }
inline Step plug(unsigned int code) { return detail::keyStep(MW::kEventUser, code); }
inline Step appEvent(int value) {
  return [value] { detail::offerStep({.type = MW::kEventApplication, .value = value}); };
}

/// The clock, in GetTicks() milliseconds. It starts at startTicks().
inline Step at(unsigned int ticks) {
  return [ticks] { platform().ticks = ticks; };
}
/// So many milliseconds later.
inline Step later(unsigned int ms) {
  return [ms] { platform().ticks += ms; };
}
/// When the clock starts, in milliseconds.
inline unsigned int startTicks() { return clockBase() + 1000; }

/// An operation on the widget: call(&MW::Widget::onHideTimer, 500), or any function of it. That of
/// a class of its own names it: call<MW::Slide>(...).
template <typename Subject = MW::Widget, typename Operation, typename... Arguments>
Step call(Operation operation, Arguments... arguments) {
  return [=] {
    space();
    std::invoke(operation, static_cast<Subject&>(*stage.widget), arguments...);
    space();
  };
}
/// A drawing pass at the clock's time.
inline Step draw() {
  return call([](MW::Widget& widget) { widget.show(platform().ticks); });
}
/// A timer pass at the clock's time.
inline Step timer() {
  return call([](MW::Widget& widget) { widget.updateTimer(platform().ticks); });
}
/// Writes what is read from the widget into the journal: a text or a number.
template <typename Subject = MW::Widget, typename Reader>
Step look(Reader read) {
  return call<Subject>([read](Subject& subject) {
    std::ostringstream seen;
    seen << '<' << std::invoke(read, subject) << '>';
    stage.journal += seen.str();
  });
}
/// Which finger holds the widget, as isSelect() says it.
inline Step lookAtHold() {
  return look([](MW::Widget& widget) { return "held " + std::to_string(widget.isSelect()); });
}
/// Whether a redraw was asked for since the last look.
inline Step lookAtRedraw() {
  return look([](MW::Widget&) { return MW::isDisplayUpdate(0) == 1 ? "redraw" : "still"; });
}
/// How many drawing calls a drawing pass makes.
inline Step lookAtDrawings() {
  return look([](MW::Widget& widget) { return shown(widget).size(); });
}
/// The last line of the log since the last look.
inline Step lookAtLog() {
  return look([](MW::Widget&) {
    const std::vector<LogLine> lines = platform().takeLog();
    return lines.empty() ? "" : lines.back().message;
  });
}

/// What makes a widget for the stage.
using Maker = std::function<std::unique_ptr<MW::Widget>()>;

/// The journal of the steps, played on a new widget; they end where the widget is deleted.
inline std::string played(const Maker& make, const Steps& steps, int deletingCall = 0) {
  stage = {};
  platform().ticks = startTicks();
  platform().takeLog();
  MW::isDisplayUpdate(0);
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

/// What a widget's touch callbacks are called with: 0, or the finger's record.
enum class Told { Zero, Touch };
/// The widget, whose callbacks of the base write their words into the journal.
template <Told kind = Told::Touch>
std::unique_ptr<MW::Widget> heard(std::unique_ptr<MW::Widget> widget) {
  if constexpr (kind == Told::Zero) {
    widget->pressCallback = [](int value) { noteZero("press", value); };
    widget->clickCallback = [](int value) { noteZero("click", value); };
    widget->longPressCallback = [](int value) { noteZero("long", value); };
  } else {
    widget->pressCallback = [](MW::mouse_event* mouse) { noteTouch("press", mouse); };
    widget->clickCallback = [](MW::mouse_event* mouse) { noteTouch("click", mouse); };
    widget->longPressCallback = [](MW::mouse_event* mouse) { noteTouch("long", mouse); };
    widget->hoverCallback = [](MW::mouse_event* mouse) { noteTouch("hover", mouse); };
  }
  widget->doubleClickCallback = [](int value) { noteZero("double", value); };
  widget->touchPressCallback = [](MW::mouse_event* mouse) { noteTouch("touch", mouse); };
  widget->touchReleaseCallback = [](MW::mouse_event* mouse) { noteTouch("lift", mouse); };
  widget->leftCallback = [](int value) { noteZero("left", value); };
  widget->rightCallback = [](int value) { noteZero("right", value); };
  widget->exitCallback = [](int value) { noteZero("exit", value); };
  widget->button1Callback = [](int value) { noteZero("button1", value); };
  widget->button2Callback = [](int value) { noteZero("button2", value); };
  widget->hookKeyCallback = [](int value) { noteZero("hook", value); };
  widget->keyPressCallback = [](MW::kbd_event* key) { note("down" + std::to_string(key->code)); };
  widget->keyReleaseCallback = [](MW::kbd_event* key) { note("up" + std::to_string(key->code)); };
  widget->doubleKeyCallback = [](MW::kbd_event* key) { note("twice" + std::to_string(key->code)); };
  widget->tripleKeyCallback = [](MW::kbd_event* key) {
    note("thrice" + std::to_string(key->code));
  };
  widget->plugCallback = [](MW::kbd_event* key) { note("plug" + std::to_string(key->code)); };
  return widget;
}
/// Makes an active widget that is heard, of a class and its constructor's arguments.
template <typename Subject, Told kind = Told::Touch, typename... Arguments>
Maker makes(Arguments... arguments) {
  return [=] {
    auto made = std::make_unique<Subject>(arguments...);
    made->setActive(1);
    return heard<kind>(std::move(made));
  };
}

/// The same widget without one of its callbacks.
inline Maker without(MW::Callback MW::Widget::*word, const Maker& make) {
  return [=] {
    auto made = make();
    (*made).*word = nullptr;
    return made;
  };
}

}  // namespace brimol::test
