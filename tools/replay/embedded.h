/// What the build puts into the program.
#pragma once

#include <string_view>

namespace brimol::replay {

/// report.html with its style and script; {{session}} stands where the session's data goes.
extern const std::string_view kReportTemplate;

}  // namespace brimol::replay
