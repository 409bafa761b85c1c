/// The multi-touch test pad.
#pragma once

#include <MW/button_face.h>

#include <array>

namespace MW {

/// Up to eight square cells in a rectangle, each of which can be held by a different finger. A
/// cell is a box with rounded corners and a "*", red while it is held. The rectangle itself is not
/// drawn.
///
/// A pad enters the base layer when it is constructed, inactive, and stays there until it is
/// deleted or unregistered. Handlers run on the dispatch thread. A cell is free again when any
/// finger lifts in it: a finger that slides away leaves it held. Presses and releases inside the
/// rectangle are taken, in a cell or not; motions and long presses are not.
///
/// Callbacks, functions of one mouse_event* that is valid for the call: `pressCallback` and
/// `clickCallback` (released). The record is a copy of the event's whose `state` is a bit mask of
/// the held cells: bit 0 for the first cell, bit 1 for the second and so on.
class MW_API Button8 : public ButtonFace {
 public:
  static constexpr int kCells = 8;  ///< the most that a pad has
  /// Rows by columns; cells are numbered row by row, from the left. Any other number leaves the
  /// shape as it is: no cells at first.
  enum Layout {
    kOneCell = 0,
    kTwoByTwo = 1,
    kThreeByTwo = 2,
    kFourByTwo = 3,
    kTwoByThree = 4,
    kTwoByFour = 5
  };

  /// Copies both records; `area`'s colour is that of free cells. The text is kept, not drawn. Null
  /// records are all zero or empty.
  Button8(int layout, const SKIA_Rect* area, const SKIA_Text* caption);
  ~Button8() override;

  /// show(0).
  int show() override;
  /// The cells in their order. Returns 1.
  int show(unsigned int ticks) override;
  /// Makes it inactive and frees all cells. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  /// Lays it out in a rectangle of any size, and takes over its colour. Cells of a rectangle that
  /// is too narrow for its layout overlap. Held cells stay held. Null: no change.
  void setRect(int layout, const SKIA_Rect* newRect) override;
  /// Sets the colour of free cells.
  void setBgColor(unsigned int color) override;
  /// Store the colour and width, in pixels, of a frame that is never drawn.
  void setBdColor(unsigned int color) override;
  void setBdWidth(int pixels);
  /// Sets the rows and columns to those of a layout; the cells follow at the next setRect().
  void getRowCol(int layout);
  /// The first cell that contains the event's point, or kCells. A point on an edge is outside.
  int getButtonSelect(const event_data* event) const;

 protected:
  /// A word for each cell.
  using Holders = std::array<int, kCells>;

  // Guarded by stateLock.
  Holders cellSelect = {};  // FingerHold::wordOf the holding finger, 0: free
  std::array<SKIA_Rect, kCells> cellRect = {};
  std::array<SKIA_Text, kCells> cellText = {};
  int rows = 0;
  int cols = 0;
  int cellCount = 0;  // laid out

 private:
  Holders setHolder(int cell, int holder);
};

}  // namespace MW
