// Draws nothing, then a button, and writes a picture of each: application EMPTY.png BUTTON.png
#include <MW/MW.h>
#include <brimol/frame.h>
#include <brimol/host.h>

namespace {

bool drawInto(const char* file) {
  skia_begin_frame_c();
  MW::Window::show();
  skia_end_frame_c();
  return brimol_host_screenshot(file) == 1;
}

}  // namespace

int main(int count, char** arguments) {
  if (count != 3 || brimol_host_open() == 0) return 1;
  brimol_host_screen_size(&MW::Window::width, &MW::Window::height);
  if (MW::Window::width != 400 || MW::Window::height != 300) return 1;
  MW::Window::init();
  bool drawn = drawInto(arguments[1]);
  {
    const SKIA_Rect area = {50, 50, 300, 100, 0xFFB8C4D6};
    const SKIA_Text caption = {"Installed", 9, MW::kColorBlack, SKIA_ALIGN_CENTRE, 40};
    MW::Button button(&area, &caption);
    button.setActive(1);
    drawn = drawInto(arguments[2]) && drawn;
  }
  MW::Window::destroy();
  return drawn ? 0 : 1;
}
