#include <algorithm>

#include "records/export.h"
#include "records/html.h"
#include "results/measure_text.h"
#include "results/utc_time.h"

namespace factory_test {

namespace {

constexpr std::size_t kHashDigits = 12;  // enough to tell plans apart

std::string valuesCell(const TestResult& result) {
  std::string cell;
  for (const Measure& each : result.values) {
    const std::string text = htmlText(each.name + " " + measureText(each));
    cell.append(cell.empty() ? "" : "<br>");
    cell.append(each.isWithin() ? text : "<span class=\"FAIL\">" + text + "</span>");
  }
  return cell;
}

std::string unitName(const RunStart& start) {
  return start.unit.empty() ? "Unknown unit" : start.unit;
}

void addRun(std::string& body, const RunRecord& run) {
  const RunStart& start = run.start;
  body.append("<section class=\"card\">\n<h3>").append(htmlText(unitName(start)));
  body.append("</h3>\n<p class=\"quiet\">").append(stateName(run.state)).append(", began ");
  body.append(utcText(start.started));
  if (run.ended) body.append(", last verdict ").append(utcText(*run.ended));
  body.append("; station ").append(htmlText(start.station));
  if (!start.operatorName.empty()) body.append(", begun by ").append(htmlText(start.operatorName));
  body.append("; plan ").append(
      htmlText(start.planName + " " + start.planHash.substr(0, kHashDigits)));
  body.append("; software ").append(htmlText(start.software)).append("</p>\n<table>\n");
  body.append(
      htmlHead({"Test", "Verdict", "Why", "Operator", "Attempt", "Began", "Seconds", "Values"}));
  for (const auto& [id, result] : run.verdicts) {
    const std::chrono::duration<double> seconds = result.duration;
    body.append(htmlRow({htmlText(result.test), htmlVerdict(verdictName(result.verdict)),
                         reasonName(result.reason), htmlText(result.operatorName),
                         std::to_string(result.attempt), utcText(result.started),
                         numberText(seconds.count()), valuesCell(result)}));
  }
  body.append("</table>\n</section>\n");
}

}  // namespace

std::string historyHtml(std::span<const RunRecord> runs) {
  std::string body = "<p class=\"quiet\">" + std::to_string(runs.size()) +
                     " runs, newest first. Times are UTC.</p>\n<h2>Runs</h2>\n";
  std::for_each(runs.rbegin(), runs.rend(), [&body](const RunRecord& run) { addRun(body, run); });
  return htmlPage("Factory test: runs", body);
}

}  // namespace factory_test
