// The gallery: every widget and every dialog, with the lines of code that make it.
#include <MW/window.h>
#include <android/log.h>
#include <brimol/host.h>

#include <cstdio>
#include <cstdlib>
#include <string_view>

#include "browser.h"
#include "document.h"

namespace {

constexpr int kUsageError = 2;

constexpr const char* kUsage =
    "Usage: brimol_gallery [OPTION]\n"
    "Every widget and every dialog of the toolkit, to look at and to touch.\n\n"
    "Options:\n"
    "  --help      print this and end\n"
    "  --document  print the gallery as Markdown, and end\n\n"
    "Touch, or the keys up, down, select and back, choose from the menus; left and right go from\n"
    "one example to the next, and select shows its code.\n\n"
    "On a PC:\n";

// Without the toolkit's log.
int run() {
  __android_log_set_minimum_priority(ANDROID_LOG_SILENT);
  if (brimol_host_open() == 0) return EXIT_FAILURE;
  brimol_host_screen_size(&MW::Window::width, &MW::Window::height);
  if (MW::Window::init() == 1) gallery::browse();
  MW::Window::destroy();
  return EXIT_SUCCESS;
}

}  // namespace

int main(int count, char** arguments) {
  const std::string_view option = count > 1 ? arguments[1] : "";
  if (count > 2 || (count == 2 && option != "--help" && option != "--document")) {
    std::fputs("brimol_gallery: unknown option, see --help\n", stderr);
    return kUsageError;
  }
  if (option == "--help") {
    std::printf("%s%s", kUsage, brimol_host_help());
    return EXIT_SUCCESS;
  }
  if (option == "--document") {
    std::fputs(gallery::document().c_str(), stdout);
    return EXIT_SUCCESS;
  }
  return run();
}
