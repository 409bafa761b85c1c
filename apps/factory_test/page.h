/// What the tests' screens have in common.
#pragma once

#include <MW/primitives.h>

namespace factory_test {

/// A ground, a title, instructions, and a line that tells what happens.
class Page {
 public:
  /// Instructions may have several lines.
  Page(const char* title, const char* instructions);

  /// On the main thread, before the window's widgets are drawn: all of it, or in two steps.
  void draw();
  void drawGround();
  void drawTexts();
  /// Changes the line; the next frame shows it. Any thread.
  void say(const char* words);

 private:
  MW::Box ground;
  MW::Textbox titleBar;
  MW::Label hint;
  MW::Textbox line;
};

}  // namespace factory_test
