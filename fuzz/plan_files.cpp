// Plan files. What is read is written again as it was read, and a fault has its line.

#include <cstdlib>
#include <string_view>

#include "plan/plan_json.h"
#include "plan/plan_reader.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, std::size_t count) {
  using namespace factory_test;  // NOLINT(google-build-using-namespace): its own words
  const std::vector<KnownTest> known = {{"touch", true}, {"keys", true}, {"brightness", false}};
  Complaint complaint;
  const auto plan = parsePlan({reinterpret_cast<const char*>(bytes), count}, known, complaint);
  if (!plan) return complaint.what.empty() || complaint.line < 1 ? (std::abort(), 1) : 0;
  const auto again = parsePlan(planJson(*plan), known, complaint);
  if (again != plan || planHash(*again) != planHash(*plan)) std::abort();
  return 0;
}
