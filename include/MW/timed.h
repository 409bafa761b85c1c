/// Widgets that show for a given time and take no input.
#pragma once

#include <MW/detail/star_row.h>
#include <MW/widget.h>

namespace MW {

/// One or two lines of text that hide themselves after a while.
///
/// It enters the base layer when it is constructed and leaves it when it is deleted. It is inactive
/// until onHideTimer(); made active in any other way it goes away in the next drawing pass.
class MW_API Toastbox : public Widget {
 public:
  /// One line, on a box of `area`'s colour. Copies the records; null ones are all zero or empty.
  Toastbox(const SKIA_Rect* area, const SKIA_Text* line);
  /// Two lines, each in half of the box. With an odd height the box is one pixel lower than `area`.
  Toastbox(const SKIA_Rect* area, const SKIA_Text* line, const SKIA_Text* message);
  ~Toastbox() override;

  using Widget::show;
  /// Draws it, or makes it inactive once its time is over. Returns 1.
  int show(unsigned int ticks) override;
  /// Raises the redraw flag once its time is over.
  void updateTimer(unsigned int ticks) override;
  /// The first line.
  void setText(const char* newText) override;
  /// The second line; without one: nothing.
  void setMsg(const char* message) override;
  /// Shows it from now for `ms` milliseconds; a time that still runs is replaced.
  void onHideTimer(int ms) override;
  /// `lineCount` 2 divides the box into two halves; any other leaves them as they are.
  void setRect(int lineCount, const SKIA_Rect* newRect) override;

  /// What the constructors do: lays it out inactive, and registers it.
  void init(const SKIA_Rect* area, const SKIA_Text* line, const SKIA_Text* message);

 protected:
  int lines;  // 1 or 2
  // The rest is guarded by stateLock.
  unsigned int hideAt = 0;  // GetTicks() milliseconds, 0: no time set
  SKIA_Text toastText = {};
  SKIA_Text toastMsg = {};
  SKIA_Rect upperRect = {};
  SKIA_Rect lowerRect = {};
};

/// A bar with a caption and a row of asterisks that grows while something goes on.
///
/// It enters the base layer when it is constructed and leaves it when it is deleted. It is inactive
/// until onProgressbar().
class MW_API Progressbar : public Widget {
 public:
  /// The bar is twice as high as `area`: the caption stands in the upper half, the asterisks in the
  /// lower. The first argument is not read. Copies the records; null ones are all zero or empty.
  Progressbar(int unused, const SKIA_Rect* area, const SKIA_Text* caption);
  ~Progressbar() override;

  using Widget::show;
  /// Draws it, or makes it inactive once its time is over. Returns 1.
  int show(unsigned int ticks) override;
  /// Raises the redraw flag when the row is to grow or the time is over.
  void updateTimer(unsigned int ticks) override;
  /// The first argument is not read.
  void setRect(int unused, const SKIA_Rect* newRect) override;
  /// Shows it from now for `ms` milliseconds; 0 takes it away.
  void onProgressbar(int ms) override;

 protected:
  // Guarded by stateLock.
  SKIA_Rect frameRect = {};
  SKIA_Rect barRect = {};  // its width is never set: meant so, it draws nothing
  SKIA_Rect textRect = {};
  SKIA_Rect starRect = {};
  SKIA_Text starText = {};
  int running = 0;         // 1 while it is shown
  unsigned int endAt = 0;  // GetTicks() milliseconds
  StarRow stars;
};

}  // namespace MW
