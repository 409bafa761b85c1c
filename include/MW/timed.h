/// Widgets that show for a given time and take no input.
#pragma once

#include <MW/detail/star_row.h>
#include <MW/widget.h>

namespace MW {

/// One or two lines of text that hide themselves after a while.
///
/// It enters the base layer when it is constructed and leaves it when it is deleted. It is inactive
/// until onHideTimer(). Made active in any other way, it goes away in the next drawing pass.
///
/// An odd height is rounded down to an even one. show() without ticks draws nothing: only the time
/// tells whether the box is still to be seen.
class MW_API Toastbox : public Widget {
 public:
  /// One line, on a box of `area`'s colour. Copies the records. Null records are all zero or empty.
  Toastbox(const SKIA_Rect* area, const SKIA_Text* line);
  /// Two lines, each in half of the box.
  Toastbox(const SKIA_Rect* area, const SKIA_Text* line, const SKIA_Text* message);
  ~Toastbox() override;

  using Widget::show;
  /// Draws it, or makes it inactive once its time is over. Returns 1.
  int show(unsigned int ticks) override;
  /// Raises the redraw flag once its time is over.
  void updateTimer(unsigned int ticks) override;
  /// Sets the first line.
  void setText(const char* newText) override;
  /// Sets the second line. Does nothing on a box of one line.
  void setMsg(const char* message) override;
  /// Shows it from now for `ms` milliseconds; a time that still runs is replaced. A negative one is
  /// over already. Raises the redraw flag.
  void onHideTimer(int ms) override;
  /// `lineCount` 2 divides the box into two halves; any other leaves them as they are. Null: no
  /// change.
  void setRect(int lineCount, const SKIA_Rect* newRect) override;

  /// Already called by the constructors. Calling it again lays it out anew, inactive, and registers
  /// it a second time.
  void init(const SKIA_Rect* area, const SKIA_Text* line, const SKIA_Text* message);

 protected:
  int lines;  // 1 or 2
  // The rest is guarded by stateLock.
  unsigned int hideAt = 0;   // GetTicks() milliseconds, 0: no time set
  unsigned int shownMs = 0;  // from onHideTimer() to hideAt
  SKIA_Text toastText = {};
  SKIA_Text toastMsg = {};
  SKIA_Rect upperRect = {};
  SKIA_Rect lowerRect = {};
};

/// A bar with a caption and a row of asterisks that grows while something goes on.
///
/// It enters the base layer when it is constructed and leaves it when it is deleted. It is inactive
/// until onProgressbar().
///
/// show() without ticks draws nothing: the row grows with the time.
class MW_API Progressbar : public Widget {
 public:
  /// The bar is twice as high as `area`: the caption stands in the upper half, the asterisks in the
  /// lower. The first argument is not read. Copies the records. Null records are all zero or empty.
  Progressbar(int unused, const SKIA_Rect* area, const SKIA_Text* caption);
  ~Progressbar() override;

  using Widget::show;
  /// Draws it, or makes it inactive once its time is over. Returns 1.
  int show(unsigned int ticks) override;
  /// Raises the redraw flag when the row is to grow or the time is over.
  void updateTimer(unsigned int ticks) override;
  /// The first argument is not read. Null: no change.
  void setRect(int unused, const SKIA_Rect* newRect) override;
  /// Shows it from now for `ms` milliseconds; 0 takes it away. A negative time is over already.
  void onProgressbar(int ms) override;

 protected:
  // Guarded by stateLock.
  SKIA_Rect frameRect = {};
  SKIA_Rect barRect = {};  // its width stays 0, so that nothing of it is seen
  SKIA_Rect textRect = {};
  SKIA_Rect starRect = {};
  SKIA_Text starText = {};
  int running = 0;           // 1 while it is shown
  unsigned int endAt = 0;    // GetTicks() milliseconds
  unsigned int shownMs = 0;  // from onProgressbar() to endAt
  StarRow stars;
};

}  // namespace MW
