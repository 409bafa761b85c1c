#include "veil.h"

#include <MW/window.h>
#include <brimol/scene.h>

namespace factory_test {

namespace {
constexpr uint32_t kVeilColor = 0xB0161C26;
}

Veil::Veil(const SKIA_Rect& area, int layer, uint32_t until) : end(until) {
  rect = area;
  rect.color = kVeilColor;
  setType(layer);
  setActive(1);
  MW::Window::registerWidget(this);
}

Veil::~Veil() { leaveLayers(); }

int Veil::show(unsigned int) {
  skia_add_box_c(rect);
  return 1;
}

void Veil::updateTimer(unsigned int ticks) {
  // Ticks wrap: half of all times are earlier than `end`.
  if (static_cast<int32_t>(ticks - end) < 0) return;
  setActive(0);
  MW::isDisplayUpdate(1);
}

}  // namespace factory_test
