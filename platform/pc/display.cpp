#include "display.h"

#include "headless_display.h"
#include "sdl_display.h"

namespace brimol::pc {

OpenedDisplay openDisplay(const Settings& settings, InputTranslator& input,
                          const InputService& service) {
  if (settings.display != DisplayChoice::Headless) {
    OpenedDisplay window = SdlDisplay::open(settings.screen, input, service);
    if (window.display || settings.display == DisplayChoice::Window) return window;
  }
  return {std::make_unique<HeadlessDisplay>(), {}};
}

}  // namespace brimol::pc
