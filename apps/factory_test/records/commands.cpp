#include "records/commands.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <string_view>
#include <utility>

#include "complain.h"
#include "records/database_schema.h"
#include "records/export.h"
#include "records/line_transfer.h"
#include "records/report.h"
#include "results/utc_time.h"
#include "results/whole_file.h"

namespace factory_test {

namespace {

using Format = std::string (*)(std::span<const RunRecord>);

struct Request {
  bool isReport = false;
  Format format = nullptr;
  std::string database = {};
  std::string line = {};
  std::string output = {};  // empty: stdout
  std::string value = {};
  HistoryFilter filter = {};
};

struct FormatRow {
  std::string_view name;
  Format write;
};
constexpr auto kFormats = std::to_array<FormatRow>({
    {"--json", historyJson},
    {"--junit", historyJunit},
    {"--csv", historyCsv},
    {"--html", historyHtml},
});

struct OptionRow {
  std::string_view name;
  std::string& (*place)(Request& request);
};
constexpr auto kOptions = std::to_array<OptionRow>({
    {"--database", [](Request& request) -> std::string& { return request.database; }},
    {"--line", [](Request& request) -> std::string& { return request.line; }},
    {"--output", [](Request& request) -> std::string& { return request.output; }},
    {"--serial", [](Request& request) -> std::string& { return request.filter.unit; }},
    {"--since", [](Request& request) -> std::string& { return request.filter.since; }},
    {"--value", [](Request& request) -> std::string& { return request.value; }},
});

bool isDay(const std::string& text) { return parseUtc(text + "T00:00:00Z").has_value(); }

// What is wrong with the whole; empty: nothing.
std::string faultOf(const Request& request) {
  if (request.database.empty() == request.line.empty()) {
    return "needs one of --database FILE and --line postgresql://...";
  }
  if (!request.output.empty() && !request.database.empty() &&
      isOfDatabase(request.output, request.database)) {
    return "--output names the database";
  }
  if (!request.isReport && request.format == nullptr) {
    return "needs one of --json, --junit, --csv and --html";
  }
  if (!request.isReport && !request.value.empty()) return "takes no --value";
  if (!request.line.empty()) {
    const std::string wrong = wrongPostgresUrl(request.line);
    if (!wrong.empty()) return "--line " + wrong;
  }
  if (request.filter.since.empty() || isDay(request.filter.since)) return "";
  return "--since needs a day like 2026-11-21";
}

// Takes "--name value" or "--name=value" at the front of `arguments`. Empty: done.
std::string takeOption(std::span<const char* const>& arguments, Request& request) {
  const std::string_view whole = arguments.front();
  arguments = arguments.subspan(1);
  const auto* const format = std::ranges::find(kFormats, whole, &FormatRow::name);
  if (!request.isReport && format != kFormats.end()) {
    if (request.format != nullptr) return "takes only one of --json, --junit, --csv and --html";
    request.format = format->write;
    return "";
  }
  const std::size_t equals = whole.find('=');
  const std::string_view name = whole.substr(0, equals);
  const auto* const row = std::ranges::find(kOptions, name, &OptionRow::name);
  if (row == kOptions.end()) return "unknown option '" + std::string(whole) + "', see --help";
  std::string value;
  if (equals != std::string_view::npos) {
    value = whole.substr(equals + 1);
  } else if (!arguments.empty()) {
    value = arguments.front();
    arguments = arguments.subspan(1);
  }
  if (value.empty()) return std::string(name) + " needs a value";
  row->place(request) = std::move(value);
  return "";
}

// What is wrong; empty: nothing.
std::string parse(std::span<const char* const> arguments, Request& request) {
  while (!arguments.empty()) {
    std::string fault = takeOption(arguments, request);
    if (!fault.empty()) return fault;
  }
  return faultOf(request);
}

std::vector<RunRecord> read(const Request& request) {
  if (!request.line.empty()) {
    Postgres server(request.line);
    checkLine(server);
    return readHistory(queryOf(server), request.filter);
  }
  std::vector<RunRecord> runs;
  readUndisturbed(request.database, [&] {
    Sqlite store(request.database, Sqlite::Mode::Read);
    checkDatabase(store, request.database);
    runs = readHistory(queryOf(store), request.filter);
  });
  return runs;
}

// What was asked for and is not there is said, too: the file alone would be an empty one.
void tellMissing(const Request& request, std::span<const RunRecord> runs) {
  if (!request.filter.unit.empty() && runs.empty()) {
    complain("there is no run of the unit " + request.filter.unit);
  }
  const auto isIt = [&](const Measure& each) { return each.name == request.value; };
  const auto hasIt = [&](const VerdictRecord& each) {
    return std::ranges::any_of(each.result.values, isIt);
  };
  const auto hasAny = [&](const RunRecord& run) {
    return std::ranges::any_of(run.verdicts, hasIt);
  };
  if (!request.value.empty() && std::ranges::none_of(runs, hasAny)) {
    complain("there is no value " + request.value);
  }
}

bool write(const Request& request, const std::string& text, std::string& error) {
  if (!request.output.empty()) return replaceFile(request.output, text, error);
  if (std::fwrite(text.data(), 1, text.size(), stdout) == text.size() && std::fflush(stdout) == 0) {
    return true;
  }
  error = "stdout cannot be written";
  return false;
}

bool perform(const Request& request, std::string& error) {
  try {
    std::vector<RunRecord> runs = read(request);
    tellMissing(request, runs);
    const std::string text = request.isReport
                                 ? reportHtml(statisticsOf(std::move(runs)), request.value)
                                 : request.format(runs);
    return write(request, text, error);
  } catch (const StoreError& failure) {
    error = failure.what();
    return false;
  }
}

}  // namespace

std::optional<ExitCode> runRecordsCommand(std::span<const char* const> arguments) {
  if (arguments.empty()) return {};
  const std::string_view word = arguments.front();
  if (word != "export" && word != "report") return {};
  const auto rest = arguments.subspan(1);
  const auto isHelp = [](std::string_view each) { return each == "--help" || each == "-h"; };
  if (std::ranges::any_of(rest, isHelp)) {
    std::fputs(recordsUsage().c_str() + 1, stdout);
    return ExitCode::Passed;
  }
  Request request = {.isReport = word == "report"};
  std::string error = parse(rest, request);
  if (!error.empty()) {
    complain(std::string(word) + ": " + error);
    return ExitCode::WrongUse;
  }
  if (perform(request, error)) return ExitCode::Passed;
  complain(error);
  return ExitCode::Trouble;
}

std::string recordsUsage() {
  return "\nRecords, without a screen:\n"
         "  factory_test export --json|--junit|--csv|--html FROM [SOME]\n"
         "                        all runs and verdicts in that format\n"
         "  factory_test report FROM [SOME] [--value NAME]\n"
         "                        yield, failing tests and values as a page of HTML\n"
         "  FROM is --database FILE or --line postgresql://...\n"
         "  SOME is --serial SERIAL, --since 2026-11-21 and --output FILE, else stdout\n";
}

}  // namespace factory_test
