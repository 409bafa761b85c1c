/// Framed buttons side by side.
#pragma once

#include <MW/button_new.h>

#include <memory>
#include <span>
#include <vector>

namespace factory_test {

/// On the screen from construction to destruction, active at first.
class ButtonRow {
 public:
  struct Face {
    const char* caption;
    void (*clicked)(int);  // called on the dispatch thread
  };

  /// Divides `area` among the faces.
  ButtonRow(const SKIA_Rect& area, std::span<const Face> faces);

  /// Any thread.
  void setActive(bool isActive);

 private:
  std::vector<std::unique_ptr<MW::ButtonNew>> buttons;
};

}  // namespace factory_test
