/// A console in a dialog.
#pragma once

#include <MW/framed_dialog.h>

#include <array>

namespace MW {

/// A modal console: a title, lines of text of which the oldest goes when there is no room, and the
/// button "OK", which leaves the dialog up. Callbacks as for FramedDialog.
///
/// The finger that presses the button holds the dialog until it is hidden. Meanwhile presses and
/// motion of other fingers are not taken, and no callback gets them. Releases are taken as ever,
/// and the button answers any finger that lifts on it.
class MW_API DialogShell : public FramedDialog {
 public:
  static constexpr int kLines = 25;   ///< the most that it shows
  static constexpr int kNoLine = -1;  ///< in the place of a line's number

  /// At most 127 bytes of the title are taken. Null is the empty text.
  explicit DialogShell(const char* title);
  /// With room for `lineCount` lines, brought into 1 to 25.
  DialogShell(const char* title, int lineCount);
  ~DialogShell() override;

  using Widget::show;
  /// Draws it, be it active or not; lines without text stay blank. Returns 1.
  int show(unsigned int ticks) override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;

  /// What the constructors do: an empty console, inactive, without callbacks, and registered. A
  /// further call registers the dialog a second time: each drawing pass then draws it twice.
  void init_DialogShell(const char* title);
  /// Takes all lines away. Any thread.
  void initShell();
  /// Appends a copy of a line below the others and returns its slot, 0 to 24. kNoLine: the line is
  /// null or longer than 126 bytes. Any thread; raises no redraw flag (isDisplayUpdate(1) does).
  int addShell(const char* line);
  /// Lays it out on the present screen.
  void setRect_static();

 protected:
  // All are guarded by stateLock.
  int maxLines = kLines;
  std::array<SKIA_Rect, kLines> lineRects = {};  // by place, from the top
  std::array<SKIA_Text, kLines> lines = {};      // by slot
  std::array<int, kLines> order = {};            // the slot that stands at a place
  int twoButtons = 0;   // 1, from a derived class: setRect_static() lays out "CANCEL", too
  int acceptLines = 0;  // 0, from a derived class: no line is taken and nothing drawn

 private:
  int takeSlot();
};

}  // namespace MW
