#include "remote/rfb_calls.h"

namespace brimol::pc {

const RfbCalls& rfb() {
  static const RfbCalls calls(BRIMOL_RFB_FILE);
  return calls;
}

}  // namespace brimol::pc
