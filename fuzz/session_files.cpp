// Sessions, which come in pieces.

#include <cstdlib>
#include <string>
#include <string_view>

#include "session.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, std::size_t count) {
  using namespace brimol::replay;  // NOLINT(google-build-using-namespace): its own words
  const std::string_view text(reinterpret_cast<const char*>(bytes), count);
  SessionReader pieces;
  for (std::size_t i = 0; i < count; i += 7) pieces.add(text.substr(i, 7));
  pieces.finish();
  SessionReader whole;
  whole.add(text);
  whole.finish();
  if (whole.session().lines != pieces.session().lines) std::abort();
  if (whole.session().frames.size() != pieces.session().frames.size()) std::abort();
  return 0;
}
