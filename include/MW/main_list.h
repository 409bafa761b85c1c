/// The scrolling main menu.
#pragma once

#include <MW/detail/click_slop.h>
#include <MW/widget.h>

#include <array>

namespace MW {

/// A title bar with status texts, and under it a list of up to 64 items that a finger scrolls.
///
/// It enters the base layer when it is constructed, inactive, and leaves it when it is deleted. It
/// is filled by addIndex() and drawn from initFinish() on. The items and their number may be
/// changed by the application's thread while handlers run.
///
/// The list marks no current item and does not move by keys itself: the application calls
/// move_key_down() and move_key_up() from its key callback and recolours the item.
///
/// Its callbacks get the event's record, valid for the call, and the list, on the dispatch thread.
class MW_API MainList : public Widget {
 public:
  static constexpr int kItems = 64;
  static constexpr int kOptions = 8;
  static constexpr int kNotMoved = -100;
  static constexpr int kTitleHeight = 340;  ///< pixels, of the title bar: the list begins below it
  static constexpr int kExtendedTitleHeight = 510;

  /// What stands in the title bar.
  enum Mode {
    kPlain = 0,    ///< the title, brightness, battery and charger
    kExtended = 1  ///< the other five status texts, too
  };

  /// What an item's `kind` says; others look as kGrey with white text.
  enum ItemKind { kEnd = 0, kSelectable = 1, kGrey = 2, kDark = 3 };

  /// The numbers of the status texts, for setTextOption().
  enum StatusText {
    kBattery,
    kCharger,
    kOperator,
    kAddress,
    kSignal,
    kTestMode,
    kBle,
    kBrightness
  };

  /// `listMode` 1 adds five more status texts to the title bar.
  MainList(const char* listTitle, int listMode);
  explicit MainList(const char* listTitle);
  ~MainList() override;

  /// show(0).
  int show() override;
  /// Draws it. Returns 1.
  int show(unsigned int ticks) override;
  /// Makes it inactive. Returns 0.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  /// Keeps whether the panel is on; when that changes, the finger that holds the list is let go.
  void lcdOn(int on) override;

  using Widget::onHover;
  using Widget::onPress;
  using Widget::onPressKey;
  using Widget::onRelease;
  using Widget::onReleaseKey;
  using Widget::setFontSize;
  using Widget::setRect;
  using Widget::setText;
  using Widget::setTextColor;

  /// What the constructors do: an empty list, laid out inactive and registered.
  void init_MainList(int listMode);
  /// Lays it out on the present screen.
  void setRect(int listMode);
  /// Takes all items away.
  void initIndex();
  /// Appends an item and returns its number, from 0. -1: the list is full or finished, the text is
  /// null or longer than 126 bytes. `height` in pixels.
  int addIndex(int kind, const SKIA_Text* item, int height);
  /// Ends the filling; the first selectable item becomes the current one.
  void initFinish();
  /// The height of all items with a gap of 3 pixels between them.
  int Max_height();

  // Changes of an item. Another number than an item's: nothing.

  /// Copies `length` bytes, 1 to 126, and no NUL: what stood behind them stays there, and the
  /// length alone says where the text ends. Null, or any other length: nothing.
  void setText(int item, const char* newText, unsigned int length);
  void setFontSize(int item, int pixels);
  void setTextColor(int item, unsigned int color);
  void setBGColor(int item, unsigned int color);
  void setListType(int item, int kind);

  // The status texts. `length` bytes, 1 to 126, of `newText`; null, another length or number:
  // nothing.

  void setTextOption(int number, const char* newText, int length);
  void setTextBattery(const char* newText, int length);
  void setTextTa(const char* newText, int length);
  void setTextBrightness(const char* newText, int length);
  /// Does nothing: meant so.
  void setTitleBGColor(int color);

  void onPressKey(kbd_event key);
  void onReleaseKey(kbd_event key);
  void onPress(mouse_event mouse);
  void onRelease(mouse_event mouse);
  void onHover(mouse_event mouse);
  /// The item at the position; its first row of pixels does not belong to it. Where there is none,
  /// -1, or -100 if all 64 items are there and none of kind 0 ends the list.
  int position2index(mouse_event mouse);
  /// Adds a motion to the drag; one that is too long takes the click away.
  void inClick(int dx, int dy);
  /// Moves the current item to the next, or previous, selectable one and scrolls it into view. The
  /// item's number, or -100 when there is none. The argument is not read.
  int move_key_down(int unused);
  int move_key_up(int unused);

  void (*clickCallback)(mouse_event* event, MainList* list) = nullptr;  ///< a selectable item
  void (*keyPressCallback)(kbd_event* event, MainList* list) = nullptr;
  void (*keyReleaseCallback)(kbd_event* event, MainList* list) = nullptr;
  void (*pressCallback)(mouse_event* event, MainList* list) = nullptr;
  void (*releaseCallback)(mouse_event* event, MainList* list) = nullptr;
  void (*scrollCallback)(mouse_event* event, MainList* list) = nullptr;

 protected:
  struct Item {
    int kind = kEnd;
    int height = 0;  // pixels
    unsigned int bgColor = 0;
    SKIA_Text text = {};
  };
  struct Option {
    SKIA_Rect rect = {};
    SKIA_Text text = {};
  };

  // Guarded by stateLock, as far as it is not said otherwise.
  int mode = 0;
  SKIA_Text title = {};
  SKIA_Rect screenRect = {};
  SKIA_Rect titleBar = {};
  SKIA_Rect titleRect = {};
  SKIA_Rect bottomEdge = {};
  SKIA_Rect listRect = {};
  std::array<Option, kOptions> option;
  std::array<Item, kItems> items;
  int count = 0;
  int finished = 0;  // 1 after initFinish()
  int current = -1;
  int scroll = 0;  // pixels, 0 or less
  ClickSlop click;
  int touchSlop = 0;  // pixels
  int shown = 0;      // 1 between the first drawing and hide()
  std::atomic<int> lcdState = 1;

 private:
  template <typename Change>
  void changeItem(int item, Change change);
  bool isClicked(int item) const;
  int64_t contentHeight() const;
  int64_t heightUpTo(int end) const;
  int nextSelectable(int from, int step) const;
  void drawItems() const;
  void drawStatus() const;
};

}  // namespace MW
