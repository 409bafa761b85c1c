/// A prompt that is answered by dragging.
#pragma once

#include <MW/detail/dialog_frame.h>
#include <MW/widget.h>

namespace MW {

/// A title, a message, and below them a thumb between two captions. A finger drags the thumb by its
/// relative motion; lifted with the thumb at an end, it answers with that side. The thumb then goes
/// back to the middle, and the dialog stays up. A finger that is lifted without having moved
/// answers as the drag before it did. A second finger that presses the thumb takes it over.
///
/// It enters the top layer when it is constructed, inactive, and leaves it when it is deleted.
/// While it is active nothing below gets events. Handlers run on the dispatch thread. The texts may
/// be set by any thread; they are copied. A text of more than 127 bytes is empty, and so is a null
/// one.
class MW_API DialogSlide : public Widget {
 public:
  /// Kinds 3, 4 and 5 ask whether a test that has passed is to be repeated. Others have no texts.
  explicit DialogSlide(int dialogKind);
  ~DialogSlide() override;

  using Widget::show;
  /// Draws it. Returns 1.
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
  /// The number of the layout class: 0, for any kind.
  static int isType(int dialogKind);
  /// Lays it out on the present screen, the same for any kind; the thumb stays until setRect().
  void setRect_init(int dialogKind);
  /// Puts the thumb back to the middle, for any kind.
  void setRect(int dialogKind);
  void setTitle(const char* newTitle);
  void setDesc(const char* newMessage);
  /// A second message, which no kind draws.
  void setDesc2(const char* newMessage);
  void setLeft(const char* caption);
  void setRight(const char* caption);
  /// The thumb's caption, and its width in pixels from the next time that it goes back to the
  /// middle; 0 keeps the width.
  void setSlide(const char* caption, int width);
  void onSlidePressed(mouse_event mouse);
  void onSlideHover(mouse_event mouse);
  void onSlideReleased(mouse_event mouse);
  void onPressKey(kbd_event key) const;
  void onReleaseKey(kbd_event key) const;

  // Called on the dispatch thread. Null: not wanted. Records are valid for the call.

  void (*leftCallback)(int) = nullptr;  ///< the answers, called with 0
  void (*rightCallback)(int) = nullptr;
  void (*keyPressCallback)(kbd_event*) = nullptr;
  void (*keyReleaseCallback)(kbd_event*) = nullptr;
  void (*touchPressCallback)(mouse_event*) = nullptr;  ///< any touch, any place
  void (*touchReleaseCallback)(mouse_event*) = nullptr;
  void (*hoverCallback)(mouse_event*) = nullptr;

 protected:
  /// What `slideState` says.
  enum SlideState { kBetween = 0, kAtLeft = 1, kAtRight = 2 };

  int kind;
  // Guarded by stateLock, as far as it is not said otherwise.
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
  int slideState = kBetween;  // a release keeps it: meant so
  std::atomic<int> lcdOnFlag = 1;

 private:
  bool slideAt(const event_data* event);
  bool grabAt(const event_data* event);
  bool letGoAt(const event_data* event);
  bool isHeldBy(const mouse_event& mouse) const;
  void replace(SKIA_Text& record, const char* words);
};

}  // namespace MW
