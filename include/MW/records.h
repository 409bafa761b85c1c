/// The records that events carry, their codes, and the toolkit's common colours. C11 and C++.
#pragma once

#include <brimol/input.h>
#include <brimol/scene.h>

#ifdef __cplusplus
namespace MW {
#endif

/// What happened; event_data's `type`. Codes 0 to 3 are pointer events.
enum EventCode {
  kEventMotion = 0,
  kEventPress = 1,
  kEventRelease = 2,
  kEventLongPress = 3,
  kEventKeyPress = 4,
  kEventKeyRelease = 5,
  kEventApplication = 6,  ///< raised by EventService::AppEvent
  kEventUser = 7,         ///< raised by the platform
  kEventUnknown = 8       ///< input of another kind; no widget acts on it
};

/// The window's layers; what a widget's `type` says.
enum LayerNumber {
  kTopLayer = 0,  ///< dialogs: while one is active, nothing below gets events
  kBaseLayer = 1
};

/// Key codes that widgets act on, as the platform reports them.
enum KeyCode {
  kKeyUp = BRIMOL_CODE_UP,
  kKeyDown = BRIMOL_CODE_DOWN,
  kKeyRight = BRIMOL_CODE_RIGHT,
  kKeyLeft = BRIMOL_CODE_LEFT,
  kKeyHook = BRIMOL_CODE_HOOK,
  kKeySelect = BRIMOL_CODE_SELECT
};

/// A touch, in screen pixels.
struct mouse_event {
  uint32_t state;   ///< the platform's pointer state
  uint32_t finger;  ///< 0 for the first finger
  int32_t x;        ///< from the left edge
  int32_t y;        ///< from the top edge
  int32_t xrel;     ///< motion since the finger's previous report; 0 except for kEventMotion
  int32_t yrel;     ///< the same, downwards
};

/// A key, or the two words of a user event.
struct kbd_event {
  uint32_t state;  ///< the platform's key state
  uint32_t code;   ///< enum BrimolKeyCode, or any other code of the platform
};

/// One event as widgets receive it.
struct event_data {
  int32_t type;  ///< EventCode
  union {
    struct mouse_event mouse;  ///< codes 0 to 3
    struct kbd_event key;      ///< codes 4, 5 and 7
    int32_t value;             ///< code 6: what AppEvent was given
  };
};

#ifdef __cplusplus

static_assert(sizeof(mouse_event) == 24 && offsetof(mouse_event, state) == 0 &&
                  offsetof(mouse_event, finger) == 4 && offsetof(mouse_event, x) == 8 &&
                  offsetof(mouse_event, y) == 12 && offsetof(mouse_event, xrel) == 16 &&
                  offsetof(mouse_event, yrel) == 20,
              "mouse_event");
static_assert(sizeof(kbd_event) == 8 && offsetof(kbd_event, state) == 0 &&
                  offsetof(kbd_event, code) == 4,
              "kbd_event");
static_assert(sizeof(event_data) == 28 && offsetof(event_data, type) == 0 &&
                  offsetof(event_data, mouse) == 4 && offsetof(event_data, key) == 4 &&
                  offsetof(event_data, value) == 4,
              "event_data");

// Colours are 0xAARRGGBB.
inline constexpr uint32_t kColorBlack = 0xFF000000;
inline constexpr uint32_t kColorWhite = 0xFFFFFFFF;
inline constexpr uint32_t kColorGrey = 0xFFBFBFBF;
inline constexpr uint32_t kColorDarkGrey = 0xFF4F4F4F;
inline constexpr uint32_t kColorRed = 0xFFFF0000;
inline constexpr uint32_t kColorBlue = 0xFF0000FF;
inline constexpr uint32_t kColorGreen = 0xFF00FF00;
inline constexpr uint32_t kColorShadow = 0x7F000000;     ///< half-transparent black
inline constexpr uint32_t kColorHighlight = 0xFF87CEFA;  ///< what a pressed element turns

}  // namespace MW
#endif
