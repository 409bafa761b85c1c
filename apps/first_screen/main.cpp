#include <MW/MW.h>
#include <brimol/frame.h>
#include <brimol/host.h>
#include <brimol/input.h>

#include <atomic>

static std::atomic<bool> done = false;

static void drawFrame() {
  skia_begin_frame_c();
  MW::Window::show();
  skia_end_frame_c();
}

int main() {
  if (brimol_host_open() == 0) return 1;
  brimol_host_screen_size(&MW::Window::width, &MW::Window::height);
  MW::Window::init();
  {
    const SKIA_Rect area = {120, 600, 1200, 300, 0xFFB8C4D6};
    const SKIA_Text caption = {"Press to end", 12, MW::kColorBlack, SKIA_ALIGN_CENTRE, 72};
    MW::Button button(&area, &caption);
    button.clickCallback = [](int) { done = true; };
    button.setActive(1);
    MW::isDisplayUpdate(1);
    while (!done && brimol_host_close_requested() == 0) {
      if (MW::isDisplayUpdate(0) == 1) drawFrame();
      MW::Window::updateTimer(MW::kUnused);
      Delay(5);
    }
  }
  MW::Window::destroy();
}
