/// Screens described as data.
#pragma once

#include <MW/widget.h>

#include <cstddef>
#include <cstdint>
#include <memory>

namespace MW {

/// What a descriptor builds. A widget registers itself.
enum RcuiKind {
  kRcuiTextbox = 0,
  kRcuiBox = 2,
  kRcuiLine = 4,
  kRcuiImage = 5,
  /// While `visible`, a text box directly below the column's last one, as wide, high and coloured
  /// as that. The process's first one stands at its own rectangle. Else an item of the type 14.
  kRcuiNextInColumn = 7,
  kRcuiFirstInColumn = 8,  ///< the same, but it begins a new column at its own rectangle
  kRcuiLabel = 9,
  kRcuiDialog = 10,         ///< a Dialog of `dialogKind`
  kRcuiDialogNew = 14,      ///< `desc` 0 to 2 are its lines, 3 and 4 its captions
  kRcuiButton = 15,         ///< a Button
  kRcuiButton3Left = 17,    ///< a Button3 at the foot; `rect.y` pixels stay free below it
  kRcuiButton3Centre = 18,  ///< a Button3 at the foot; `rect.y` pixels stay free below it
  kRcuiButton3Right = 19,   ///< a Button3 at the foot; `rect.y` pixels stay free below it
  kRcuiSlideFromLeft = 21,  ///< a SlideE
  kRcuiSlideFromRight = 22,
  kRcuiToastbox = 23,    ///< `desc` 0 is its second line, where there is one
  kRcuiFullScreen = 24,  ///< a white FullScreen
  kRcuiProgressbar = 25,
  kRcuiKey = 26
};

/// What to build. An application fills it and keeps it for the constructor's call alone.
struct ref_t {
  int32_t index = 0;  ///< kinds 0 to 9: the index in the display-item table; the toolkit writes it
  int32_t kind = 0;   ///< RcuiKind
  int32_t unread8 = 0;       ///< not read
  int32_t dialogKind = 0;    ///< of kRcuiDialog
  uint8_t unread16 = 0;      ///< not read
  uint8_t visible = 0;       ///< not 0: stands in the column, or the widget is active
  uint8_t unread18 = 0;      ///< not read
  uint8_t cbIndex = 0;       ///< not 0: the widget gets the callbacks
  int32_t unread20 = 0;      ///< not read
  SKIA_Rect rect = {};       ///< of a line: x1, y1, x2, y2 and the colour
  int32_t lineWidth = 0;     ///< pixels
  int32_t unread48[3] = {};  // NOLINT(modernize-avoid-c-arrays): a record's words
  SKIA_Text text = {};       ///< the caption
  /// Of kRcuiDialogNew and kRcuiToastbox: five texts, or null. The record has no gap before it
  /// where pointers are eight bytes wide, so it is not aligned there: read it by value.
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
  Callback unread9 = {};         ///< not read
  Callback cbDoubleKey = {};     ///< doubleKeyCallback
  Callback cbTripleKey = {};     ///< tripleKeyCallback
  Callback cbExtra = {};         ///< hookKeyCallback
  Callback cbPlug = {};          ///< plugCallback
  Callback cbHover = {};         ///< hoverCallback
};
static_assert(sizeof(ref_cb_t) == 15 * sizeof(Callback));
static_assert(offsetof(ref_cb_t, cbTouchRelease) == 5 * sizeof(Callback));
static_assert(offsetof(ref_cb_t, cbDoubleKey) == 10 * sizeof(Callback));
static_assert(offsetof(ref_cb_t, cbHover) == 14 * sizeof(Callback));

/// Builds one item or widget from a descriptor; RcuiKind says which.
///
/// Items are copied to the display-item table (WidgetList) and have no widget. All objects of the
/// process share one column; make them on one thread, as with WidgetList. Of the kinds
/// without a name, 1, 3 and 6 make items of the type 14, whose look is the platform's; all others
/// build nothing, and a negative one is logged.
///
/// Texts are copied where the kind shows them. One without a NUL is logged and cut to 127 bytes. A
/// length that is negative or above 127 is logged and replaced by the text's own. The length of an
/// item's text counts, NULs within it included; widgets show their texts up to the NUL. One of the
/// five texts of `desc` is there when its length is not 0, even where its first byte is the NUL.
///
/// The object owns its widget and deletes it with itself: the application must not delete it,
/// not even from a callback, but may delete the WidgetRcui there. The object itself is in no layer
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
  std::unique_ptr<Widget> w;  // what was built
};

}  // namespace MW
