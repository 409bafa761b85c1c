/// The run as a report for a CI system.
#pragma once

#include <string>

#include "verdict.h"

namespace brimol::replay {

/// JUnit XML in UTF-8: a suite for the trace, with a case for each expectation and, at last, one
/// for the run as a whole. Times are the session's. What XML cannot hold becomes U+FFFD.
std::string junitXml(const std::string& trace, const Session& session, const Judgement& judgement,
                     const std::string& output);

}  // namespace brimol::replay
