#include "records/report.h"

#include "records/html.h"
#include "records/plot.h"
#include "records/value_plots.h"
#include "results/measure_text.h"

namespace factory_test {

namespace {

constexpr double kWhole = 100;  // percent

double percent(int part, int whole) {
  return whole == 0 ? 0 : kWhole * static_cast<double>(part) / static_cast<double>(whole);
}

std::string percentText(int part, int whole) {
  return whole == 0 ? "none yet" : shortNumber(percent(part, whole)) + " %";
}

void addFact(std::string& body, const char* name, const std::string& value) {
  body.append("<div><dt>").append(name).append("</dt><dd>").append(value).append("</dd></div>\n");
}

void addFacts(std::string& body, const Statistics& all) {
  const auto& [units, passed, atFirst] = all.total;
  body += "<dl class=\"facts\">\n";
  addFact(body, "Units judged", std::to_string(units));
  addFact(body, "Yield", percentText(passed, units));
  addFact(body, "First-pass yield", percentText(atFirst, units));
  addFact(body, "Runs", std::to_string(all.runs));
  addFact(body, "Runs aborted", std::to_string(all.aborted));
  if (all.rehearsals > 0) addFact(body, "Rehearsals, left out", std::to_string(all.rehearsals));
  body +=
      "</dl>\n<p class=\"quiet\">A unit is judged by its newest finished run. It passed when each "
      "test of that run ended with PASS, and at first when no run ever gave it a FAIL. A run "
      "without "
      "a serial number counts as a unit of its own. Times are UTC.</p>\n";
}

void addYieldTable(std::string& body, const char* what, const std::map<std::string, Yield>& rows) {
  body += "<table>\n" + htmlHead({what, "Units", "Passed", "Yield", "First-pass yield"});
  for (const auto& [name, yield] : rows) {
    body += htmlRow({htmlText(name), std::to_string(yield.units), std::to_string(yield.passed),
                     percentText(yield.passed, yield.units),
                     percentText(yield.passedAtFirst, yield.units)});
  }
  body += "</table>\n";
}

void addDays(std::string& body, const Statistics& all) {
  if (all.days.empty()) return;
  body += "<h2>Yield by day</h2>\n<div class=\"card\">\n";
  std::vector<PlotPoint> yield;
  std::vector<PlotPoint> atFirst;
  for (const auto& [day, each] : all.days) {
    const auto x = static_cast<double>(yield.size());
    yield.emplace_back(x, percent(each.passed, each.units));
    atFirst.emplace_back(x, percent(each.passedAtFirst, each.units));
  }
  if (yield.size() > 1) {
    const double last = yield.back().first;
    Plot plot("Yield and first-pass yield by day, in percent", {0, last}, {0, kWhole});
    plot.line(yield, "first");
    plot.line(atFirst, "second");
    plot.label(0, all.days.begin()->first);
    plot.label(last, all.days.rbegin()->first);
    body += "<figure>" + plot.svg() +
            "<figcaption><span class=\"key1\">Solid: yield</span>, <span class=\"key2\">dashed: "
            "first-pass yield</span>, in percent</figcaption></figure>\n";
  }
  addYieldTable(body, "Day", all.days);
  body += "</div>\n<h2>Yield by station</h2>\n<div class=\"card\">\n";
  addYieldTable(body, "Station", all.stations);
  body += "</div>\n";
}

// A bar as wide as its part of the most.
std::string failBar(int fails, int most) {
  const std::string width = shortNumber(percent(fails, most));
  return R"(<svg role="img" aria-label=")" + std::to_string(fails) +
         R"( fails" viewBox="0 0 100 6" preserveAspectRatio="none"><rect class="bar" width=")" +
         width + R"(" height="6"/></svg>)";
}

void addTests(std::string& body, const Statistics& all) {
  if (all.tests.empty()) return;
  body += "<h2>Tests, most failing first</h2>\n<div class=\"card\">\n<table>\n" +
          htmlHead({"Test", "Fails", "Verdicts", "Fail rate", "Share of the most"});
  const int most = all.tests.front().fails;
  for (const TestCount& each : all.tests) {
    body += htmlRow({htmlText(each.test), std::to_string(each.fails), std::to_string(each.verdicts),
                     percentText(each.fails, each.verdicts), failBar(each.fails, most)});
  }
  body += "</table>\n</div>\n";
}

void addSeries(std::string& body, const ValueSeries& series) {
  const Spread spread = spreadOf(series);
  const std::string unit = series.newest.unit.empty() ? "" : " " + series.newest.unit;
  const auto figure = [&unit](double number) { return htmlText(shortNumber(number) + unit); };
  const std::string limits = limitsText(series.newest);
  body += "<section class=\"card\">\n<h3>" + htmlText(series.test + ": " + series.newest.name) +
          "</h3>\n<p class=\"quiet\">" + std::to_string(series.points.size()) + " values, limits " +
          htmlText(limits.empty() ? "none" : limits + unit) + ", " +
          std::to_string(spread.outside) + " outside. Mean " + figure(spread.mean) + ", median " +
          figure(spread.median) + ", least " + figure(spread.least) + ", most " +
          figure(spread.most) + ", standard deviation " + figure(spread.deviation);
  if (spread.capability) body += ", C<sub>pk</sub> " + shortNumber(*spread.capability);
  body += "</p>\n<div class=\"plots\">\n" + distributionFigure(series, spread) +
          trendFigure(series, spread) + "</div>\n</section>\n";
}

}  // namespace

std::string reportHtml(const Statistics& statistics, const std::string& value) {
  std::string body;
  addFacts(body, statistics);
  addDays(body, statistics);
  addTests(body, statistics);
  body += "<h2>Measured values</h2>\n";
  bool isAny = false;
  for (const ValueSeries& series : statistics.values) {
    if (!value.empty() && series.newest.name != value) continue;
    addSeries(body, series);
    isAny = true;
  }
  if (!isAny) body += "<p>There are none.</p>\n";
  return htmlPage("Factory test: report", body);
}

}  // namespace factory_test
