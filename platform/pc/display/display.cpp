#include "display/display.h"

#include "display/headless_display.h"
#include "display/sdl_display.h"

namespace brimol::pc {

OpenedDisplay openDisplay(DisplayChoice choice, Size screen, InputTranslator& input,
                          const InputService& service) {
  if (choice != DisplayChoice::Headless) {
    OpenedDisplay window = SdlDisplay::open(screen, input, service);
    if (window.display || choice == DisplayChoice::Window) return window;
  }
  return {std::make_unique<HeadlessDisplay>(), {}};
}

}  // namespace brimol::pc
