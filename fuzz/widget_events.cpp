// Raw records of the platform, on their way through the queue and the dispatcher to widgets of
// every class, between frames and over time.

#include <array>

#include "stage.h"

using brimol::fuzz::Stage;

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, std::size_t count) {
  constexpr auto kSteps = std::to_array<void (Stage::*)()>(
      {&Stage::dispatchTouch, &Stage::dispatchRecord, &Stage::dispatchTouch, &Stage::round,
       &Stage::wait, &Stage::dispatchRecord});
  brimol::test::Arguments from({bytes, count});
  Stage stage(from);
  const std::size_t widgets = 1 + from.below(3);
  for (std::size_t place = 0; place < widgets; ++place) stage.make(place);
  while (!from.isAtEnd()) (stage.*kSteps.at(from.below(kSteps.size())))();
  stage.round();
  return 0;
}
