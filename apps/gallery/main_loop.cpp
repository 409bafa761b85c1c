#include "main_loop.h"

#include <MW/widget.h>
#include <MW/window.h>
#include <brimol/frame.h>
#include <brimol/host.h>
#include <brimol/input.h>

#include <csignal>

#include "place.h"

namespace gallery {

namespace {

constexpr unsigned int kLoopMs = 5;

volatile std::sig_atomic_t interrupted = 0;

void drawFrame(const std::function<void()>& draw) {
  skia_begin_frame_c();
  skia_add_box_c({0, 0, MW::Window::width, MW::Window::height, kGround});
  draw();
  skia_end_frame_c();
}

}  // namespace

bool isEnded() { return brimol_host_close_requested() != 0 || interrupted != 0; }

void runMainLoop(const std::function<bool()>& isOver, const std::function<void()>& draw) {
  for (const int number : {SIGINT, SIGTERM}) std::signal(number, [](int) { interrupted = 1; });
  MW::isDisplayUpdate(1);
  while (!isOver() && !isEnded()) {
    if (MW::isDisplayUpdate(0) == 1) drawFrame(draw);
    MW::Window::updateTimer(MW::kUnused);
    Delay(kLoopMs);
  }
}

}  // namespace gallery
