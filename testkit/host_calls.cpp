#include <brimol/host.h>
#include <brimol/input.h>
#include <brimol3_widget_test/picture.h>
#include <brimol3_widget_test/platform.h>

#include <algorithm>
#include <string>

#include "scene/utf8.h"

using brimol::test::platform;

int brimol_host_open() { return 1; }
const char* brimol_host_error() { return "the picture cannot be written"; }
const char* brimol_host_help() { return ""; }

void brimol_host_screen_size(int* width, int* height) {
  if (width != nullptr) *width = platform().width;
  if (height != nullptr) *height = platform().height;
}

float brimol_host_density() { return platform().xdpi; }

int brimol_host_close_requested() { return platform().closeRequested ? 1 : 0; }

void brimol_host_set_brightness(int percent) {
  constexpr int kFull = 100;
  platform().brightness = std::clamp(percent, 0, kFull);
}

int brimol_host_screenshot(const char* path) {
  using namespace brimol::test;  // NOLINT(google-build-using-namespace): its own words
  const std::lock_guard guard(platform().lock);
  const Frame frame = itemsOf(platform().drawings);
  return writePicture(paint(frame, {platform().width, platform().height}), path) ? 1 : 0;
}

int64_t brimol_host_utc_ms() { return platform().utcMs + (GetTicks() - brimol::test::clockBase()); }
uint32_t brimol_host_random() { return platform().random++; }

int brimol_host_figure(const char* name, const char*, char* value, int bytes) {
  const auto found = platform().figures.find(name == nullptr ? "" : name);
  const std::string text = found == platform().figures.end() ? "" : found->second;
  if (value != nullptr && bytes > 0) {
    const std::size_t most = static_cast<std::size_t>(bytes) - 1;
    value[text.copy(value, brimol::pc::wholeBytes(text, most))] = '\0';
  }
  return static_cast<int>(text.size());
}
