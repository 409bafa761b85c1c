// The whole panel in cells, each of which a finger has to reach.
#include <algorithm>
#include <memory>
#include <vector>

#include "language/language.h"
#include "layout.h"
#include "measure_page.h"
#include "pages/table.h"

namespace factory_test {

namespace {

constexpr int kGap = 1;  // pixels between cells

/// Only what the panel reports paints a cell: nothing is painted between two reports, as a part of
/// the panel that is dead would be painted, too.
class TouchGridPage : public MeasurePage {
 public:
  explicit TouchGridPage(const Context& program)
      : MeasurePage(program, "touch_grid", tr("Touch grid"),
                    tr("Paint every cell,\nedges and corners too.")),
        grid(gridOf(pixelsOf(parameter("cell mm"), 1, kMostPixels))),
        painted(placeOf(grid.rows, 0)) {}

  std::vector<Measure> values() const override {
    return {measure("cells", static_cast<double>(painted.size())),
            measure("cells missed", static_cast<double>(std::ranges::count(painted, false)))};
  }

 protected:
  void follow(const Input& input) override {
    const ScreenSize screen = screenSize();
    if (input.kind == Input::Kind::KeyPress || input.kind == Input::Kind::KeyRelease) return;
    const int column = std::clamp(input.x * grid.columns / screen.width, 0, grid.columns - 1);
    const int row = std::clamp(input.y * grid.rows / screen.height, 0, grid.rows - 1);
    painted.at(placeOf(row, column)) = true;
  }

  bool isDone() const override { return std::ranges::count(painted, false) == 0; }

  void drawLook() override {
    const ScreenSize screen = screenSize();
    skia_add_box_c({0, 0, screen.width, screen.height, kEdgeColor});
    for (int i = 0; i < grid.rows * grid.columns; ++i) {
      const int left = i % grid.columns * screen.width / grid.columns;
      const int top = i / grid.columns * screen.height / grid.rows;
      const int right = (i % grid.columns + 1) * screen.width / grid.columns;
      const int bottom = (i / grid.columns + 1) * screen.height / grid.rows;
      skia_add_box_c({left, top, right - left - kGap, bottom - top - kGap,
                      painted.at(static_cast<std::size_t>(i)) ? kPassInk.ground : kPageInk.ground});
    }
  }

 private:
  static constexpr int kMostPixels = 4096;
  static constexpr uint32_t kEdgeColor = 0xFF55617A;

  struct Cells {
    int rows;
    int columns;
  };

  // As many cells as there is room for, so that none is larger than was asked for by much.
  static Cells gridOf(int side) {
    const ScreenSize screen = screenSize();
    return {std::max(screen.height / side, 1), std::max(screen.width / side, 1)};
  }

  std::size_t placeOf(int row, int column) const {
    return static_cast<std::size_t>(row) * static_cast<std::size_t>(grid.columns) +
           static_cast<std::size_t>(column);
  }

  Cells grid;
  std::vector<bool> painted;  // row by row
};

}  // namespace

std::unique_ptr<Test> makeTouchGrid(const Context& program) {
  return std::make_unique<TouchGridPage>(program);
}

}  // namespace factory_test
