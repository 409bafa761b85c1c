/// The list of results in levels.
#pragma once

#include <MW/detail/double_tap.h>
#include <MW/row_list.h>

#include <array>
#include <vector>

namespace MW {

class RowColumn;

/// A line of a result text, taken apart. Texts are cut to 255 bytes at a whole character.
struct MpdLine {
  static constexpr int kFieldBytes = 256;       ///< of a text, its NUL included
  using Field = std::array<char, kFieldBytes>;  ///< a text of the line

  bool details;  ///< the next line has a higher level
  int level;     ///< from 1
  Field head;    ///< the line's first 18 bytes
  Field name;    ///< of the result
  Field value;   ///< of the result
};
static_assert(sizeof(MpdLine) == 776, "flag, level and three texts");

/// A full-screen list of up to 64 results in levels, one row of five cells each: the expand marker,
/// the level, the head text, the name and the value. Above the rows stands an empty white box: it
/// begins at 1/13 of the screen's height and is 1/7 of the screen's height high. A row is 141
/// pixels high, its text 19 on every screen.
///
/// A row followed by one of a higher level is a parent: marked "[>]" while its children are hidden,
/// "[V]" while they are shown. A double tap, each step under 500 ms, changes that. All others are
/// marked "[*]". The last row is never hidden and does not change. A row's colour goes by its
/// level: 1 grey, 2 light orange, 3 orange.
///
/// It enters the base layer when it is constructed, active at once, and leaves it when it is
/// deleted. It is filled by cal_line(), on any thread, also while it is drawn and handlers run.
///
/// Its callbacks get the event's record, valid for the call, and the list, on the dispatch thread.
/// Assign them before Window::init, on the dispatch thread, or while the list is unregistered: an
/// event may arrive as soon as the constructor has returned.
class MW_API MpdWid : public RowList {
 public:
  static constexpr int kItems = 64;  ///< the most rows that a list has

  /// What setListType() takes.
  enum ListType {
    kHitEnd = 0,  ///< hit tests end at this row
    kRow = 1      ///< what cal_line() and addIndex() make
  };

  /// The title is kept, not drawn.
  explicit MpdWid(const char* listTitle);
  ~MpdWid() override;

  using RowList::show;
  /// Draws it. Returns 1.
  int show(unsigned int ticks) override;
  /// Makes it inactive. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;

  using Widget::onHover;
  using Widget::onPress;
  using Widget::onPressKey;
  using Widget::onRelease;
  using Widget::onReleaseKey;
  using Widget::onTouchClickCount;
  using Widget::setFontSize;
  using Widget::setRect;
  using Widget::setText;
  using Widget::setTextColor;

  /// What the constructor does: an empty list without callbacks, laid out, active and registered.
  /// Not while it handles events. A list that is registered already is drawn and called twice from
  /// here on: unregister it first.
  void init_MpdWid();
  /// Lays it out on the present screen. The scroll stays, but the next drawing brings it into the
  /// new area's range.
  void setRect();
  /// Scrolls to the first row.
  void initIndex();

  /// Replaces the rows by those of a text, each a line like "[2] 12:30 [MPDIA] name]value":
  ///
  /// - The level is the number behind the first "["; where there is none, or 0, it is 1. A number
  ///   beyond an int's range becomes the nearest one.
  /// - The head is the line's first 18 bytes, cut at a whole character.
  /// - Behind "[MPDIA]" and one more character stand the name, "]" and the value. Without that "]"
  ///   the name is "no name", and the value all that stands behind "[MPDIA]". Without "[MPDIA]" the
  ///   name is "no name", and the value the line.
  ///
  /// `lines` is read up to its NUL or through the byte with the index `length`, whichever comes
  /// first. Only what a "\n" ends is a line; one that is the text's first byte ends none. Of more
  /// than 64 lines the first 64 are shown. Null, or a length of 0 or less: an empty list. Drawn
  /// texts are cut to 127 bytes. Without memory the rows stay, and a line is logged.
  ///
  /// The scroll stays: call initIndex() afterwards, or a shorter list may stand above its area,
  /// where nothing of it shows.
  void cal_line(const char* lines, int length);
  /// Fills a row: marked "[>]" with `details`, else "[*]". Texts are copied, and cut to 127 bytes
  /// at a whole character; null is empty. A level but 1 to 3 leaves the colour as it was. It is
  /// drawn if cal_line() counted so many. Another index than 0 to 63: nothing.
  // NOLINTNEXTLINE(readability-function-size): applications call it with these arguments
  void addIndex(int index, bool details, int level, const char* head, const char* name,
                const char* value);
  /// Frees the lines taken apart; the rows stay.
  void init_mpd_buf();

  /// Of a row that cal_line() counted; another index: nothing.
  void setBGColor(int index, unsigned int color);
  /// A ListType; any value but kHitEnd is as kRow.
  void setListType(int index, int listType);

  /// The height of the rows, gaps included. It counts as many of the first rows as the last drawing
  /// left visible, but for those of kHitEnd.
  int Max_height();
  /// Scrolls back to where rows are.
  void onHover_temp();

  // Parts of onRecvEvent(); see Widget::onHover().

  void onPressKey(kbd_event key);
  void onReleaseKey(kbd_event key);
  void onPress(mouse_event mouse);
  void onMpdPress(event_data* event);
  void onRelease(mouse_event mouse);
  void onMpdRelease(event_data* event);
  void onHover(mouse_event mouse);
  /// Adds a motion to the drag; a sum above 2 % of the screen's width takes the click away.
  void inClick(int dx, int dy);
  /// Counts taps, and expands or collapses at the second one.
  void onTouchClickCount(event_data* event);
  /// Expands or collapses the row under the event.
  void depth_cal(event_data* event);
  /// Which row the position is taken for: hidden rows count like visible ones, and the list's top
  /// counts twice, so that it is not the row that the user sees there. -1: the search came to a row
  /// of kHitEnd; -100: none.
  int position2index(mouse_event mouse);

  // These are here for callers of an older interface and do nothing.

  void control_context(int, SKIA_Rect*, char*);
  void setText(int, const char*, unsigned int);
  void setFontSize(int, int);
  void setTextColor(int, int);

  /// A press and a release, without a drag between them, that position2index() both answers with
  /// -1. So a list with a row of kHitEnd is clicked wherever position2index() finds none of the
  /// rows before it; a list without one, never.
  void (*click_cb)(mouse_event* event, MpdWid* list) = nullptr;
  /// Every key, pressed and released.
  void (*key_press_cb)(kbd_event* event, MpdWid* list) = nullptr;
  void (*key_release_cb)(kbd_event* event, MpdWid* list) = nullptr;
  /// Every touch that is the list's. A release comes after the click.
  void (*press_cb)(mouse_event* event, MpdWid* list) = nullptr;
  void (*release_cb)(mouse_event* event, MpdWid* list) = nullptr;
  void (*hover_cb)(mouse_event* event, MpdWid* list) = nullptr;

 protected:
  static constexpr int kCells = 5;  // of a row

  /// A row of the list.
  struct Item {
    int listType = kHitEnd;  // a ListType
    int y = 0;               // pixels, by the last drawing
    int height = 0;          // pixels
    unsigned int color = 0;  // 0xAARRGGBB
    int level = 0;           // from 1
    // The cells, from the left; the marker says whether the row is expanded.
    SKIA_Text marker = {};
    SKIA_Text levelText = {};
    SKIA_Text head = {};
    SKIA_Text name = {};
    SKIA_Text value = {};
  };

  // Guarded by stateLock, unless a field says otherwise.
  std::array<SKIA_Rect, kCells> cell = {};  // of the row being drawn
  SKIA_Rect list_rect = {};
  SKIA_Rect bottom_line = {};
  SKIA_Rect header_box = {};
  std::array<Item, kItems> item = {};
  int scroll_y = 0;       // of the first row
  int touch_slop = 0;     // pixels
  int mpd_line = 0;       // rows, at most kItems
  int visible_count = 0;  // rows that the last drawing left visible
  std::vector<MpdLine> mpd_buf;
  unsigned int normalColor = 0;  // of `rect`, before a press
  DoubleTap taps;                // dispatch thread

 private:
  void fillItem(int index, const MpdLine& line);
  RowColumn countedColumn() const;
  void scrollTo(int64_t top);
  void drawRows();
  void drawRow(const Item& row);
  int hiddenFrom(int first) const;
};

}  // namespace MW
