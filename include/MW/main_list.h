/// The scrolling main menu.
#pragma once

#include <MW/row_list.h>

#include <array>

namespace MW {

class RowColumn;

/// A title bar with status texts, and under it a list of up to 64 items that a finger scrolls.
///
/// It enters the base layer when it is constructed, inactive, and leaves it when it is deleted. It
/// is filled by addIndex() and drawn from initFinish() on. The items may be changed on any thread
/// while handlers run.
///
/// An item is drawn while its top lies strictly between the list's top and bottom edges, so an item
/// whose top is the list's own is missing: the first one at rest, and the one that move_key_up()
/// scrolled to. Begin the list with an item of height 0, and after move_key_up() call onHover()
/// with a motion of yrel 1.
///
/// The list marks no current item and does not move by keys itself: the application calls
/// move_key_down() and move_key_up() from its key callback and recolours the item.
///
/// Its callbacks get the event's record, valid for the call, and the list, on the dispatch thread.
/// Assign them before the list becomes active.
class MW_API MainList : public RowList {
 public:
  static constexpr int kItems = 64;         ///< the most that a list has
  static constexpr int kOptions = 8;        ///< status texts
  static constexpr int kNotMoved = -100;    ///< in the place of an item's number
  static constexpr int kTitleHeight = 340;  ///< pixels, of the title bar: the list begins below it
  static constexpr int kExtendedTitleHeight = 510;  ///< the same with kExtended

  /// What stands in the title bar.
  enum Mode {
    kPlain = 0,    ///< the title, brightness, battery and charger
    kExtended = 1  ///< the other five status texts, too
  };

  /// What an item's `kind` says. Any other looks as kSelectable, but is not clicked.
  enum ItemKind {
    kEnd = 0,         ///< ends the list: neither it nor what stands behind it is drawn
    kSelectable = 1,  ///< white on grey (0xFF787878); clicks and keys find it
    kGrey = 2,        ///< dark grey (0xFF353535) on the same grey
    kDark = 3         ///< white on nearly black (0xFF0F0F0F)
  };

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

  /// `listMode`: a Mode; any other value is kPlain.
  MainList(const char* listTitle, int listMode);
  explicit MainList(const char* listTitle);
  ~MainList() override;

  using RowList::show;
  /// Draws it. Returns 1.
  int show(unsigned int ticks) override;
  /// Makes it inactive. Returns 0.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;

  using Widget::onHover;
  using Widget::onPress;
  using Widget::onPressKey;
  using Widget::onRelease;
  using Widget::onReleaseKey;
  using Widget::setFontSize;
  using Widget::setRect;
  using Widget::setText;
  using Widget::setTextColor;

  /// What the constructors do: an empty list without callbacks, laid out inactive and registered. A
  /// list that is registered already is drawn and called twice from here on: unregister it first.
  void init_MainList(int listMode);
  /// Lays it out on the present screen, with the title bar of a mode. The status texts become what
  /// they were at first; which of them are drawn stays as the mode given to the constructor or
  /// init_MainList() said.
  void setRect(int listMode);
  /// Takes all items away. A finished list stays finished, so that it takes no new ones: only
  /// init_MainList() opens it again.
  void initIndex();
  /// Appends an item and returns its number, from 0. -1: the list is full or finished, the text is
  /// null or longer than 126 bytes. `height` in pixels. The colours are the kind's, not the
  /// record's.
  int addIndex(int kind, const SKIA_Text* item, int height);
  /// Ends the filling; the first selectable item becomes the current one.
  void initFinish();
  /// The height of all items with a gap of 3 pixels between them.
  int Max_height();

  // Changes of an item. Another number than an item's: nothing.

  /// Copies a text of up to `length` bytes, 1 to 126, without its NUL: what stood behind it stays
  /// there, and the length alone says where the text ends. To empty an item give ("", 1). Null, or
  /// any other length: nothing.
  void setText(int item, const char* newText, unsigned int length);
  /// Of its text.
  void setFontSize(int item, int pixels);
  /// Colours are 0xAARRGGBB.
  void setTextColor(int item, unsigned int color);
  void setBGColor(int item, unsigned int color);
  /// Changes what the item is, not its colours.
  void setListType(int item, int kind);

  // The status texts: up to `length` bytes, 1 to 126, of `newText`. To empty one give ("", 1).
  // Null, or another length or number: nothing.

  void setTextOption(int number, const char* newText, int length);
  void setTextBattery(const char* newText, int length);
  void setTextTa(const char* newText, int length);
  void setTextBrightness(const char* newText, int length);
  /// Does nothing: the title bar stays black.
  void setTitleBGColor(int color);

  void onPressKey(kbd_event key);
  void onReleaseKey(kbd_event key);
  void onPress(mouse_event mouse);
  void onRelease(mouse_event mouse);
  /// Scrolls by the motion, if the list is higher than its area.
  void onHover(mouse_event mouse);
  /// Adds a motion to the drag; a sum above 2 % of the screen's width takes the click away.
  void inClick(int dx, int dy);
  /// The item at the position; its first line of pixels does not belong to it. Where there is none,
  /// -1, or -100 if all 64 items are there and none of kEnd ends the list.
  int position2index(mouse_event mouse);
  /// Moves the current item to the next, or previous, selectable one and scrolls it into view. The
  /// item's number, or -100 when there is none. The argument is not read.
  int move_key_down(int unused);
  int move_key_up(int unused);

  /// A selectable item was pressed and released. list->position2index(*event) says which.
  void (*clickCallback)(mouse_event* event, MainList* list) = nullptr;
  /// Every key, pressed and released.
  void (*keyPressCallback)(kbd_event* event, MainList* list) = nullptr;
  void (*keyReleaseCallback)(kbd_event* event, MainList* list) = nullptr;
  /// Every touch that is the list's. A release comes after the click.
  void (*pressCallback)(mouse_event* event, MainList* list) = nullptr;
  void (*releaseCallback)(mouse_event* event, MainList* list) = nullptr;
  /// A motion has scrolled the list, or reached its end.
  void (*scrollCallback)(mouse_event* event, MainList* list) = nullptr;

 protected:
  /// An item of the list.
  struct Item {
    int kind = kEnd;           // an ItemKind
    int height = 0;            // pixels
    unsigned int bgColor = 0;  // 0xAARRGGBB
    SKIA_Text text = {};       // what it says, in its colour
  };
  /// A status text.
  struct Option {
    SKIA_Rect rect = {};  // its place
    SKIA_Text text = {};  // what it says
  };

  // Guarded by stateLock.
  int mode = kPlain;
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
  int scroll = 0;     // pixels, 0 or less
  int touchSlop = 0;  // pixels
  int shown = 0;      // 1 between the first drawing and hide()

 private:
  template <typename Change>
  void changeItem(int item, Change change);
  bool isClicked(int item) const;
  int nextSelectable(int from, int step) const;
  RowColumn columnOf(int itemCount) const;
  RowColumn wholeColumn() const;
  void drawItems() const;
  void drawStatus() const;
};

}  // namespace MW
