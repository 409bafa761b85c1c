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
  /// Keeps whether the panel is on; when that changes, the finger that holds the list is let go.
  void lcdOn(int on) override;
  /// Adds a motion to the drag; a sum above 2 % of the screen's width takes the click away.
  void inClick(int dx, int dy);

 protected:
  /// `logWord` stands in every log line and outlives the list, as a literal does. The list is not
  /// registered yet.
  RowList(const char* logWord, const char* listTitle);

  /// Lays out what does not depend on the rows. The caller holds stateLock.
  void layOutFrame(int screenWidth, int screenHeight);
  /// Whether an event is the list's: one in its area, or any while a finger holds it, which is
  /// followed wherever it moves. Other fingers' events up to the code `last` are not.
  bool takesTouch(const event_data& event, EventCode last) const;
  /// The finger holds the list from here on, and may become a click on the row.
  void pressRow(const mouse_event& mouse, int row);
  void logKeyPress(const kbd_event& key) const;
  void logKeyRelease(const kbd_event& key) const;
  void logHit(int64_t top, const mouse_event& mouse, int64_t bottom) const;

  // Guarded by stateLock, unless a field says otherwise.
  SKIA_Text title;  // does not change
  SKIA_Rect listRect = {};
  SKIA_Rect bottomEdge = {};
  ClickSlop click;
  int touchSlop = 0;  // pixels
  std::atomic<int> lcdState = 1;

 private:
  const char* word;
};

}  // namespace MW
