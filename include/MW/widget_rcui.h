/// Screens described as data.
#pragma once

#include <MW/widget.h>

#include <cstddef>
#include <cstdint>
#include <memory>

namespace MW {

/// What to build. An application fills it and keeps it for the constructor's call alone.
struct ref_t {
  int32_t index = 0;  ///< kinds 0 to 9: the index in the display-item table; the toolkit writes it
  int32_t kind = 0;   ///< see WidgetRcui
  int32_t unread8 = 0;
  int32_t dialogKind = 0;  ///< kind 10: the Dialog's number
  uint8_t unread16 = 0;
  uint8_t visible = 0;  ///< kinds 7, 8: stands in the column; 10 to 26: the widget is active
  uint8_t unread18 = 0;
  uint8_t cbIndex = 0;  ///< kinds 10 to 26: not 0: the callbacks are copied
  int32_t unread20 = 0;
  SKIA_Rect rect = {};       ///< of a line: x1, y1, x2, y2 and the colour
  int32_t lineWidth = 0;     ///< pixels
  int32_t unread48[3] = {};  // NOLINT(modernize-avoid-c-arrays): a record's words
  SKIA_Text text = {};       ///< the caption
  /// Kinds 14 and 23: five texts, or null. The record has no gap before it where pointers are eight
  /// bytes wide, so it is not aligned there: read it by value.
  [[gnu::packed]] const SKIA_Text* desc = nullptr;
};
static_assert(offsetof(ref_t, index) == 0 && offsetof(ref_t, kind) == 4);
static_assert(offsetof(ref_t, dialogKind) == 12 && offsetof(ref_t, visible) == 17);
static_assert(offsetof(ref_t, cbIndex) == 19 && offsetof(ref_t, rect) == 24);
static_assert(offsetof(ref_t, lineWidth) == 44 && offsetof(ref_t, text) == 60);
static_assert(offsetof(ref_t, desc) == 204 && alignof(ref_t) == 4);
static_assert(sizeof(ref_t) == 204 + sizeof(void*), "nothing stands behind the pointer");

/// The application's callbacks. Each is copied into the words of Widget that stand beside it,
/// whether the widget calls them or not; what they are called with stands at the widget's class.
struct ref_cb_t {
  Callback cbPress = {};         ///< pressCallback
  Callback cbClick = {};         ///< clickCallback
  Callback cbLongPress = {};     ///< longPressCallback
  Callback cbDoubleClick = {};   ///< doubleClickCallback
  Callback cbTouchPress = {};    ///< touchPressCallback, callbackWord5, rowPressCallback
  Callback cbTouchRelease = {};  ///< touchReleaseCallback, leftCallback, exitCallback,
                                 ///< button1Callback, callbackWord17
  Callback cbRight = {};         ///< rightCallback, button2Callback, callbackWord18
  Callback cbKeyPress = {};      ///< keyPressCallback
  Callback cbKeyRelease = {};    ///< keyReleaseCallback
  Callback unread9 = {};
  Callback cbDoubleKey = {};  ///< doubleKeyCallback
  Callback cbTripleKey = {};  ///< tripleKeyCallback
  Callback cbExtra = {};      ///< hookKeyCallback
  Callback cbPlug = {};       ///< plugCallback
  Callback cbHover = {};      ///< hoverCallback
};
static_assert(sizeof(ref_cb_t) == 15 * sizeof(Callback));
static_assert(offsetof(ref_cb_t, cbTouchRelease) == 5 * sizeof(Callback));
static_assert(offsetof(ref_cb_t, cbDoubleKey) == 10 * sizeof(Callback));
static_assert(offsetof(ref_cb_t, cbHover) == 14 * sizeof(Callback));

/// Builds one item or widget from a descriptor.
///
/// Kinds 0 to 9 copy a still picture to the display-item table (WidgetList) and have no widget. The
/// item is a text box of kind 0, a box of 2, a line of 4, a picture of 5 and a label of 9; items of
/// 1, 3 and 6 have the number 14, whose look is the platform's.
///
/// Kinds 7 and 8 that are visible are text boxes in a column: 8 begins one at its own rectangle, 7
/// stands directly below the one before, as wide, high and coloured as it. All objects of the
/// process share the column, and one thread makes them, as it uses WidgetList. Those that are not
/// visible are items of the number 14.
///
/// Kinds that build a widget, which registers itself:
///
///     10  Dialog of `dialogKind`           21  SlideE from the left
///     14  DialogNew; `desc` 0 to 2 are     22  SlideE from the right
///         its lines, 3 and 4 its captions  23  Toastbox; `desc` 0 is its second line
///     15  Button                           24  FullScreen, white
///     17  Button3 at the bottom left       25  Progressbar
///     18  Button3 at the bottom centre     26  Key
///     19  Button3 at the bottom right
///
/// Of a Button3, `rect.y` is the number of pixels that stay free below it. Any other kind builds
/// nothing; one that is not 0 to 42 is logged.
///
/// Texts are copied, and cut at their NUL or the end of their record. One without a NUL is logged,
/// and so is a length that is negative or beyond the text's end, which counts as the text's.
///
/// The object owns its widget and deletes it with itself: the application must not delete it,
/// neither from a callback, but may delete the WidgetRcui there. The object itself is in no layer
/// and draws nothing.
class MW_API WidgetRcui : public Widget {
 public:
  /// Nulls build nothing or copy nothing, and are logged. The last argument is not read.
  WidgetRcui(ref_t* ref, const ref_cb_t* cb, unsigned int unused);
  ~WidgetRcui() override;

  /// Copies an item of kinds 0 to 9 to the display-item table. What WidgetList::addQueue returns,
  /// or 0 after a log line for another kind.
  int makeRcuiWidget(const ref_t* ref, unsigned int unused);
  /// Builds the widget of a kind, copies the callbacks, and makes it active or not. A widget that
  /// it has already goes when another one is built.
  void makeRcuiInterface(const ref_t* ref, const ref_cb_t* cb, unsigned int unused);
  /// Copies the callbacks. Logs `cbIndex`, and what is missing.
  void registerCallBack(const ref_cb_t* cb, unsigned char cbIndex, unsigned int unused);
  /// The widget, or null after a log line. It is this object's.
  Widget* getPointer() const;

 protected:
  std::unique_ptr<Widget> w;
};

}  // namespace MW
