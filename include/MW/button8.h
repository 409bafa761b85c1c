/// The multi-touch test pad.
#pragma once

#include <MW/button_face.h>

#include <array>

namespace MW {

/// Up to eight square cells in a rectangle, each of which its own finger can hold. A cell is a
/// round box with a "*", red while it is held. The rectangle itself is not drawn.
///
/// The layout number says rows x columns; cells are numbered row by row, from the left:
///
///     0: 1 x 1    1: 2 x 2    2: 3 x 2    3: 4 x 2    4: 2 x 3    5: 2 x 4
///
/// Any other number leaves the shape as it is: no cells at first.
///
/// A pad enters the base layer when it is constructed, inactive, and stays there until it is
/// deleted or unregistered. Handlers run on the dispatch thread. A cell is free again when any
/// finger lifts in it: a finger that slides away leaves it held. Touches inside the rectangle are
/// taken, in a cell or not, but motions and long presses are not.
///
/// Callbacks, functions of one mouse_event* that is valid for the call: `pressCallback` and
/// `clickCallback` (released). The record is the event's, but its `state` says which cells are
/// held now: bit 0 for the first.
class MW_API Button8 : public ButtonFace {
 public:
  static constexpr int kCells = 8;

  /// Copies both records; `area`'s colour is that of free cells. The text is kept, not drawn. Null
  /// records: see primitives.h.
  Button8(int layout, const SKIA_Rect* area, const SKIA_Text* caption);
  ~Button8() override;

  using Widget::show;
  /// The cells in their order. Returns 1.
  int show(unsigned int ticks) override;
  /// Makes it inactive and frees all cells. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  /// Lays it out in a rectangle of any size, and takes over its colour. Held cells stay held.
  /// Null: no change.
  void setRect(int layout, const SKIA_Rect* newRect) override;
  /// The colour of free cells.
  void setBgColor(unsigned int color) override;
  /// The colour and width in pixels of a frame that is not drawn.
  void setBdColor(unsigned int color) override;
  void setBdWidth(int pixels);
  /// Takes the rows and columns of a layout number; setRect() lays cells out by them.
  void getRowCol(int layout);
  /// The cell around an event's point, whose edges do not belong to it; kCells: none.
  int getButtonSelect(const event_data* event) const;

 protected:
  using Holders = std::array<int, kCells>;

  // Guarded by stateLock.
  Holders cellSelect = {};  // the holding finger + 1, 0: free
  std::array<SKIA_Rect, kCells> cellRect = {};
  std::array<SKIA_Text, kCells> cellText = {};
  int rows = 0;
  int cols = 0;
  int cellCount = 0;  // laid out

 private:
  Holders setHolder(int cell, int holder);
};

}  // namespace MW
