#include "remote/web_calls.h"

namespace brimol::pc {

const WebCalls& websockets() {
  static const WebCalls calls(BRIMOL_WEBSOCKETS_FILE);
  return calls;
}

}  // namespace brimol::pc
