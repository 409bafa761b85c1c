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

/// For an argument that an operation does not read.
inline constexpr int kUnused = 0;

/// Everything that can be seen or touched is a Widget.
///
/// The application creates, owns and deletes widgets. A widget is drawn, timed and offered events
/// while it stands in one of the window's layers (Window::registerWidget) and is active. Drawing
/// and timing run on the application's thread, events on the dispatch thread: callbacks run there.
///
/// Deleting a widget takes it out of its layer and waits for a handler of it that runs on another
/// thread. So the deleting thread may hold no lock that this handler, or a callback in it, takes. A
/// callback may delete its own widget. Where callbacks on several threads delete each other's
/// widgets in a circle, one of them does not wait, and another finds its own widget gone.
///
/// Changing a widget does not draw it: setters, setActive(), hide(), Lock() and the like leave the
/// redraw flag as it is, unless a class says otherwise; isDisplayUpdate(1) raises it. Setters may
/// be called on any thread unless their class says otherwise.
///
/// A class that an application derives, and that has state of its own, calls leaveLayers() first in
/// its destructor, so that no other thread meets a half-destroyed object.
class MW_API Widget {
 public:
  /// Inactive and in no layer.
  Widget();
  Widget(const Widget&) = delete;
  Widget& operator=(const Widget&) = delete;

  // The virtual operations, in an order that is part of the binary interface. The base does
  // nothing in each, and answers 0, false or null. The window calls show(ticks), updateTimer() and
  // onRecvEvent() of active widgets, and onRecvEvent() of a widget in the base layer that is
  // selected, active or not. The rest is called by the application or by the widget itself.

  virtual ~Widget();
  /// Draws the widget outside a drawing pass: for the application, on the thread that draws. The
  /// result is the class's to define. The classes of FramedDialog, DialogSelect, DialogSlide,
  /// Toastbox and Progressbar leave it to the base and draw nothing: call show(ticks).
  virtual int show();
  /// Draws it as part of the drawing pass at `ticks` (GetTicks() milliseconds). Window::show calls
  /// it, on the application's thread.
  virtual int show(unsigned int ticks);
  /// The timer pass at GetTicks() milliseconds. Window::updateTimer calls it, on the application's
  /// thread.
  virtual void updateTimer(unsigned int ticks);
  /// For the application: the widget disappears until setActive(1). Its classes differ in what they
  /// forget with it. Any thread.
  virtual int hide();
  /// The one way in for events: the dispatch thread calls it, and an application may, with an event
  /// of its own. True: taken; the event goes to no further widget, and a redraw follows. The event
  /// must not be kept beyond the call. The second argument is 0.
  virtual bool onRecvEvent(event_data* event, unsigned int arg);

  // For the application. Each class's header says which of them it has.

  /// The widget's text, in its own record: valid while the widget lives. Read it on the thread
  /// that sets it.
  virtual char* getText();
  /// Colours are 0xAARRGGBB.
  virtual unsigned int getBgColor();
  virtual unsigned int getTextColor();
  /// In pixels.
  virtual int getFontSize();
  /// The widget's own rectangle record; as for getText().
  virtual SKIA_Rect* getPositionAndSize();
  /// Of the widget's text.
  virtual void setFontSize(int pixels);
  /// Texts are copied, and cut to 127 bytes at a whole character. Null is the empty text.
  virtual void setText(const char* newText);
  /// enum SKIA_Align.
  virtual void setTextAlign(int align);
  /// Colours are 0xAARRGGBB: of the text, background, border and line.
  virtual void setTextColor(unsigned int color);
  virtual void setBgColor(unsigned int color);
  virtual void setBdColor(unsigned int color);
  virtual void setLnColor(unsigned int color);
  /// Makes the widget active now and visible after `ms` milliseconds; of a negative number they are
  /// over already. Raises the redraw flag.
  virtual void onShowTimer(int ms);
  /// Copies a primitive to the display-item table (WidgetList), on that table's thread. The item's
  /// index, or a negative code.
  virtual int add_MWWList();
  /// Tells the widget whether the display's panel is on: any value but 0.
  virtual void lcdOn(int on);
  /// Shows a toast for `ms` milliseconds; of a negative number they are over already, so that the
  /// next drawing pass hides it. Raises the redraw flag.
  virtual void onHideTimer(int ms);

  // Parts of onRecvEvent(), which has tested what they rely on: classes call them on themselves, on
  // the dispatch thread. Derived classes may override them; to play input, call onRecvEvent().

  virtual void onHover(event_data* event);
  virtual void onPress(event_data* event);
  virtual void onRelease(event_data* event);
  virtual void onPressLong(event_data* event);
  /// For the application: moves and resizes. What `variant` means, the class says.
  virtual void setRect(int variant, const SKIA_Rect* newRect);
  /// For the application: the text of a timed widget.
  virtual void setMsg(const char* message);
  /// A part of onRecvEvent(): a tap ended, which may be the second of two.
  virtual void onTouchClickCount();
  /// No class of the toolkit overrides it.
  virtual int setTimer(int ms);
  // Parts of onRecvEvent() again. No class of the toolkit overrides the first two.
  virtual void onPressKey(kbd_event* key);
  virtual void onReleaseKey(kbd_event* key);
  virtual void onPlugKey(kbd_event key);
  virtual void onPressTouch(mouse_event mouse);
  virtual void onReleaseTouch(mouse_event mouse);

  // For the application again.

  /// Shows a progress bar for `ms` milliseconds; 0 takes it away. Of a negative number they are
  /// over already, so that the next drawing pass hides it.
  virtual void onProgressbar(int ms);
  /// Ends a highlight.
  virtual void restoreColor();
  /// Whether a slide follows the finger.
  virtual void Lock();
  virtual void unLock();
  /// The lines and the captions of a free dialog.
  virtual void setDesc(const char* line1, const char* line2, const char* line3, int align);
  virtual void setbutton(const char* caption1, const char* caption2);

  /// Any value but 0 makes the widget active; 0 makes it inactive and unselects it, so that it lets
  /// go of a finger. Any thread.
  void setActive(int on);
  bool isActive() const { return active; }
  /// Non-zero: selected; in the base layer it is offered events before the others, and while it is
  /// active once more if it declines. A widget that a finger holds is selected with the finger's
  /// number + 1. Any thread.
  void setSelect(int value) { select = value; }
  int isSelect() const { return select; }
  /// The layer, a LayerNumber; of a primitive its PrimitiveType. Set it before the widget is
  /// registered.
  void setType(int value) { type_ = value; }
  int type() const { return type_; }
  /// The number that Window::registerWidget gave. After a removal two widgets may have the same.
  void setId(int value) { id_ = value; }
  int id() const { return id_; }
  /// The variant of a class that has several looks.
  void setButtonType(int variant) { buttonType = variant; }
  int typeButton() const { return buttonType; }
  /// The finger whose drag a slide follows, -1 for none.
  void setOwnerFinger(int finger) { ownerFinger = finger; }
  int getOwnerFinger() const { return ownerFinger; }

  /// Starts blinking in `color` (0xAARRGGBB) and returns it, or with `on` 0 stops and returns 0.
  /// Any thread, without `stateLock`, which it takes.
  unsigned int setBlink(int on, unsigned int color);
  /// The colour to draw at `now` (GetTicks() milliseconds): black in the dark phase and while
  /// blinking is off. A phase lasts a little over 500 ms; the first one is dark. Call it under
  /// `stateLock`. At 0 no phase ends, unless that is the time.
  unsigned int updateBlink(unsigned int now);
  /// Which of two choices keys have taken.
  enum KeySide { kNoSide = 0, kLeftSide = 1, kRightSide = 2 };
  /// Follows the left and right keys between two choices (`keyDir`, a KeySide), where the choice
  /// may be taken. Returns 1 when `key` is the select key and at least one may be taken.
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
  /// handler of it that runs on another thread. The window's count and the log stay as they are.
  void leaveLayers();
  /// The same with the log line and the count of Window::unregisterWidget.
  void leaveWindow();

  /// Whether a pointer event lies in the rectangle, left and top edges in, the others out. `field`
  /// is one of the widget's and is read under its lock. False for a null event.
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

  int type_ = 0;                      // what setType() was given
  int blink = 0;                      // 1: it blinks
  SKIA_Rect rect = {};                // its place and colour
  SKIA_Text text = {};                // its caption
  SKIA_Point point = {};              // its line or arrow
  std::atomic<int> buttonType = 0;    // what setButtonType() was given
  std::atomic<int> id_ = 0;           // Window writes it under the layer lock
  std::atomic<bool> active = false;   // publishes to a walk what was set before
  std::atomic<int> select = 0;        // 0, or what setSelect() was given
  std::atomic<int> ownerFinger = -1;  // what setOwnerFinger() was given
  FingerHold hold{select};            // which finger holds it
  unsigned int blinkColor = 0;        // 0xAARRGGBB
  unsigned int blinkNext = 0;         // when the phase ends: GetTicks() milliseconds
  bool blinkRuns = false;             // false: the first phase begins with the next drawing
  unsigned int blinkCount = 0;        // toggles so far
  int keyDir = kNoSide;               // last key selection

 private:
  friend class Layers;
  int registrations = 0;  // entries in the layers; guarded by the layer lock
};

}  // namespace MW
