/// What the coloured pages over the whole screen have in common.
#pragma once

#include <MW/detail/key_clicks.h>
#include <MW/widget.h>

#include <array>
#include <cstddef>

namespace MW {

/// A box of one colour over the whole screen, with up to four text boxes on it. The classes derived
/// from it add access to colours and texts; this class is not used by itself.
///
/// The application owns the page. A page enters the top layer, inactive, when it is constructed and
/// leaves it when it is deleted; setActive(1) brings it up, and it never hides itself. While it is
/// active, the widgets underneath get no events. The application's thread draws it. onRecvEvent(),
/// the one entry for events, runs on the dispatch thread and calls the handlers declared below and
/// the callbacks; a callback may delete the page. The page takes keys, but no touches and no null
/// event. Touches and setters (any thread) raise no redraw flag: call isDisplayUpdate(1).
class MW_API ColorPage : public Widget {
 public:
  static constexpr unsigned int kTexts = 4;  ///< text boxes of a page
  /// The most bytes of text that a box takes. A longer text, or a record without a NUL, is ignored.
  static constexpr std::size_t kPageTextMax = 123;

  /// show(0).
  int show() override;
  /// Draws the page, be it active or not, and its text boxes up to the highest number that was set.
  /// A box below it that was not set has no size and says "ABC". Returns 1.
  int show(unsigned int ticks) override;
  /// Raises the redraw flag from the time of the last key click on, if a derived class has set
  /// `timerOn`: in every timer pass from the first one on that finds the time reached.
  void updateTimer(unsigned int ticks) override;
  /// Makes it inactive. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  /// Keeps the value in `lcdOnFlag`, for derived classes; touches are reported as before.
  void lcdOn(int on) override;
  void onPressTouch(mouse_event mouse) override;
  void onReleaseTouch(mouse_event mouse) override;

  using Widget::onPressKey;
  using Widget::onReleaseKey;
  using Widget::setRect;
  using Widget::setText;
  /// Lays it out on the present screen and draws it in its given colour from now on. The arguments
  /// are not read.
  void setRect(int unused1, int unused2);
  /// The given colour, 0xAARRGGBB. It shows after the next setRect().
  void setBg_title(unsigned int color);
  /// Text box `index`, 0 to 3: its place and colour, and its text; any other index: nothing.
  void setText(unsigned int index, SKIA_Rect area, SKIA_Text caption);
  /// Parts of onRecvEvent(); see Widget::onHover().
  void onPressKey(kbd_event key) const;
  void onReleaseKey(kbd_event key);
  /// Counts a release of the key that was released last; any other key ends the count.
  void onKeyClickCount(kbd_event key);

  // The application's own callbacks; they hide the base's of the same names. Null: not wanted. Set
  // them before the page is active or in one of them. Records are copies, valid for the call.

  void (*touchPressCallback)(mouse_event*) = nullptr;
  void (*touchReleaseCallback)(mouse_event*) = nullptr;
  void (*keyPressCallback)(kbd_event*) = nullptr;
  void (*keyReleaseCallback)(kbd_event*) = nullptr;
  /// The second and the third release of the same key, each within 1000 ms of the one before.
  void (*doubleKeyCallback)(kbd_event*) = nullptr;
  void (*tripleKeyCallback)(kbd_event*) = nullptr;

 protected:
  /// A text box of a page.
  struct TextBox {
    SKIA_Rect area = {};  // its place and colour
    SKIA_Text text = {};  // what it says
  };

  /// `color`: as for setBg_title(). The derived class registers the page.
  explicit ColorPage(unsigned int color);
  /// The box's text record, or null where there is none.
  SKIA_Text* textAt(unsigned int index);

  std::atomic<int> timerOn = 0;            // for derived classes; nothing here sets it
  std::atomic<unsigned int> lastTick = 0;  // GetTicks() milliseconds of the last key release
  std::atomic<int> lcdOnFlag = 1;          // what lcdOn() was told
  // The rest is guarded by stateLock, and so is `rect`: the page in its drawn colour.
  unsigned int bgColor;
  unsigned int textCount = 0;  // boxes drawn
  std::array<TextBox, kTexts> boxes = {};
  KeyClicks keyClicks;           // updateTimer() waits for its time
  unsigned int timeReached = 0;  // which it found reached last: later wraps do not matter to it
};

}  // namespace MW
