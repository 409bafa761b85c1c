/// What the lists of rows have in common.
#pragma once

#include <MW/detail/click_slop.h>
#include <MW/widget.h>

#include <atomic>

namespace MW {

/// A full-screen list that a finger scrolls and clicks. MainList and MpdWid say what its rows are;
/// this class is not used by itself.
class MW_API RowList : public Widget {
 public:
  using Widget::show;
  /// show(0).
  int show() override;
  /// Keeps whether the display is on; when that changes, the finger that holds the list is let go.
  void lcdOn(int on) override;

 protected:
  /// `logWord` stands in every log line and outlives the list, as a literal does. The list is not
  /// registered yet.
  RowList(const char* logWord, const char* listTitle);

  /// The line below the list, at the screen's foot.
  static SKIA_Rect footLine(int screenWidth, int screenHeight);
  /// How many pixels a finger may move and still click.
  static int clickSlop(int screenWidth);
  /// Whether an event is the list's: one in its `area`, a field, or any while a finger holds it,
  /// which is followed wherever it moves. While it is held, other fingers' pointer events with
  /// codes up to `last` are refused.
  bool takesTouch(const event_data& event, const SKIA_Rect& area, EventCode last) const;
  /// From here on the release of the finger that holds the list may be a click on `row`.
  void pressRow(int row);
  // Log lines.
  void logKeyPress(const kbd_event& key) const;
  void logKeyRelease(const kbd_event& key) const;
  void logHit(int64_t top, const mouse_event& mouse, int64_t bottom) const;

  // Guarded by stateLock, unless a field says otherwise.
  SKIA_Text title;  // does not change
  ClickSlop click;
  std::atomic<int> lcdState = 1;

 private:
  const char* word;
};

}  // namespace MW
