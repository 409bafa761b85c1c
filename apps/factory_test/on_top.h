/// Widgets of the base layer, used in the top layer.
#pragma once

#include <MW/window.h>

#include <utility>

namespace factory_test {

/// While a widget of the top layer is active, nothing below gets events: what is to be touched then
/// must stand in the top layer, too.
template <typename Kind>
class OnTop : public Kind {
 public:
  template <typename... Arguments>
  explicit OnTop(Arguments&&... arguments) : Kind(std::forward<Arguments>(arguments)...) {
    this->leaveWindow();
    this->setType(MW::kTopLayer);
    MW::Window::registerWidget(this);
  }
  ~OnTop() override { this->leaveLayers(); }
};

}  // namespace factory_test
