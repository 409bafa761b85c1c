// The gallery's examples as golden cases: what a phone's screen shows of each.
#include "example.h"
#include "golden/golden_cases.h"
#include "input/input_service.h"
#include "scene/recorder.h"

namespace brimol::pc {

namespace {

constexpr int kHundred = 100;
constexpr unsigned int kFrameMs = 101;  // a row of stars grows once in more than 100 ms

/// Draws frames until the example has its age, and leaves the last one in the recorder.
class PictureLoop : public gallery::Loop {
 public:
  explicit PictureLoop(unsigned int picturesAge) : age(picturesAge) {}

  void operator()(const Draw& draw) override {
    for (unsigned int now = 0;; now += kFrameMs) {
      beginRecording();
      draw();
      MW::Window::show(kNow + now);
      if (now >= age) return;
      inputService().advance(kFrameMs);
    }
  }

 private:
  unsigned int age;  // milliseconds
};

void show(const gallery::Example& example) {
  PictureLoop loop(example.age);
  example.run(loop);
}

}  // namespace

std::vector<Case> galleryCases() {
  std::vector<Case> cases;
  for (const gallery::Family& family : gallery::families()) {
    for (const gallery::Example& example : family.examples) {
      const Size screen = {example.screen.width, example.screen.height};
      const auto& [top, bottom] = example.view;
      const View view = {screen.h * top / kHundred, screen.h * bottom / kHundred};
      cases.push_back({example.name, screen, [&example] { show(example); }, view});
    }
  }
  return cases;
}

}  // namespace brimol::pc
