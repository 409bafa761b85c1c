/// A prompt that is answered by dragging.
#pragma once

#include <MW/detail/dialog_frame.h>
#include <MW/widget.h>

namespace MW {

/// A modal prompt: a title, a message, and below them a thumb between two captions. A finger drags
/// the thumb by its relative motion, and if it lifts with the thumb at an end, the dialog answers
/// with that side. The thumb then goes back to the middle; the dialog stays up. A finger that lifts
/// without having moved answers as the drag before it did. A second finger takes the thumb over by
/// a press on its place in the middle, wherever the thumb has been dragged.
///
/// The application owns the dialog. A dialog enters the top layer, inactive, when it is constructed
/// and leaves it when it is deleted; setActive(1) brings it up. While it is active, the widgets
/// underneath get no events. The application's thread draws it; show() without ticks draws nothing.
/// onRecvEvent(), the one entry for events, runs on the dispatch thread and calls the handlers
/// declared below and the callbacks; a callback may delete the dialog. A null event is not taken.
/// The texts may be set by any thread and are copied; that raises no redraw flag
/// (isDisplayUpdate(1) does). A null text is empty, and so is one of more than 127 bytes.
class MW_API DialogSlide : public Widget {
 public:
  /// What it asks.
  enum Kind {
    kOwnTexts = 0,         ///< the setters give the texts; so is any number without a name
    kRepeatPassedTest = 3  ///< asks whether a passed test is to be repeated; 4 and 5 say the same
  };

  /// `dialogKind`: a Kind or any other number.
  explicit DialogSlide(int dialogKind);
  ~DialogSlide() override;

  using Widget::show;
  /// Draws it, be it active or not. Returns 1.
  int show(unsigned int ticks) override;
  /// Makes it inactive, and sensitive to touch the next time. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  /// 0: the thumb ignores touches until it is called with another value, or the dialog was hidden.
  void lcdOn(int on) override;
  void onHover(event_data* event) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;

  using Widget::onPressKey;
  using Widget::onReleaseKey;
  using Widget::setDesc;
  using Widget::setRect;
  /// The number of a kind's layout, as Dialog::isType() gives it: Dialog::kStandard for any.
  static int isType(int dialogKind);
  /// Lays it out on the present screen, the same for any kind; the thumb stays until setRect().
  void setRect_init(int dialogKind);
  /// Puts the thumb back to the middle, for any kind.
  void setRect(int dialogKind);
  /// Replaces the title; the message.
  void setTitle(const char* newTitle);
  void setDesc(const char* newMessage);
  /// A second message, which no kind draws.
  void setDesc2(const char* newMessage);
  /// The captions at the ends.
  void setLeft(const char* caption);
  void setRight(const char* caption);
  /// The thumb's caption, and its width in pixels from the next time that it goes back to the
  /// middle; 0 keeps the width.
  void setSlide(const char* caption, int width);
  /// Parts of onRecvEvent(); see Widget::onHover().
  void onSlidePressed(mouse_event mouse);
  void onSlideHover(mouse_event mouse);
  void onSlideReleased(mouse_event mouse);
  void onPressKey(kbd_event key) const;
  void onReleaseKey(kbd_event key) const;

  // Called on the dispatch thread; they hide the base's of the same names. Null: not wanted. Set
  // them before the dialog is active or in one of them. Records are copies, valid for the call.

  void (*leftCallback)(int) = nullptr;  ///< the answers, called with 0
  void (*rightCallback)(int) = nullptr;
  void (*keyPressCallback)(kbd_event*) = nullptr;
  void (*keyReleaseCallback)(kbd_event*) = nullptr;
  void (*touchPressCallback)(mouse_event*) = nullptr;  ///< every touch, at any place
  void (*touchReleaseCallback)(mouse_event*) = nullptr;
  void (*hoverCallback)(mouse_event*) = nullptr;

 protected:
  /// What `slideState` says.
  enum SlideState { kBetween = 0, kAtLeft = 1, kAtRight = 2 };

  int kind;  // as constructed
  // Guarded by stateLock, except for lcdOnFlag.
  DialogFrame frame;
  SKIA_Rect messageRect = {};
  SKIA_Text message = {};
  SKIA_Text second = {};
  SKIA_Rect slideRow = {};
  SKIA_Rect thumb = {};
  SKIA_Rect thumbHome = {};
  SKIA_Text thumbCaption = {};
  SKIA_Rect leftRect = {};
  SKIA_Text leftCaption = {};
  SKIA_Rect rightRect = {};
  SKIA_Text rightCaption = {};
  int slideState = kBetween;  // changed by motion alone, so that a release keeps it
  std::atomic<int> lcdOnFlag = 1;

 private:
  bool slideAt(const event_data* event);
  bool grabAt(const event_data* event);
  bool letGoAt(const event_data* event);
  bool isHeldBy(const mouse_event& mouse) const;
  void replace(SKIA_Text& record, const char* words);
};

}  // namespace MW
