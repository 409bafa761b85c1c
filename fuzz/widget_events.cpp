// Raw records of the platform, on their way through the queue and the dispatcher to widgets of
// every class, between frames and over time.

#include <array>

#include "stage.h"

using brimol::fuzz::FuzzStage;

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, std::size_t count) {
  constexpr auto kSteps = std::to_array<void (FuzzStage::*)()>(
      {&FuzzStage::dispatchTouch, &FuzzStage::dispatchRecord, &FuzzStage::dispatchTouch,
       &FuzzStage::round, &FuzzStage::wait, &FuzzStage::dispatchRecord});
  brimol::test::Arguments from({bytes, count});
  FuzzStage stage(from);
  const std::size_t widgets = 1 + from.below(3);
  for (std::size_t place = 0; place < widgets; ++place) stage.make(place);
  while (!from.isAtEnd()) (stage.*kSteps.at(from.below(kSteps.size())))();
  stage.round();
  return 0;
}
