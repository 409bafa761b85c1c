/// The one screen of the application: its layers of live widgets and the passes over them.
#pragma once

#include <MW/api.h>
#include <MW/records.h>

namespace MW {

class EventService;
class Widget;

/// Static members only. An application calls init(), creates widgets and makes them active, and
/// then loops: when isDisplayUpdate(0) returns 1 it calls show(); from time to time it calls
/// updateTimer(). At the end it deletes its widgets and calls destroy().
///
/// The passes and the dispatch thread walk the layers without a lock. Widgets may be registered,
/// unregistered and deleted at any time, from any thread and from inside callbacks: no walk skips
/// or repeats another widget, and a widget that has left is not called again.
class MW_API Window {
 public:
  /// Starts input and the dispatch thread. Returns 1, or 0 when the dispatch thread could not be
  /// created (input runs on until destroy). A second call before destroy() changes nothing.
  static int init();
  /// Stops the dispatch thread and then input, and waits for both; a callback that calls it is not
  /// waited for. Returns 1. The widgets stay as they are.
  static int destroy();
  /// The running event service; null before init() and after destroy().
  static EventService* getEventService();

  /// Appends the widget to the layer that its type() names (0 top, 1 base) and sets its id to the
  /// number of widgets in that layer. It stays inactive. A null pointer, another type, or a lack of
  /// memory is logged and registers nothing. Always returns 1. Any thread.
  static int registerWidget(Widget* widget);
  /// Removes from the widget's layer the first one that has its id, and waits for a handler of
  /// that one on another thread. Two threads that would wait for each other's handlers do not.
  /// Always returns 1. Any thread; no lock may be held that a handler takes.
  static int unregisterWidget(Widget* widget);

  /// The drawing pass: show(ticks) of every active widget, base layer first, each layer in the
  /// order of registering.
  static void show(unsigned int ticks);
  /// The same at GetTicks().
  static void show();
  /// The timer pass: updateTimer(GetTicks()) of every active widget, in the same order. The
  /// argument is not read.
  static void updateTimer(unsigned int ticks);

  /// Stores the screen's size in pixels; 1440 x 2560 while none is known. Returns 1.
  static int getwindowsize(int* outWidth, int* outHeight);
  /// Millimetres to pixels by the horizontal density; cut to the range of an int. Stores the
  /// density in dots per inch as it was before it is rounded. A null pointer is skipped.
  static int getMura(float* outXdpi, float* outYdpi, float mm);

  /// Logs an event of codes 0 to 5 and returns 1; 0 for any other.
  static int onRecvEvent(event_data* event, unsigned int arg);
  static void onHover();
  static void onPress();
  static void onRelease();
  static void onPressLong();
  static void onKeyPressed();
  static void onKeyReleased();

  // Set before init(), or left at 0: not known yet.
  static int width;   // pixels
  static int height;  // pixels
  static float xdpi;  // dots per inch
  static float ydpi;  // dots per inch
};

/// Raises (any value but 0) the flag that a redraw is due and returns 1, or with 0 tests it: 1 when
/// it was raised, and clears it. Any thread.
MW_API int isDisplayUpdate(int set);

}  // namespace MW
