// The gallery's examples as golden cases: what a phone's screen shows of each.
#include <brimol/frame.h>
#include <brimol3_widget_test/platform.h>

#include <algorithm>
#include <iterator>

#include "example.h"
#include "golden/golden_cases.h"

namespace brimol::test {

namespace {

constexpr int kHundred = 100;
constexpr unsigned int kFrameMs = 101;  // a row of stars grows once in more than 100 ms

/// Draws frames until the example has its age, and leaves the last one in the platform.
class PictureLoop : public gallery::Loop {
 public:
  explicit PictureLoop(unsigned int picturesAge) : age(picturesAge) {}

  void operator()(const Draw& draw) override {
    for (unsigned int now = 0;; now += kFrameMs) {
      skia_begin_frame_c();
      draw();
      MW::Window::show(kNow + now);
      if (now >= age) return;
      platform().ticks += kFrameMs;
    }
  }

 private:
  unsigned int age;  // milliseconds
};

void show(const gallery::Example& example) {
  PictureLoop loop(example.age);
  example.run(loop);
}

Case caseOf(const gallery::Example& example) {
  const auto& [width, height] = example.screen;
  const ShownRows view = {height * example.view.top / kHundred,
                          height * example.view.bottom / kHundred};
  return {example.name, {width, height}, [&example] { show(example); }, view};
}

}  // namespace

std::vector<Case> galleryCases() {
  std::vector<Case> cases;
  for (const gallery::Family& family : gallery::families()) {
    std::ranges::transform(family.examples, std::back_inserter(cases), caseOf);
  }
  return cases;
}

}  // namespace brimol::test
