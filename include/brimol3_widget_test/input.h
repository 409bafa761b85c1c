/// What a test does to widgets, and what it reads of them.
#pragma once

#include <MW/widget.h>

#include <string>
#include <vector>

#include <brimol3_widget_test/platform.h>

namespace brimol::test {

/// A place on the screen, in pixels.
struct Spot {
  int x;  ///< from the left edge
  int y;  ///< from the top edge
};

/// Events as widgets receive them: a touch; a key.
inline MW::event_data pointerEvent(MW::EventCode code, Spot spot, unsigned int finger = 0) {
  return {.type = code, .mouse = {0, finger, spot.x, spot.y, 0, 0}};
}
inline MW::event_data keyEvent(MW::EventCode code, unsigned int key) {
  return {.type = code, .key = {0, key}};
}
/// The platform's record of the first finger.
inline Event pointerInput(BrimolEventType type, Spot spot) {
  const auto place = [](int pixels) { return static_cast<uint16_t>(pixels); };
  return {.pointer = {static_cast<uint8_t>(type), 0, 0, 0, place(spot.x), place(spot.y), 0, 0}};
}
/// The platform's record of a key.
inline Event keyInput(BrimolEventType type, unsigned int code) {
  Event event = {};
  event.key.type = static_cast<uint8_t>(type);
  event.key.state = type == BRIMOL_KEY_DOWN ? 1 : 0;
  event.key.code = code;
  return event;
}

/// Offers a widget an event as the dispatcher does. The widget's answer.
inline bool offer(MW::Widget& widget, MW::event_data event) {
  return widget.onRecvEvent(&event, 0);
}
/// The same for a finger's event at a place.
inline bool press(MW::Widget& widget, Spot spot, unsigned int finger = 0) {
  return offer(widget, pointerEvent(MW::kEventPress, spot, finger));
}
inline bool drag(MW::Widget& widget, Spot to, unsigned int finger = 0) {
  return offer(widget, pointerEvent(MW::kEventMotion, to, finger));
}
inline bool release(MW::Widget& widget, Spot spot, unsigned int finger = 0) {
  return offer(widget, pointerEvent(MW::kEventRelease, spot, finger));
}
inline bool longPress(MW::Widget& widget, Spot spot, unsigned int finger = 0) {
  return offer(widget, pointerEvent(MW::kEventLongPress, spot, finger));
}

/// The drawing calls of one show(ticks), at the platform's time.
inline std::vector<Drawing> shown(MW::Widget& widget) {
  platform().takeDrawings();
  widget.show(platform().ticks);
  return platform().takeDrawings();
}

/// The log since the last look, as lines of one priority and tag.
inline std::vector<LogLine> logLines(int priority, const std::vector<std::string>& messages) {
  std::vector<LogLine> lines;
  lines.reserve(messages.size());
  for (const std::string& message : messages) lines.push_back({priority, "BRIMOL_WIDGET", message});
  return lines;
}
/// Priorities of log lines.
inline constexpr int kDebug = 3;
inline constexpr int kWarning = 5;
inline constexpr int kError = 6;

}  // namespace brimol::test
