/// The choice of one of six.
#pragma once

#include <MW/widget.h>

#include <array>

namespace MW {

/// A modal panel with a title and six large square buttons in three rows of two. A touch that lifts
/// on the button that it pressed is the answer; one that slides off gives the button up.
///
/// The application owns the dialog. A dialog enters the top layer, inactive, when it is constructed
/// and leaves it when it is deleted; setActive(1) brings it up, and it never hides itself. While it
/// is active, the widgets underneath get no events. The application's thread draws it; show()
/// without ticks draws nothing. onRecvEvent(), the one entry for events, runs on the dispatch
/// thread and calls the handlers declared below and the callbacks; a callback may delete the
/// dialog. A null event is not taken.
///
/// Call isDisplayUpdate(1) after an answer, after a touch has slid off its button, and after a
/// setter (any thread): these ask for no redraw, so the screen would stay as it is. No release is
/// taken, even if it answers, and no motion that leaves the pressed button.
///
/// The dialog also calls these callbacks of the base: `hoverCallback`, of one mouse_event*;
/// `plugCallback`, of one kbd_event*; `hookKeyCallback`, of one int, called with 0 for the hook key
/// after setButtonType(kHookVariant). Records are copies, valid for the call.
class MW_API DialogSelect : public Widget {
 public:
  static constexpr unsigned int kChoices = 6;  ///< buttons of a dialog
  static constexpr int kHookVariant = 13;      ///< setButtonType(): the hook key answers

  /// `kind` has no meaning here: a derived class finds it in `selectKind`.
  explicit DialogSelect(unsigned int kind);
  ~DialogSelect() override;

  using Widget::show;
  /// Draws it, be it active or not, with all six buttons, also those without a caption. Returns 1.
  int show(unsigned int ticks) override;
  /// Makes it inactive. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  /// 0: touches are reported but choose nothing, until it is called with another value. Any thread.
  void lcdOn(int on) override;
  void onHover(event_data* event) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  void onPlugKey(kbd_event key) override;

  using Widget::onPressKey;
  using Widget::onReleaseKey;
  using Widget::setRect;
  /// Lays it out on the present screen, nothing highlighted. The arguments are not read.
  void setRect(int unused1, int unused2);
  /// Texts of at most 127 bytes; null is the empty text.
  void setTitle(const char* newTitle);
  /// The caption of choice `index`, 0 to 5 row by row; any other: nothing.
  void setText_str(unsigned int index, const char* caption);
  /// Highlights choice `index`, 0 to 5, as the pressed one; any other index: nothing.
  void onBtnPressed(mouse_event mouse, int index);
  /// Answers with choice `index`, 0 to 5; any other index: nothing.
  void onBtnReleased(mouse_event mouse, int index);
  /// In variant kHookVariant the hook key goes to onHookKeyPressed(); otherwise it is ignored.
  void onPressKey(kbd_event key);
  /// Parts of onRecvEvent(); see Widget::onHover().
  void onReleaseKey(kbd_event key) const;
  void onHookKeyPressed();

  // The application's own callbacks; they hide the base's of the same names. Null: not wanted. Set
  // them before the dialog is active or in one of them.

  /// The answer: the release, its `state` the number of the choice, 1 to 6 row by row.
  void (*choiceCallback)(mouse_event*) = nullptr;
  /// Every key but a press of the hook key.
  void (*keyPressCallback)(kbd_event*) = nullptr;
  void (*keyReleaseCallback)(kbd_event*) = nullptr;
  /// Every touch, at any place.
  void (*touchPressCallback)(mouse_event*) = nullptr;
  void (*touchReleaseCallback)(mouse_event*) = nullptr;

 protected:
  /// A button of the dialog.
  struct Choice {
    SKIA_Rect face = {};     // its place, in the colour it has now
    SKIA_Text caption = {};  // what it says
  };

  unsigned int selectKind;                 // as constructed
  unsigned int optionColor = kColorWhite;  // of a button that is not pressed
  std::atomic<int> enabled = 1;            // 0: touches choose nothing
  // Guarded by stateLock.
  SKIA_Rect border = {};  // the visible panel
  SKIA_Rect backdrop = {};
  SKIA_Rect titleStrip = {};
  SKIA_Text title = {};
  std::array<Choice, kChoices> choices = {};

 private:
  bool hoverAt(event_data* event);
  bool pressAt(event_data* event);
  void releaseAt(event_data* event);
  unsigned int pressedChoice() const;
  bool isOn(unsigned int index, const event_data* event) const;
  void restoreFaces();
};

}  // namespace MW
