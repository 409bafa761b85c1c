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
/// unregistered and deleted at any time, on any thread and inside callbacks: no walk skips or
/// repeats another widget, and a widget that has left is not called again.
class MW_API Window {
 public:
  /// Starts input and the dispatch thread. Returns 1, or 0 after an error line when there is no
  /// memory or the dispatch thread could not be created; input may run already and does so until
  /// destroy(). Without memory or a thread for input it logs an error line and returns 1, and no
  /// input comes; that the platform could not open its screen or input, the platform tells itself,
  /// and 1 is returned as well. A second call before destroy() changes nothing but the log, which tells of it,
  /// and returns 1. Any thread: a call waits while another thread is inside init() or destroy(); in
  /// a handler it returns 0 instead, after an error line. If a handler calls destroy() meanwhile,
  /// the window is ended again before init() returns.
  static int init();
  /// Stops the dispatch thread and then input, and waits for both. Returns 1. The widgets stay as
  /// they are. Where nothing runs, only the log tells of the call. Any thread: a call waits while
  /// another thread is inside init() or destroy().
  ///
  /// It may also be called in a handler or callback. There it waits for no thread that runs
  /// handlers, since that thread might be waiting for this very handler. On the dispatch thread
  /// everything ends but that thread, which ends after its callback; a line of the log says so. An
  /// init() in the same callback starts a new dispatch thread, whose handlers begin after the callback; a later destroy() waits
  /// for both.
  ///
  /// In a handler of a drawing or timer pass, or of a dispatch thread that init() has replaced, it
  /// only tells the dispatch thread to end and logs an error line; a later init() or destroy(),
  /// outside handlers or on the dispatch thread, does the rest. In other handlers init() returns 0
  /// until then. If another thread is inside init() or destroy(), a handler's destroy() logs that
  /// line and leaves the end to the other thread.
  static int destroy();
  /// The running event service; null before init() and after destroy(). Events that are posted
  /// through it from then on are lost, and the log tells of each.
  static EventService* getEventService();

  /// Appends the widget to the layer that its type() names (0 top, 1 base) and sets its id to the
  /// number of widgets in that layer. It stays active or inactive. A null pointer, another type, or
  /// a lack of memory is logged and registers nothing. Always returns 1. Any thread.
  static int registerWidget(Widget* widget);
  /// Removes from the widget's layer the first one that has its id: after another removal that may
  /// be another widget. (A widget that is deleted goes by itself, whatever its id.) Waits for a
  /// handler of the removed one on another thread, and so the caller may hold no lock that this
  /// handler takes. Of threads that would wait for each other's handlers in a circle, one does not.
  /// Always returns 1. Any thread.
  static int unregisterWidget(Widget* widget);

  /// The drawing pass, on the application's thread: show(ticks) of every active widget, base layer
  /// first, each layer in the order of registering.
  static void show(unsigned int ticks);
  /// The same at GetTicks().
  static void show();
  /// The timer pass: updateTimer(GetTicks()) of every active widget, in the same order. The
  /// argument is not read.
  static void updateTimer(unsigned int ticks);

  /// Stores the screen's size in pixels. Where `width` or `height` is 0, sets them to 1440 x 2560
  /// first. A null pointer is skipped. Returns 1. Any thread.
  static int getwindowsize(int* outWidth, int* outHeight);
  /// Millimetres to pixels by the horizontal density; cut to the range of an int. Stores the
  /// density in dots per inch as it was before it is rounded. A null pointer is skipped. A density
  /// of 0, or that is no number, gives 0 pixels. Any thread.
  static int getMura(float* outXdpi, float* outYdpi, float mm);

  /// Logs an event of codes 0 to 5 and returns 1; 0 for any other.
  static int onRecvEvent(event_data* event, unsigned int arg);
  // Each logs a line.
  static void onHover();
  static void onPress();
  static void onRelease();
  static void onPressLong();
  static void onKeyPressed();
  static void onKeyReleased();

  // The application sets them before init(), or leaves them at 0: not known yet.
  static int width;   // pixels
  static int height;  // pixels
  static float xdpi;  // dots per inch
  static float ydpi;  // dots per inch
};

/// Raises (any value but 0) the flag that a redraw is due and returns 1, or with 0 tests it: 1 when
/// it was raised, and clears it. Any thread.
MW_API int isDisplayUpdate(int set);

}  // namespace MW
