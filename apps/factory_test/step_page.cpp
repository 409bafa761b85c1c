#include "step_page.h"

#include <MW/window.h>

#include <algorithm>

#include "layout.h"

namespace factory_test {

StepPage::StepPage(const Context& program, const Kind& kind)
    : MeasurePage(program, kind.test, kind.title, kind.words),
      valueName(kind.value),
      finalQuestion(kind.question),
      count(kind.count) {}

std::string StepPage::question() const {
  return isDone() ? finalQuestion : MeasurePage::question();
}

void StepPage::follow(const Input& input) {
  using enum Input::Kind;
  if (input.kind == Lift) moveBy(1, input.ticks);
  if (input.kind != KeyPress) return;
  switch (input.key) {
    case MW::kKeyRight:
    case MW::kKeyDown:
    case MW::kKeySelect: moveBy(1, input.ticks); break;
    case MW::kKeyLeft:
    case MW::kKeyUp: moveBy(-1, input.ticks); break;
    default: break;
  }
}

void StepPage::moveBy(int by, uint32_t now) {
  constexpr uint32_t kSeenMs = 500;
  if (by > 0 && step >= 0) {
    if (now - shownSince < kSeenMs) return;
    confirmed = std::max(confirmed, step + 1);
  }
  const int next = std::clamp(step + by, -1, count - 1);
  if (next == step) return;
  step = next;
  shownSince = now;
  beginStep(step);
}

void StepPage::drawLook() {
  const ScreenSize screen = screenSize();
  skia_add_box_c({0, 0, screen.width, screen.height, kPageInk.ground});
  if (step >= 0) drawStep(step);
}

}  // namespace factory_test
