/// What a report shows, as the data that its page reads.
#pragma once

#include <nlohmann/json_fwd.hpp>

#include "report.h"

namespace brimol::replay {

constexpr std::size_t kMostFrames = 4000;
constexpr std::size_t kMostHappenings = 20'000;
constexpr std::size_t kMostPairs = 200;  // of frames that differ
constexpr std::size_t kMostOutputBytes = std::size_t{64} << 10;

nlohmann::json reportData(const ReportInput& input);

}  // namespace brimol::replay
