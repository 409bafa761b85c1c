// Raw records of the platform, on their way through the queue and the dispatcher to widgets of
// every class, between frames and over time.

#include <cstddef>

#include "stage.h"

namespace {

using brimol::fuzz::FuzzStage;

void step(FuzzStage& stage, std::size_t which) {
  switch (which) {
    case 0:
    case 2: stage.dispatchTouch(); break;
    case 3: FuzzStage::round(); break;
    case 4: stage.wait(); break;
    default: stage.dispatchRecord(); break;
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, std::size_t count) {
  brimol::test::Arguments from({bytes, count});
  FuzzStage stage(from);
  const std::size_t widgets = 1 + from.below(3);
  for (std::size_t place = 0; place < widgets; ++place) stage.make(place);
  while (!from.isAtEnd()) step(stage, from.below(6));
  FuzzStage::round();
  return 0;
}
