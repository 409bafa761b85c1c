// A fault planted in a program from outside, to be loaded before its libraries: the program crashes
// where it draws the text that PLANTED starts with.
#include <brimol/scene.h>
#include <dlfcn.h>

#include <cstdlib>
#include <string_view>

extern "C" int skia_add_textbox_c(SKIA_Rect rect, SKIA_Text text) {
  const char* const planted = std::getenv("PLANTED");
  if (planted != nullptr && std::string_view(text.text, SKIA_TEXT_BYTES).starts_with(planted)) {
    std::abort();
  }
  // What the loader gives is an address without a type.
  static const auto next =
      reinterpret_cast<decltype(&skia_add_textbox_c)>(dlsym(RTLD_NEXT, "skia_add_textbox_c"));
  return next(rect, text);
}
