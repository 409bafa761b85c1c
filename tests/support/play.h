/// Scripts of input that a widget under test plays, and what it tells and looks like meanwhile.
#pragma once

#include <algorithm>
#include <cstdio>

#include "support/drawings.h"

namespace brimol::test {

using Made = std::unique_ptr<MW::Widget>;

inline Made widget;       ///< the one under test
inline std::string told;  ///< the callbacks, and whether an event was taken
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

/// Listens to the base's callbacks. A button's take other arguments.
inline void hear(MW::Widget& made) {
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

/// The same of a class that has callbacks of its own.
template <typename Class>
void hearOwn(Class& made) {
  made.touchPressCallback = tellTouch<'p'>;
  made.touchReleaseCallback = tellTouch<'c'>;
  made.keyPressCallback = tellKey<'k'>;
  made.keyReleaseCallback = tellKey<'r'>;
}
inline Made heard(Made made) {
  hear(*made);
  return made;
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
    case 'g': told += platform().takeLog().back().message; return;
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

/// Plays on what `make` makes, and again for every call, which then deletes it and is the last.
inline void expectTold(const std::function<Made()>& make, const char* script,
                       const char* expected) {
  SCOPED_TRACE(script);
  const auto run = [&](int deletingCall) {
    told.clear();
    calls = 0;
    lastCall = deletingCall;
    finger = {};
    widget = make();
    widget->setActive(1);
    play(script);
  };
  run(0);
  EXPECT_EQ(told, expected);
  for (int call = calls; call > 0; --call) {
    run(call);
    EXPECT_EQ(widget, nullptr);
    EXPECT_EQ(calls, call) << "it tells no more";
  }
  widget.reset();
}

struct ToldCase {
  Made (*make)();
  const char* script;
  const char* told;
};
inline void expectTold(const ToldCase& row) { expectTold(row.make, row.script, row.told); }

}  // namespace brimol::test
