/// The text viewer.
#pragma once

#include <MW/detail/text_lines.h>
#include <MW/text_panel.h>

#include <array>
#include <vector>

namespace MW {

/// A long text in rows of a fixed number of characters that a finger scrolls, with line numbers in
/// blue, a scroll bar, and the lines that a search found in red. It shows "no log" while it has no
/// text. See TextPanel for its life and its callbacks, which are functions of one int.
///
/// Characters are bytes of UTF-8. A row holds w / size * 100 / 63 of them, in integers and rounded
/// down to an even number, and 8 more without line numbers; 1 at least and 127 at most. A viewer
/// with line numbers, too, has the 8 more until a setText() that follows a setRect(), so its rows
/// may run out at the right. Where the property "brimol.info.type" is "cpu" at construction, rows
/// hold 88 until a setText() that follows a setRect(). A character of several bytes that a row
/// cannot take whole begins the next row. h / size - 2 rows are in view; a font size under 1 shows
/// none.
///
/// The application may set texts and search on one thread while another one draws. A text, or a
/// text to be searched, counts up to 2 GiB; null is the empty text. Where there is no memory for
/// one, "no log" stays, and a search finds nothing.
class MW_API StaticText : public TextPanel {
 public:
  /// Where line_search_point() goes.
  enum SearchDirection {
    kPrevious = 0,  ///< to the last found line above the top row
    kNext = 1       ///< to the first one below it
  };

  /// Copies the records; null ones are all zero. `looks`' text, of at most 127 bytes, is the first
  /// text. `numbers`: with line numbers. `scroll`: with a scroll bar; without it all events are
  /// taken and nothing happens. `mark`: with found lines in red.
  StaticText(const SKIA_Rect* area, const SKIA_Text* looks, bool numbers, bool scroll, bool mark);
  /// With a scroll bar only.
  StaticText(const SKIA_Rect* area, const SKIA_Text* looks);
  ~StaticText() override;

  using TextPanel::show;
  using Widget::onHover;
  /// Draws what is in view. Returns 1.
  int show(unsigned int ticks) override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  /// A long press in the column of the scroll bar scrolls there.
  void onPressLong(event_data* event) override;
  void onTouchClickCount() override;
  /// Replaces the text. Until the new one is ready, and with an empty one for good, "no log" is
  /// shown. The row that it is scrolled to stays, so a shorter text may lie above the view, which
  /// is blank until a finger or a search scrolls back. Marks stay with the numbers of the lines
  /// that the last search found, whatever these say now.
  void setText(const char* newText) override;
  /// Moves and resizes it; the colour and the first argument are not read. The text is cut anew by
  /// the next setText only. Null: no change.
  void setRect(int variant, const SKIA_Rect* newRect) override;

  /// What the constructors do first: an empty viewer without callbacks, registered. Not while it
  /// handles events. A viewer that is registered already is drawn and called twice from here on:
  /// unregister it first.
  void init(const SKIA_Rect* area, const SKIA_Text* looks);
  /// Every fourth motion scrolls by a row, in the direction of that fourth motion.
  void onHover(mouse_event mouse);

  /// Keeps what is to be searched, cut to 99 bytes at a whole character. Null is the empty text.
  void get_ime_result(const char* wanted);
  /// Searches a text, the one that was given to setText, and scrolls to the first line found. A
  /// wanted text of a single byte is found nowhere. Without line numbers, marked rows stay red down
  /// to the text's end, and from the next frame on all rows are red.
  void line_search(const char* source);
  /// Scrolls to a found line; see SearchDirection. At the end of the text the line stands where it
  /// can. Any other direction: nothing.
  void line_search_point(unsigned int direction);
  /// The top row that brings line `real`, from 1, into view; the present one if there is no such
  /// line.
  int find_real_num(int real);

  // TextPanel says when they are called.

  void (*press_cb)(int zero) = nullptr;
  void (*release_cb)(int zero) = nullptr;
  void (*long_press_cb)(int zero) = nullptr;
  void (*double_tap_cb)(int zero) = nullptr;

 protected:
  static constexpr int kInfoBytes = 100;  // of `info_type`

  // Set before the first event.
  bool is_line_num = false;
  bool is_scroll = false;
  bool is_search_mark = false;
  std::array<char, kInfoBytes> info_type = {};  // the property "brimol.info.type"
  int hover_count = 0;                          // motions since the last row; dispatch thread
  // The rest is guarded by stateLock.
  int is_setting = 0;  // 1: "no log"
  int w_count = 0;     // bytes in a row
  int h_count = 0;     // rows that fit; under 1: none
  int line_count = 0;  // rows of the last text that was not empty
  int last_index = 0;  // the last row that is drawn, mostly an empty one behind the text
  int top_index = 0;   // the first row in view
  int highlight = 0;   // 1: rows are red until the next line number is drawn
  SKIA_Text num_text = {};
  SKIA_Rect scroll_bar = {};  // as last drawn
  TextLines lines;
  ShortText str_searched = {};
  std::vector<int> found_lines;  // line numbers, ascending, one for each match
  std::vector<int> found_index;  // the first row of each

 private:
  enum class Column { Number, Words };

  void tell(TextTouch what) const;
  void measure();
  void logRows(std::size_t needed) const;
  bool jumpTo(const mouse_event& mouse);
  void takeMatches(std::vector<int>& numbers, std::vector<int>& rows);
  int64_t rowsBeyondView() const { return int64_t{line_count} - h_count; }
  int64_t lastTop() const { return int64_t{last_index} - h_count; }
  SKIA_Rect rowPlace(Column column, int64_t down) const;
  void drawPlaceholder() const;
  void drawRows();
  void drawNumber(int lineNumber, int64_t down) const;
  void drawScrollBar();
};

}  // namespace MW
