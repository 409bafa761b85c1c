/// Widgets of the base layer, used in the top layer.
#pragma once

#include <MW/window.h>

#include <utility>

namespace factory_test {

/// While a widget of the top layer is active, nothing below gets events: what is to be touched then
/// must stand in the top layer, too.
inline void moveToTop(MW::Widget& widget) {
  MW::Window::unregisterWidget(&widget);
  widget.setType(MW::kTopLayer);
  MW::Window::registerWidget(&widget);
}

/// A widget that begins there. Not of a kind that is active from its construction on, such as
/// MW::Key: events may come before it is whole.
template <typename Kind>
class OnTop : public Kind {
 public:
  template <typename... Arguments>
  explicit OnTop(Arguments&&... arguments) : Kind(std::forward<Arguments>(arguments)...) {
    moveToTop(*this);
  }
  ~OnTop() override { this->leaveLayers(); }
};

}  // namespace factory_test
