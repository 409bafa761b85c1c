/// What the text viewer and the keyboard have in common.
#pragma once

#include <MW/detail/delayed_show.h>
#include <MW/detail/text_gesture.h>
#include <MW/widget.h>

#include <array>

namespace MW {

/// What is typed, entered or searched: at most 99 bytes, and NULs behind them.
using ShortText = std::array<char, 100>;

/// A rectangle with a text record that a finger presses, holds and taps. StaticText and Ime say
/// what stands in it and call their callbacks; this class is not used by itself.
///
/// A panel enters the base layer when it is constructed, inactive, and stays there until it is
/// deleted or unregistered. Handlers run on the dispatch thread, drawing on the application's; what
/// the panel shows may be set on any thread. While a finger holds it, it takes the events of all
/// fingers, wherever they are.
///
/// Callbacks are functions of the application, called with 0 on the dispatch thread; null: not
/// wanted. Assign them before the panel becomes active:
///
/// - press_cb / long_press_cb: a press / long press inside, or anywhere while a finger holds the
///   panel.
/// - release_cb: released inside.
/// - double_tap_cb: the second of two taps of which each step took under 500 ms.
class MW_API TextPanel : public Widget {
 public:
  using Widget::show;
  /// show(0).
  int show() override;
  /// From the time set by onShowTimer() on, asks for a redraw in every timer pass.
  void updateTimer(unsigned int ticks) override;
  /// Makes it inactive and lets the finger go. Asks for no redraw. Returns 1.
  int hide() override;
  /// StaticText: the text that its constructor was given, whatever setText() set. Ime: an empty
  /// text.
  char* getText() override;
  unsigned int getBgColor() override;
  unsigned int getTextColor() override;
  int getFontSize() override;
  SKIA_Rect* getPositionAndSize() override;
  // Colours and the font size are only stored: nothing is laid out anew or redrawn.
  void setFontSize(int pixels) override;
  void setTextColor(unsigned int color) override;
  void setBgColor(unsigned int color) override;
  /// Makes it active and has it redrawn from `ms` milliseconds on. From this call on it takes no
  /// events any more, for good.
  void onShowTimer(int ms) override;
  /// Back to the background of its construction, and asks for a redraw if it had another.
  void restoreColor() override;

 protected:
  /// `logWord` stands in every log line and outlives the panel, as a literal does. The panel is not
  /// registered yet.
  explicit TextPanel(const char* logWord);

  /// Takes the place, the background, and of the text record its colour, alignment and size. Null
  /// records are all zero.
  void takeLooks(const SKIA_Rect* area, const SKIA_Text* looks);
  /// Whether an event concerns it: any while a finger holds it, else one inside. None once
  /// onShowTimer was called.
  bool follows(const event_data* event) const;

  // What the handlers do before they call back. Each logs, and answers what happened.

  TextTouch takePress(const event_data& event);
  TextTouch takeRelease(const event_data* event);
  TextTouch takeLongPress() const;
  TextTouch takeTap();

  unsigned int saved_bg_color = 0;  // 0xAARRGGBB; guarded by stateLock
  DelayedShow showTimer;            // guarded by stateLock; never runs out
  TextGesture gesture;              // dispatch thread

 private:
  const char* word;
};

}  // namespace MW
