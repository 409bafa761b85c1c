/// What stands above the menu's list.
#pragma once

#include <MW/main_list.h>

#include <optional>
#include <utility>

#include "layout.h"
#include "machine_figures.h"
#include "records/line.h"
#include "run_progress.h"

namespace factory_test {

/// The title, what to do, whose the run is, how far the run has come, what the line has, and
/// figures of the machine, in the place of the list's own title bar, whose letters are of one size
/// on every screen. Construct it after the list.
class MenuHead : public MW::Widget {
 public:
  MenuHead();
  /// The mode of the list whose title bar has room for it.
  static int listMode();
  ~MenuHead() override;

  int height() const { return rect.h; }

  using Widget::show;
  int show(unsigned int ticks) override;
  /// On the thread that draws.
  void tell(const MachineFigures& newFigures) { figures = newFigures; }
  void tell(const RunProgress& newProgress) { progress = newProgress; }
  void tell(std::optional<LineStatus> newStatus) { line = std::move(newStatus); }

 private:
  void drawFigures(const SKIA_Rect& area, const Grid& grid) const;

  MachineFigures figures;
  RunProgress progress;
  std::optional<LineStatus> line;  // nothing: there is none
};

}  // namespace factory_test
