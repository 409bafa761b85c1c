// Two to ten fingers that move together and apart.
#include <algorithm>
#include <cmath>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "language/language.h"
#include "layout.h"
#include "measure_page.h"
#include "pages/table.h"

namespace factory_test {

namespace {

constexpr double kLeastRatio = 2;  // of the widest to the narrowest
constexpr uint32_t kSpokeColor = 0xFFE8C040;

/// Measures how far the fingers lie apart, by their mean distance from their middle, while as many
/// are down as were asked for.
class PinchPage : public MeasurePage {
 public:
  explicit PinchPage(const Context& program)
      : MeasurePage(program, "pinch", tr("Pinch"),
                    wordsFor(stepOf(program, "pinch").parameter("fingers"))) {}

  std::vector<Measure> values() const override {
    const bool isMeasured = most >= wanted();
    return measure({{"fingers counted", most},
                    {"narrowest", isMeasured ? millimetres(narrowest) : kNotMeasured},
                    {"widest", isMeasured ? millimetres(widest) : kNotMeasured}});
  }

 protected:
  void follow(const Input& input) override {
    using enum Input::Kind;
    if (input.kind == KeyPress || input.kind == KeyRelease) return;
    fingers.insert_or_assign(input.finger, input);
    if (input.kind == Lift) fingers.erase(input.finger);
    const auto count = static_cast<double>(fingers.size());
    most = std::max(most, count);
    if (count < wanted() || input.kind == Lift) return;
    const double spread = spreadOf(middle());
    narrowest = widest == 0 ? spread : std::min(narrowest, spread);
    widest = std::max(widest, spread);
  }

  bool isDone() const override {
    return most >= wanted() && widest > 0 && widest >= kLeastRatio * narrowest;
  }

  void drawLook() override {
    constexpr int kWidth = 6;  // pixels
    const ScreenSize screen = screenSize();
    skia_add_box_c({0, 0, screen.width, screen.height, kPageInk.ground});
    const Middle at = middle();
    for (const auto& [finger, input] : fingers) {
      skia_add_line_c(
          {static_cast<int>(at.x), static_cast<int>(at.y), input.x, input.y, kSpokeColor, kWidth});
    }
  }

 private:
  struct Middle {
    double x = 0;
    double y = 0;
  };

  static std::string wordsFor(double fingers) {
    return counted(trn("Put %d finger down,\nthen spread it.",
                       "Put %d fingers down together,\nthen spread them.",
                       static_cast<unsigned long>(fingers)),
                   fingers);
  }

  double wanted() const { return parameter("fingers"); }

  Middle middle() const {
    Middle sum;
    const auto count = static_cast<double>(fingers.size());
    for (const auto& [finger, input] : fingers) {
      sum.x += input.x / count;
      sum.y += input.y / count;
    }
    return sum;
  }

  double spreadOf(Middle at) const {
    double sum = 0;
    for (const auto& [finger, input] : fingers) sum += std::hypot(input.x - at.x, input.y - at.y);
    return sum / static_cast<double>(fingers.size());
  }

  std::map<uint32_t, Input> fingers;  // that are down
  double most = 0;                    // of them at the same time
  double narrowest = 0;               // pixels
  double widest = 0;
};

}  // namespace

std::unique_ptr<Test> makePinch(const Context& program) {
  return std::make_unique<PinchPage>(program);
}

}  // namespace factory_test
