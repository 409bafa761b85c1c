/// Coloured pages over the whole screen.
#pragma once

#include <MW/detail/key_clicks.h>
#include <MW/widget.h>

#include <array>
#include <cstddef>

namespace MW {

/// What the pages have in common; not used by itself. A box of one colour over the whole screen,
/// with up to four text boxes on it.
///
/// A page enters the top layer when it is constructed, inactive, and leaves it when it is deleted.
/// While it is active nothing below gets events. It never hides itself. It tells the application
/// of touches and keys, takes the keys, and passes the touches on. Handlers run on the dispatch
/// thread.
class MW_API ColorPage : public Widget {
 public:
  static constexpr unsigned int kTexts = 4;
  /// Bytes of text that a box takes. A longer one, or one without a NUL, is ignored.
  static constexpr std::size_t kPageTextMax = 123;

  /// show(0).
  int show() override;
  /// Draws the page and its text boxes up to the last one that was set; one of them that was not
  /// set has no size and says "ABC". Returns 1.
  int show(unsigned int ticks) override;
  /// Raises the redraw flag once `timerOn` is set and the time of the last key click is over.
  void updateTimer(unsigned int ticks) override;
  /// Makes it inactive. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  /// Is kept, and nothing else follows from it here.
  void lcdOn(int on) override;
  void onPressTouch(mouse_event mouse) override;
  void onReleaseTouch(mouse_event mouse) override;

  using Widget::onPressKey;
  using Widget::onReleaseKey;
  using Widget::setRect;
  using Widget::setText;
  /// Lays it out on the present screen in its colour as given. The arguments are not read.
  void setRect(int unused1, int unused2);
  /// The colour as given, 0xAARRGGBB: setRect() makes it the drawn one.
  void setBg_title(unsigned int color);
  /// Text box `index`, 0 to 3: its place and colour, and its text; any other index: nothing.
  void setText(unsigned int index, SKIA_Rect area, SKIA_Text caption);
  void onPressKey(kbd_event key) const;
  void onReleaseKey(kbd_event key);
  /// Counts a release of the key that was released last; any other key ends the count.
  void onKeyClickCount(kbd_event key);

  // The application's own callbacks; they hide the base's of the same names. Null: not wanted.
  // Records are valid for the call.

  void (*touchPressCallback)(mouse_event*) = nullptr;
  void (*touchReleaseCallback)(mouse_event*) = nullptr;
  void (*keyPressCallback)(kbd_event*) = nullptr;
  void (*keyReleaseCallback)(kbd_event*) = nullptr;
  /// The second and the third release of one key of which each comes within 1000 ms of the one
  /// before.
  void (*doubleKeyCallback)(kbd_event*) = nullptr;
  void (*tripleKeyCallback)(kbd_event*) = nullptr;

 protected:
  /// A text box of a page.
  struct TextBox {
    SKIA_Rect area = {};
    SKIA_Text text = {};
  };

  /// The page is not registered yet.
  explicit ColorPage(unsigned int color);
  /// The box's text record, or null where there is none.
  SKIA_Text* textAt(unsigned int index);

  std::atomic<int> timerOn = 0;            // nothing here sets it
  std::atomic<unsigned int> lastTick = 0;  // GetTicks() milliseconds of the last key release
  std::atomic<int> lcdOnFlag = 1;
  // The rest, and `rect`, the page in its drawn colour, is guarded by stateLock.
  unsigned int bgColor;
  unsigned int textCount = 0;  // boxes drawn
  std::array<TextBox, kTexts> boxes = {};
  KeyClicks keyClicks;  // its time is also the tick that updateTimer() waits for: meant so
};

/// A warning in a colour of the application's.
class MW_API DialogWarn : public ColorPage {
 public:
  /// `color`: 0xAARRGGBB.
  explicit DialogWarn(unsigned int color);
  ~DialogWarn() override;

  /// Replaces a box's text and its length, but puts the NUL where the old text ended: it cuts a
  /// longer one, and behind a shorter one the old one's rest stays in the record. Null is the empty
  /// text. An index over 3: nothing.
  void setText_str(unsigned int index, const char* newText);
};

/// The same with access to its colours and texts.
class MW_API AutoCapScreen : public ColorPage {
 public:
  /// The argument is not read: the page is transparent until setBgColor().
  explicit AutoCapScreen(unsigned int unused);
  ~AutoCapScreen() override;

  /// The colour that is drawn, 0xAARRGGBB. It lasts until the next setRect().
  unsigned int getBgColor() override;
  void setBgColor(unsigned int color) override;

  using Widget::getText;
  using Widget::getTextColor;
  using Widget::setTextColor;
  /// As DialogWarn's, without the cut.
  void setText_str(unsigned int index, const char* newText);
  /// A box's own text record, valid while the page lives; read it on the thread that sets it. Null
  /// for an index over 3.
  SKIA_Text* getText(unsigned int index);
  /// The colour of a box's text. An index over 3: nothing, and 0.
  void setTextColor(unsigned int index, unsigned int color);
  unsigned int getTextColor(unsigned int index);
};

}  // namespace MW
