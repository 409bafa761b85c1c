// The gallery: every widget and every dialog, with the lines of code that make it.
#include <MW/window.h>
#include <android/log.h>
#include <brimol/host.h>

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <string_view>

#include "browser.h"
#include "document.h"
#include "version.h"

namespace {

constexpr int kUsageError = 2;

void printUsage() {
  std::printf(
      "Usage: brimol_gallery [OPTION]\n"
      "Every widget and every dialog of the toolkit, to look at and to touch.\n\n"
      "Options:\n"
      "  --help      print this and end; also -h\n"
      "  --version   print the version and end\n"
      "  --document  print the gallery as Markdown, and end\n\n"
      "Touch, or the keys up, down, select and back, choose from the menus; left and right go\n"
      "from one example to the next, and select shows its code.\n\n"
      "On a PC:\n%s",
      brimol_host_help());
}

struct OptionRow {
  std::string_view name;
  void (*print)();
};
constexpr auto kOptions = std::to_array<OptionRow>({
    {"--help", printUsage},
    {"-h", printUsage},
    {"--version", [] { std::printf("brimol_gallery %s\n", gallery::kVersion); }},
    {"--document", [] { std::fputs(gallery::document().c_str(), stdout); }},
});

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
  if (count <= 1) return run();
  const std::string_view option = arguments[1];
  const auto* const row = std::ranges::find(kOptions, option, &OptionRow::name);
  if (row == kOptions.end()) {
    std::fprintf(stderr, "brimol_gallery: unknown option '%s', see --help\n", arguments[1]);
    return kUsageError;
  }
  if (count > 2) {
    std::fputs("brimol_gallery: one option at most, see --help\n", stderr);
    return kUsageError;
  }
  row->print();
  return EXIT_SUCCESS;
}
