// What the platform offers an application besides the phone's services, and what it tells of its
// display.
#include <brimol/display.h>
#include <brimol/host.h>
#include <brimol/scene.h>

#include <chrono>
#include <iostream>
#include <string>

#include "clock/inside_wait.h"
#include "clock/process_clock.h"
#include "host/open_platform.h"
#include "host/png_file.h"
#include "host/session.h"
#include "host/settings.h"
#include "input/keymap.h"

namespace brimol::pc {
namespace {

constexpr std::chrono::seconds kPictureBound{10};

std::string lastError;  // belongs to the application's thread, as the calls do

int resultOf(std::string error) {
  if (error.empty()) return 1;
  lastError = std::move(error);
  return 0;
}

std::string writeScreenshot(const char* path) {
  if (path == nullptr || *path == '\0') return "a screenshot needs a file name";
  const auto platform = openedPlatform();
  if (!platform) return "no screen is open";
  const InsideWait wait(turnClock());
  const CairoSurface picture = platform->copyPicture(kPictureBound);
  if (!picture) return "the screen was closed or took over 10 seconds to paint";
  return writePng(picture.get(), path);
}

}  // namespace
}  // namespace brimol::pc

using brimol::pc::openedPlatform;

int brimol_host_open() {
  const int result = brimol::pc::resultOf(brimol::pc::openPlatform());
  if (result == 0) std::cerr << brimol_host_error() << '\n';
  return result;
}

const char* brimol_host_error() { return brimol::pc::lastError.c_str(); }

void brimol_host_screen_size(int* width, int* height) {
  const auto platform = openedPlatform();
  const brimol::pc::Size screen =
      platform ? platform->screen() : brimol::pc::readSettings().settings.screen;
  if (width != nullptr) *width = screen.w;
  if (height != nullptr) *height = screen.h;
}

float brimol_host_density() {
  const auto platform = openedPlatform();
  return platform ? platform->density() : brimol::pc::readSettings().settings.density;
}

const char* brimol_host_help() {
  static const std::string text = brimol::pc::helpText();
  return text.c_str();
}

void brimol_host_set_brightness(int percent) {
  if (const auto platform = openedPlatform()) platform->setBrightness(percent);
}

int brimol_host_close_requested() {
  if (const auto* const played = brimol::pc::session()) {
    if (const auto isAsked = played->isCloseRequested()) return *isAsked ? 1 : 0;
  }
  const auto platform = openedPlatform();
  return platform && platform->isCloseRequested() ? 1 : 0;
}

int brimol_host_screenshot(const char* path) {
  return brimol::pc::resultOf(brimol::pc::writeScreenshot(path));
}

void getDpi(float* xdpi, float* ydpi) {
  if (xdpi != nullptr) *xdpi = brimol_host_density();
  if (ydpi != nullptr) *ydpi = brimol_host_density();
}

int skia_live_widget_c() { return openedPlatform() ? 1 : 0; }
