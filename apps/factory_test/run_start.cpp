#include "run_start.h"

#include <brimol/properties.h>
#include <unistd.h>

#include <array>
#include <cstdlib>
#include <filesystem>
#include <system_error>

#include "plan/plan_json.h"
#include "records/postgres.h"
#include "results/junit.h"
#include "results/whole_file.h"
#include "version.h"
#include "world.h"

namespace factory_test {

namespace {

constexpr std::size_t kHostNameBytes = 256;

std::string serialOfSystem() {
  std::array<char, BRIMOL_PROPERTY_BYTES> value = {};
  property_get("ro.serialno", value.data(), "");
  std::string unused;
  return isSerial(value.data(), unused) ? value.data() : "";
}

std::string unitOf(const Options& options) {
  return options.serial.empty() ? serialOfSystem() : options.serial;
}

bool isKept(const Options& options) {
  return !(options.database.empty() && options.results.empty() && options.junit.empty());
}

// With the platform's variable, verdicts of a monkey are kept in a new file, for who looks at what
// it did: never among those of people.
std::string wrongMonkeyRecords(const Options& options) {
  if (!options.monkey.empty()) {
    return isKept(options)
               ? "--monkey judges nothing, so it takes none of --database, --results and --junit"
               : "";
  }
  const char* const asked = std::getenv("BRIMOL_MONKEY");
  if (asked == nullptr || *asked == '\0') return "";
  std::error_code failure;
  const auto isThere = [&](const std::string& file) {
    return !file.empty() && std::filesystem::exists(file, failure);
  };
  const bool isAmongOthers =
      !options.database.empty() || isThere(options.results) || isThere(options.junit);
  return isAmongOthers
             ? "BRIMOL_MONKEY judges nothing: no --database, and --results and --junit only as new "
               "files"
             : "";
}

std::string stationName() {
  std::array<char, kHostNameBytes + 1> name = {};  // a name that fills it is not ended
  return ::gethostname(name.data(), kHostNameBytes) == 0 ? name.data() : "";
}

}  // namespace

Keeping keepingOf(const Options& options) {
  return {.json = options.results,
          .junit = options.junit,
          .database = options.database,
          .resume = options.newRun ? Resume::No
                    : options.run  ? Resume::Unfinished
                                   : Resume::Yes,
          .first = asksForUnit(options) ? FirstRun::WithUnit : FirstRun::AtOnce,
          .line = options.line,
          .isOnlyShown = !options.shot.empty()};
}

bool asksForUnit(const Options& options) {
  return !options.database.empty() && options.test.empty() && unitOf(options).empty();
}

RunStart runStartOf(const Options& options, const Plan& plan) {
  RunStart start = {.unit = unitOf(options),
                    .operatorName = options.operatorName,
                    .planName = plan.name,
                    .planHash = planHash(plan),
                    .software = kVersion,
                    .station = stationName(),
                    .started = presentTime()};
  for (const PlanStep& step : plan.steps) start.tests.push_back(step.test);
  return start;
}

std::string wrongRecords(const Options& options) {
  constexpr std::size_t kHeadBytes = 4096;
  std::string why;
  if (!isJunitHead(readHead(options.junit, kHeadBytes))) {
    return "--junit: " + options.junit + " holds something else than a report, and stays as it is";
  }
  if (!options.serial.empty() && !isSerial(options.serial, why)) return "--serial: " + why;
  if (std::string wrong = wrongMonkeyRecords(options); !wrong.empty()) return wrong;
  if (!options.shot.empty() && !(options.database.empty() && options.junit.empty())) {
    return "--shot keeps nothing, so it takes neither --database nor --junit";
  }
  if (options.newRun && options.database.empty() && options.results.empty()) {
    return "--new-run needs --database or --results";
  }
  if (options.line.empty()) return "";
  if (options.database.empty()) return "--line needs --database, which always comes first";
  const std::string wrong = wrongPostgresUrl(options.line);
  return wrong.empty() ? "" : "--line " + wrong;
}

}  // namespace factory_test
