#include "report.h"

#include <nlohmann/json.hpp>
#include <string_view>

#include "embedded.h"
#include "report_data.h"

namespace brimol::replay {

namespace {

// Puts the text in the place of the mark. What was put elsewhere is not looked at.
std::string filled(std::string_view page, std::string_view mark, const std::string& text) {
  const auto place = page.find(mark);
  return std::string(page.substr(0, place)) + text + std::string(page.substr(place + mark.size()));
}

}  // namespace

std::string scriptSafe(const std::string& json) {
  std::string safe;
  safe.reserve(json.size());
  for (const char letter : json) {
    // Within JSON these stand in texts alone, where they may be written so.
    switch (letter) {
      case '<': safe += "\\u003c"; break;
      case '>': safe += "\\u003e"; break;
      case '&': safe += "\\u0026"; break;
      default: safe += letter;
    }
  }
  return safe;
}

std::string reportPage(const ReportInput& input) {
  const nlohmann::json data = reportData(input);
  return filled(kReportTemplate, "{{session}}",
                scriptSafe(data.dump(-1, ' ', false, nlohmann::json::error_handler_t::replace)));
}

}  // namespace brimol::replay
