#include "display/sdl_calls.h"

namespace brimol::pc {

const SdlCalls& sdl() {
  static const SdlCalls calls(BRIMOL_SDL_FILE);
  return calls;
}

}  // namespace brimol::pc
