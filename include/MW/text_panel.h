/// What the text viewer and the keyboard have in common.
#pragma once

#include <MW/detail/delayed_show.h>
#include <MW/detail/double_tap.h>
#include <MW/widget.h>

#include <array>

namespace MW {

/// What is typed, entered or searched: at most 99 bytes, and NULs behind them.
using ShortText = std::array<char, 100>;

/// A rectangle with a text record that a finger presses, holds and taps. StaticText and Ime say
/// what stands in it; this class is not used by itself.
///
/// A panel enters the base layer when it is constructed, inactive, and stays there until it is
/// deleted or unregistered. Handlers run on the dispatch thread, drawing on the application's; what
/// the panel shows may be set on any thread.
///
/// `Self` is what the callbacks are given behind their 0: nothing, or the panel's own class.
template <typename... Self>
class MW_API TextPanel : public Widget {
 public:
  /// A function of the application, called on the dispatch thread. Null: not wanted.
  using PanelCallback = void (*)(int zero, Self*... panel);

  using Widget::show;
  /// show(0).
  int show() override;
  /// Asks for a redraw in every timer pass from the time on that onShowTimer set.
  void updateTimer(unsigned int ticks) override;
  /// Makes it inactive and free. Asks for no redraw. Returns 1.
  int hide() override;
  char* getText() override;
  unsigned int getBgColor() override;
  unsigned int getTextColor() override;
  int getFontSize() override;
  SKIA_Rect* getPositionAndSize() override;
  // Colours and the font size are only stored: nothing is laid out anew or redrawn.
  void setFontSize(int pixels) override;
  void setTextColor(unsigned int color) override;
  void setBgColor(unsigned int color) override;
  /// Makes it active and has it redrawn from `ms` milliseconds on. It takes no events any more:
  /// meant so.
  void onShowTimer(int ms) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  void onPressLong(event_data* event) override;
  void onTouchClickCount() override;
  /// Back to the background of its construction, and asks for a redraw if it had another.
  void restoreColor() override;

  PanelCallback press_cb = nullptr;
  PanelCallback release_cb = nullptr;  ///< released inside
  PanelCallback long_press_cb = nullptr;
  PanelCallback double_tap_cb =
      nullptr;  ///< the second of two taps of which each step took under 500 ms

 protected:
  /// `logWord` speaks in the log and is a literal. The panel is not registered yet.
  explicit TextPanel(const char* logWord);

  /// Takes the place, the background, and of the text record its colour, alignment and size. Null
  /// records are all zero.
  void takeLooks(const SKIA_Rect* area, const SKIA_Text* looks);
  /// Whether an event concerns it: any while a finger holds it, else one inside. None once
  /// onShowTimer was called.
  bool follows(const event_data* event) const;

  unsigned int saved_bg_color = 0;  // 0xAARRGGBB; guarded by stateLock
  DelayedShow showTimer;            // guarded by stateLock; never runs out
  DoubleTap taps;                   // dispatch thread

 private:
  void call(PanelCallback callback);
  bool isInside(const event_data* event) const;

  const char* word;
};

}  // namespace MW
