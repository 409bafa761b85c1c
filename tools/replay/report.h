/// The session's report: one HTML page that needs nothing but itself.
#pragma once

#include <filesystem>
#include <string>
#include <utility>
#include <vector>

#include "compare.h"
#include "verdict.h"

namespace brimol::replay {

struct ReportInput {
  const PlayedRun& run;
  const RunEnd& end;
  const Judgement& judgement;
  std::vector<std::pair<std::string, std::string>> about;  // what was run: name and value
  std::string output = {};                                 // of the application
  const PlayedRun* other = nullptr;                        // both or none
  const Comparison* comparison = nullptr;
  std::filesystem::path page = {};    // the folder that it is written to
  std::filesystem::path traces = {};  // the trace's; files below it are named from there
};

/// Frames and what happened are bounded, so that a session of any length gives a page that opens;
/// the page says what was left out.
std::string reportPage(const ReportInput& input);

/// JSON text that can stand in a script element: nothing in it ends the element or opens a comment.
std::string scriptSafe(const std::string& json);

}  // namespace brimol::replay
