/// Scripts of input for one widget, and what it makes of them.
#pragma once

#include <algorithm>
#include <cstdio>

#include "support/drawings.h"

namespace brimol::test {

using Made = std::unique_ptr<MW::Widget>;

inline Made widget;       ///< what a script is played on
inline std::string told;  ///< letters of the callbacks, and whether events were taken
inline int calls;
inline int lastCall;  ///< the call that deletes the widget
inline MW::mouse_event finger;

inline void note(char letter) {
  told += letter;
  if (++calls == lastCall) widget.reset();
}
template <char letter>
void tell(int value) {
  note(value == 0 ? letter : '!');
}
template <char letter>
void tellTouch(MW::mouse_event* mouse) {
  note(mouse->x == finger.x && mouse->finger == finger.finger ? letter : '!');
}
template <char letter>
void tellKey(MW::kbd_event* key) {
  told += std::to_string(key->code);
  note(letter);
}

/// Hears every callback but the push button's, which are of another kind.
template <typename Hearable>
void hear(Hearable& made) {
  made.pressCallback = made.touchPressCallback = tellTouch<'p'>;
  made.clickCallback = made.touchReleaseCallback = tellTouch<'c'>;
  made.longPressCallback = tellTouch<'l'>;
  made.hoverCallback = tellTouch<'h'>;
  made.doubleClickCallback = tell<'d'>;
  made.leftCallback = tell<'L'>;
  made.rightCallback = tell<'R'>;
  made.exitCallback = tell<'E'>;
  made.button1Callback = tell<'1'>;
  made.button2Callback = [](int) { note(widget->isActive() ? '!' : '2'); };
  made.hookKeyCallback = tell<'H'>;
  made.keyPressCallback = tellKey<'k'>;
  made.keyReleaseCallback = tellKey<'r'>;
  made.doubleKeyCallback = tellKey<'D'>;
  made.tripleKeyCallback = tellKey<'T'>;
  made.plugCallback = tellKey<'u'>;
}

/// Which finger holds the widget, how many faces are highlighted, where the last thing stands.
inline std::string look() {
  const std::vector<Drawing> all = shown(*widget);
  const auto isHeld = [](const Drawing& each) { return each.rect.color == MW::kColorHighlight; };
  return '<' + std::to_string(widget->isSelect()) + '/' +
         std::to_string(std::ranges::count_if(all, isHeld)) + '/' +
         std::to_string(all.back().rect.x) + '>';
}

/// Whether it asks to be drawn (!), and then the length of its last text; -: it has gone.
inline std::string length() {
  widget->updateTimer(platform().ticks);
  const std::string asked = MW::isDisplayUpdate(0) == 1 ? "!" : "";
  const std::vector<Drawing> all = shown(*widget);
  if (all.empty()) return asked + (widget->isActive() ? '?' : '-');
  return asked + std::to_string(all.back().text.text.size());
}

/// t: the time, a negative one before the wrap; n: later. f: the finger. ?: a look, *: a length, d:
/// a drawing pass, g: the last log line. H, B, h, L, o: operations. The rest are events: keys and
/// plugs by their code; p, r and l where it is said, or where the finger was; m by so much, and to
/// the place of that name.
inline void step(char what, int x, int y) {
  constexpr std::string_view kEvents = "mprlkKau";  // by their codes
  switch (what) {
    case 't':
      platform().ticks = static_cast<unsigned int>(x);
      told += ' ';
      return;
    case 'n': platform().ticks += static_cast<unsigned int>(x); return;
    case 'f': finger.finger = static_cast<unsigned int>(x); return;
    case '?': told += look(); return;
    case '*': told += length(); return;
    case 'd': widget->show(platform().ticks); return;
    case 'H': widget->onHideTimer(x); return;
    case 'B': widget->onProgressbar(x); return;
    case 'g':
      if (const auto lines = platform().takeLog(); !lines.empty()) told += lines.back().message;
      return;
    case 'h': widget->hide(); return;
    case 'L': widget->Lock(); return;
    case 'o': widget->lcdOn(x); return;
    default: break;
  }
  finger = {7, finger.finger, x, y, x, y};
  const auto code = static_cast<int>(kEvents.find(what));
  MW::event_data event = {.type = code, .mouse = finger};
  if (code >= MW::kEventKeyPress) event.key = {1, static_cast<unsigned int>(x)};
  const bool isTaken = offer(*widget, event);
  told += isTaken ? '+' : '-';
}

inline void play(const std::string& script) {
  std::istringstream steps(script);
  for (std::string each; widget != nullptr && steps >> each;) {
    int x = finger.x;
    int y = finger.y;
    std::sscanf(each.c_str() + 1, "%d,%d", &x, &y);
    step(each.front(), x, y);
  }
}

/// Makes the widget that a script is played on: active, and heard.
template <typename Hearable, typename... Arguments>
Hearable& hold(Arguments... arguments) {
  auto made = std::make_unique<Hearable>(arguments...);
  Hearable& held = *made;
  widget = std::move(made);
  held.setActive(1);
  hear(held);
  return held;
}

inline void run(const std::string& script, const std::function<void()>& makeWidget,
                int deletingCall = 0) {
  told.clear();
  calls = 0;
  lastCall = deletingCall;
  finger = {};
  makeWidget();
  play(script);
}

struct Script {
  const char* steps;
  const char* told;  ///< the callbacks, and whether an event was taken
};
struct ScriptCase {
  int which;
  int variant;
  const char* script;
  const char* told;
};
struct MadeCase {
  void (*make)();
  const char* script;
  const char* told;
};

/// Plays the script; once more for each of its calls, which then deletes the widget; and on screens
/// that no machine has.
inline void expectTold(const Script& script, const std::function<void()>& makeWidget) {
  SCOPED_TRACE(script.steps);
  run(script.steps, makeWidget);
  EXPECT_EQ(told, script.told);
  for (int call = calls; call > 0; --call) {
    run(script.steps, makeWidget, call);
    EXPECT_EQ(widget, nullptr);
    EXPECT_EQ(calls, call) << "it tells no more";
  }
  for (const auto& [w, h] : {Spot{1, 1}, {6, 7}, {-5, 9}, {INT_MAX, INT_MAX}, {INT_MIN, 1}}) {
    setScreen(w, h);
    run(script.steps, makeWidget);
    EXPECT_FALSE(widget->onRecvEvent(nullptr, 0));
  }
  setScreen(0, 0);
  widget.reset();
}

inline void expectTold(const ScriptCase& row, const std::function<void()>& makeWidget) {
  expectTold(Script{row.script, row.told}, makeWidget);
}
inline void expectTold(const MadeCase& row) { expectTold(Script{row.script, row.told}, row.make); }

}  // namespace brimol::test
