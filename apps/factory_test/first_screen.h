/// The first screen: a title, the primitives, and buttons that tell what happens to them.
#pragma once

#include <MW/button.h>
#include <MW/primitives.h>

#include <array>
#include <atomic>
#include <optional>

#include "layout.h"

namespace factory_test {

/// Stands on the screen from construction to destruction; there is one at a time. Belongs to the
/// application's thread; button callbacks come on the dispatch thread.
class FirstScreen {
 public:
  /// `picture`: the path of a PNG file, at most 127 bytes.
  FirstScreen(ScreenSize screen, const char* picture);
  ~FirstScreen();
  FirstScreen(const FirstScreen&) = delete;
  FirstScreen& operator=(const FirstScreen&) = delete;

  /// Draws one frame.
  void draw();
  /// The end button was clicked. Any thread.
  bool isEnded() const { return ended; }

 private:
  enum Entry { kPress, kClick, kLongPress, kDoubleClick, kDelayedShow, kLate };
  struct ButtonRow;
  static const std::array<ButtonRow, kButtonCount> kButtons;

  void placePrimitives(const Layout& layout, const char* picture);
  void placeButtons(const Layout& layout);
  void report(Entry entry);
  void showLate();
  void hideLate();

  std::atomic<bool> ended = false;
  std::array<unsigned int, kButtonCount> counts = {};  // dispatch thread
  MW::Textbox status;
  // Last, since their handlers use what stands above: they leave the window first.
  std::array<std::optional<MW::Button>, kButtonCount> buttons;
  std::optional<MW::Button> endButton;
};

}  // namespace factory_test
