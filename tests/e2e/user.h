/// A user of the application that runs in the test's own process, without a window.
#pragma once

#include <SDL_keycode.h>
#include <brimol/scene.h>

#include <cstdint>
#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "pc/support/painting.h"

namespace factory_test {

/// Acts as the display would see it, and looks at the pictures that the platform paints. Every look
/// waits for what it looks for.
class User {
 public:
  /// Whether the menu comes to stand on the screen.
  static bool seesMenu();
  static void down(const SKIA_Rect& area);
  static void up(const SKIA_Rect& area);
  static void click(const SKIA_Rect& area);
  static void dragFrom(const SKIA_Rect& area, int byX);
  static void key(SDL_Keycode key);
  /// Lets so many milliseconds of the application's time pass at once.
  static void later(uint32_t ms);
  /// Starts the test of this name from the menu, by keys.
  static void start(std::string_view test);
  /// Whether the area comes to have the colour, near its corner, where no text stands.
  static bool sees(const SKIA_Rect& area, uint32_t colour);
  /// Whether the line of a test's page comes to say the words.
  static bool reads(const std::string& words);
  static brimol::pc::Picture screen();

 private:
  friend int runWith(const std::vector<std::string>&, const std::function<void()>&);

  inline static int marked = -1;  // the entry of the menu that the keys have come to; -1: none
};

/// Runs the application on this thread, as its main function does, and the user on another, who
/// leaves by the menu in the end. The application's exit code.
int runWith(const std::vector<std::string>& arguments, const std::function<void()>& user);

}  // namespace factory_test
