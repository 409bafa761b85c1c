/// Prompts whose texts the application gives.
#pragma once

#include <MW/prompt_dialog.h>

#include <array>

namespace MW {

struct DialogGrid;

/// A modal prompt with a title, up to three lines, and below them one or two buttons, a progress
/// row or nothing. Callbacks as for PromptDialog; the hook key is ignored. A dialog without
/// buttons answers no touch: the application hides it.
///
/// The setters may be called by any thread, at any time, but raise no redraw flag
/// (isDisplayUpdate(1) does). Texts are copied, and cut to 127 bytes at a whole character.
class MW_API DialogNew : public PromptDialog {
 public:
  static constexpr int kLines = 3;  ///< the most that a dialog shows

  /// `align`: SKIA_ALIGN_LEFT, SKIA_ALIGN_RIGHT or SKIA_ALIGN_CENTRE. `color`: 0xAARRGGBB. `size`:
  /// pixels; 0 is 70. With a null title there is none, and the other arguments are not used.
  DialogNew(const char* title, int align, int color, int size);
  DialogNew(const char* title, int align, int color);
  ~DialogNew() override;

  using Widget::show;
  /// Draws it, be it active or not; a progress row grows. Returns 1.
  int show(unsigned int ticks) override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  /// The lines, up to the first null one; `align` as above. Lays out: the letters of one line are
  /// larger than those of two or three.
  void setDesc(const char* line1, const char* line2, const char* line3, int align) override;
  /// The captions, up to the first null one. Lays out: one button is as wide as two together;
  /// without any the row is left out.
  void setbutton(const char* caption1, const char* caption2) override;

  using Widget::onPressKey;
  using Widget::setRect;
  /// A part of onRecvEvent(); see Widget::onHover().
  void onPressKey(kbd_event key);
  /// What the constructors do first: no title, lines, buttons or callbacks. The layout stays.
  void DialogNew_init();
  /// Lays it out on the present screen.
  void setRect();
  /// Lines aligned to the left.
  void setDesc(const char* line1, const char* line2, const char* line3);
  /// A progress row instead of buttons. It shows that something goes on, not how much: the argument
  /// is not used. Lays out.
  void setProgress(unsigned int amount);
  /// The colour of the screen around the dialog, half-transparent black at first.
  void setBackGroundColor(unsigned int color);
  /// The body's colour, 0xAARRGGBB. It shows after setDescBlink(0) and then a layout: setRect(),
  /// setDesc(), setbutton() or setProgress().
  void setDescColor(unsigned int color);
  /// 1, as at first: the body is drawn in the widget's blink colour, black while setBlink() is off.
  /// Any other value: it keeps its last colour until the next layout.
  void setDescBlink(int on);

 protected:
  /// What stands below the lines. A derived class that sets another number leaves that row empty,
  /// and with kHookMode gets the hook key.
  enum ButtonMode { kOneButton = 0, kTwoButtons = 1, kProgressRow = 3, kNoButtons = 4 };
  static constexpr int kNoLines = 4;  // in the place of the last line's number

  // All are guarded by stateLock.
  int buttonMode = kNoButtons;
  int descLast = kNoLines;  // the last line, from 0; beyond the three, or below 0: no line
  unsigned int descBgColor = kColorBlack;
  int descBlink = 1;
  std::array<SKIA_Rect, kLines> descRects = {};
  std::array<SKIA_Text, kLines> descs = {};

 private:
  void emptyButtons();
  std::size_t lineCount() const;
  void layOut();
  void layOutLines();
  void layOutButtons(const DialogGrid& grid);
};

}  // namespace MW
