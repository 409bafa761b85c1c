/// The base of every widget.
#pragma once

#include <MW/api.h>
#include <MW/callback.h>
#include <MW/detail/finger_hold.h>
#include <MW/records.h>
#include <brimol/scene.h>

#include <atomic>
#include <mutex>
#include <type_traits>

namespace MW {

/// Everything that can be seen or touched is a Widget.
///
/// The application creates, owns and deletes widgets. A widget is drawn, timed and offered events
/// while it stands in one of the window's layers (Window::registerWidget) and is active. Drawing
/// and timing run on the application's thread, onRecvEvent on the dispatch thread. Deleting a
/// widget takes it out of its layer and waits for a handler of it that runs on another thread; a
/// handler may delete its own widget.
///
/// A class that an application derives, and that has state of its own, calls leaveLayers() first in
/// its destructor, so that no other thread meets a half-destroyed object.
class MW_API Widget {
 public:
  Widget();
  Widget(const Widget&) = delete;
  Widget& operator=(const Widget&) = delete;

  // The virtual operations, in an order that is part of the binary interface. The base does
  // nothing in each, and answers 0, false or null.

  virtual ~Widget();
  /// Draws the widget. The result is the class's to define.
  virtual int show();
  /// The same as part of a drawing pass at `ticks` (GetTicks() milliseconds).
  virtual int show(unsigned int ticks);
  /// The timer pass at GetTicks() milliseconds.
  virtual void updateTimer(unsigned int ticks);
  virtual int hide();
  /// Offers an event. True: taken; it goes to no further widget, and a redraw follows. The event
  /// must not be kept beyond the call. The second argument is 0.
  virtual bool onRecvEvent(event_data* event, unsigned int arg);
  /// The widget's text, in its own record: valid while the widget lives. Read it on the thread
  /// that sets it.
  virtual char* getText();
  virtual unsigned int getBgColor();
  virtual unsigned int getTextColor();
  virtual int getFontSize();
  /// The widget's own rectangle record; as for getText.
  virtual SKIA_Rect* getPositionAndSize();
  virtual void setFontSize(int pixels);
  /// Texts are copied, and cut to 127 bytes at a whole character. Null is the empty text.
  virtual void setText(const char* newText);
  virtual void setTextAlign(int align);
  virtual void setTextColor(unsigned int color);
  virtual void setBgColor(unsigned int color);
  virtual void setBdColor(unsigned int color);
  virtual void setLnColor(unsigned int color);
  virtual void onShowTimer(int ms);
  /// Copies a primitive to the display-item table. The item's index, or a negative code.
  virtual int add_MWWList();
  virtual void lcdOn(int on);
  virtual void onHideTimer(int ms);
  virtual void onHover(event_data* event);
  virtual void onPress(event_data* event);
  virtual void onRelease(event_data* event);
  virtual void onPressLong(event_data* event);
  virtual void setRect(int variant, const SKIA_Rect* newRect);
  virtual void setMsg(const char* message);
  virtual void onTouchClickCount();
  virtual int setTimer(int ms);
  virtual void onPressKey(kbd_event* key);
  virtual void onReleaseKey(kbd_event* key);
  virtual void onPlugKey(kbd_event key);
  virtual void onPressTouch(mouse_event mouse);
  virtual void onReleaseTouch(mouse_event mouse);
  virtual void onProgressbar(int value);
  virtual void restoreColor();
  virtual void Lock();
  virtual void unLock();
  virtual void setDesc(const char* line1, const char* line2, const char* line3, int align);
  virtual void setbutton(const char* caption1, const char* caption2);

  /// Any value but 0 makes the widget active; 0 also unselects it. Any thread.
  void setActive(int on);
  bool isActive() const { return active; }
  /// Non-zero: selected; in the base layer it is offered events before the others. Any thread.
  void setSelect(int value) { select = value; }
  int isSelect() const { return select; }
  /// The layer: 0 top (dialogs), 1 base. Set it before the widget is registered.
  void setType(int value) { type_ = value; }
  int type() const { return type_; }
  /// The number that Window::registerWidget gave; not unique after a removal.
  void setId(int value) { id_ = value; }
  int id() const { return id_; }
  /// The variant of a class that has several looks.
  void setButtonType(int variant) { buttonType = variant; }
  int typeButton() const { return buttonType; }
  /// The finger whose gesture the widget follows, -1 for none.
  void setOwnerFinger(int finger) { ownerFinger = finger; }
  int getOwnerFinger() const { return ownerFinger; }

  /// Starts blinking in `color` (0xAARRGGBB) and returns it, or with `on` 0 stops and returns 0.
  /// Call it on the thread that draws.
  unsigned int setBlink(int on, unsigned int color);
  /// The colour to draw at `now` (GetTicks() milliseconds): black in the dark phase and while
  /// blinking is off. A phase lasts a little over 500 ms; the first one is dark.
  unsigned int updateBlink(unsigned int now);
  /// Follows the left and right keys between two choices (`keyDir`), where the choice may be
  /// taken. Returns 1 when `key` is the select key and at least one may be taken.
  int move_key_select(int key, int canLeft, int canRight);

  // The application's callbacks. Null: not wanted.

  Callback pressCallback;         ///< touch press: buttons, screens, dialogs
  Callback hoverCallback;         ///< touch motion: screens, dialogs
  Callback clickCallback;         ///< touch release inside: buttons, screens, dialogs
  Callback longPressCallback;     ///< long press: buttons, screens, key widget
  Callback doubleClickCallback;   ///< double tap within 500 ms: buttons, screens, slides
  Callback callbackWord5;         ///< never called
  Callback keyPressCallback;      ///< key pressed: dialogs, key widget
  Callback keyReleaseCallback;    ///< key released: dialogs, key widget
  Callback plugCallback;          ///< plug key event: dialogs, key widget
  Callback doubleKeyCallback;     ///< one key released twice within 1000 ms
  Callback tripleKeyCallback;     ///< one key released three times within 1000 ms
  Callback touchPressCallback;    ///< raw touch press: key widget
  Callback touchReleaseCallback;  ///< raw touch release: key widget
  Callback button1Callback;       ///< dialog button 1 released
  Callback button2Callback;       ///< dialog button 2 released
  Callback hookKeyCallback;       ///< hook key in a dialog
  Callback rowPressCallback;      ///< a row of a list dialog pressed
  Callback callbackWord17;        ///< never called
  Callback callbackWord18;        ///< never called
  Callback leftCallback;          ///< slide confirmed to the left
  Callback rightCallback;         ///< slide confirmed to the right
  Callback exitCallback;          ///< exit slide slid to its end

 protected:
  /// Takes the widget out of its layer, by its own address and whatever its id, and waits for a
  /// handler of it that runs on another thread. Its counters and the log are not touched.
  void leaveLayers();
  /// The same, and lowers the window's count of widgets and logs it as Window::unregisterWidget
  /// does.
  void leaveWindow();

  /// Whether a pointer event lies in the rectangle, left and top edges in, the others out. `field`
  /// is one of the widget's, read under its lock; a null event lies nowhere.
  bool isUnder(const SKIA_Rect& field, const event_data* event) const;

  /// A field that handlers and drawing share, read and written under the lock.
  template <typename Field>
  Field read(const Field& field) const {
    const std::lock_guard guard(stateLock);
    return field;
  }
  template <typename Field>
  void write(Field& field, std::type_identity_t<Field> value) {
    const std::lock_guard guard(stateLock);
    field = value;
  }

  /// Guards what handlers and drawing share: `rect`, `text`, `point` and the like of each class.
  /// Held for a few instructions and drawing calls, never while a callback runs.
  mutable std::mutex stateLock;

  int type_ = 0;
  int blink = 0;
  SKIA_Rect rect = {};
  SKIA_Text text = {};
  SKIA_Point point = {};
  std::atomic<int> buttonType = 0;
  std::atomic<int> id_ = 0;          // Window writes it under the layer lock
  std::atomic<bool> active = false;  // publishes to a walk what was set before
  std::atomic<int> select = 0;
  std::atomic<int> ownerFinger = -1;
  FingerHold hold{select};
  unsigned int blinkColor = 0;
  unsigned int blinkNext = 0;   // GetTicks() milliseconds, 0: not started
  unsigned int blinkCount = 0;  // toggles so far
  int keyDir = 0;               // last key selection: 0 none, 1 left, 2 right

 private:
  friend class Layers;
  int registrations = 0;  // entries in the layers; guarded by the layer lock
};

}  // namespace MW
