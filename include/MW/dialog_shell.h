/// A console in a dialog.
#pragma once

#include <MW/framed_dialog.h>

#include <array>

namespace MW {

/// A title, lines of text of which the oldest go when there is no room, and the button "OK", which
/// leaves the dialog up. Callbacks as for FramedDialog.
///
/// The finger that pressed a button holds the dialog until it is hidden: others press and move
/// nothing meanwhile, though one that lifts on the button makes it answer.
class MW_API DialogShell : public FramedDialog {
 public:
  static constexpr int kLines = 25;
  static constexpr int kNoLine = -1;

  /// At most 127 bytes of the title are taken. Null is the empty text.
  explicit DialogShell(const char* title);
  /// With room for so many lines, 1 to 25; others are taken as the nearest of these.
  DialogShell(const char* title, int lineCount);
  ~DialogShell() override;

  using Widget::show;
  /// Draws it, while it takes lines. Returns 1.
  int show(unsigned int ticks) override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;

  /// What the constructors do: an empty console, inactive, without callbacks, and registered.
  void init_DialogShell(const char* title);
  /// Takes all lines away, and lets it take lines.
  void initShell();
  /// Appends a copy of a line below the others and returns where it is kept, 0 to 24. kNoLine: the
  /// line is null or longer than 126 bytes, or no lines are taken. Any thread.
  int addShell(const char* line);
  /// Lays it out on the present screen.
  void setRect_static();

 protected:
  // All are guarded by stateLock.
  int maxLines = kLines;
  std::array<SKIA_Rect, kLines> lineRects = {};  // by place, from the top
  std::array<SKIA_Text, kLines> lines = {};      // by slot
  std::array<int, kLines> order = {};            // the slot that stands at a place
  int twoButtons = 0;                            // no operation sets it: meant so
  int acceptLines = 0;

 private:
  int takeSlot();
};

}  // namespace MW
