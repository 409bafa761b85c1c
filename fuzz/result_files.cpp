// Results files. What is read is written again as it was read.

#include <cstdlib>
#include <string_view>

#include "results/results_json.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, std::size_t count) {
  using namespace factory_test;  // NOLINT(google-build-using-namespace): its own words
  std::string reason;
  const auto read = parseResults({reinterpret_cast<const char*>(bytes), count}, reason);
  if (!read) return reason.empty() ? (std::abort(), 1) : 0;
  const auto again = parseResults(resultsJson(read->run, read->state, read->results), reason);
  if (!again || again->run.unit != read->run.unit || again->run.planHash != read->run.planHash ||
      again->state != read->state || again->results != read->results) {
    std::abort();
  }
  return 0;
}
