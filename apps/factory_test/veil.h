/// What lies over buttons that take no input yet.
#pragma once

#include <MW/widget.h>

namespace factory_test {

/// Half transparent over an area until a time comes, or until it is deleted; it takes no events.
/// Construct it after what it covers.
class Veil : public MW::Widget {
 public:
  /// `layer`: an MW::LayerNumber. `until`: GetTicks() milliseconds.
  Veil(const SKIA_Rect& area, int layer, uint32_t until);
  ~Veil() override;

  using Widget::show;
  int show(unsigned int ticks) override;
  void updateTimer(unsigned int ticks) override;

 private:
  uint32_t end;
};

}  // namespace factory_test
