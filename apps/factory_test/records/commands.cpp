#include "records/commands.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
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

constexpr int kUsageError = 2;

using Format = std::string (*)(std::span<const RunRecord>);

struct Command {
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
  std::string& (*place)(Command& command);
};
constexpr auto kOptions = std::to_array<OptionRow>({
    {"--database", [](Command& command) -> std::string& { return command.database; }},
    {"--line", [](Command& command) -> std::string& { return command.line; }},
    {"--output", [](Command& command) -> std::string& { return command.output; }},
    {"--serial", [](Command& command) -> std::string& { return command.filter.unit; }},
    {"--since", [](Command& command) -> std::string& { return command.filter.since; }},
    {"--value", [](Command& command) -> std::string& { return command.value; }},
});

bool isDay(const std::string& text) { return parseUtc(text + "T00:00:00Z").has_value(); }

// What is wrong with the whole; empty: nothing.
std::string faultOf(const Command& command) {
  if (command.database.empty() == command.line.empty()) {
    return "needs one of --database FILE and --line postgresql://...";
  }
  for (const char* const its : {"", "-wal", "-shm", ".lock"}) {
    if (command.output.empty() || command.database.empty()) break;
    if (isSameFile(command.output, command.database + its)) return "--output names the database";
  }
  if (!command.isReport && command.format == nullptr) {
    return "needs one of --json, --junit, --csv and --html";
  }
  if (!command.isReport && !command.value.empty()) return "takes no --value";
  if (!command.line.empty()) {
    const std::string wrong = wrongPostgresUrl(command.line);
    if (!wrong.empty()) return "--line " + wrong;
  }
  if (command.filter.since.empty() || isDay(command.filter.since)) return "";
  return "--since needs a day like 2026-11-21";
}

// Takes "--name value" or "--name=value" at the front of `arguments`. Empty: done.
std::string takeOption(std::span<const char* const>& arguments, Command& command) {
  const std::string_view whole = arguments.front();
  arguments = arguments.subspan(1);
  const auto* const format = std::ranges::find(kFormats, whole, &FormatRow::name);
  if (!command.isReport && format != kFormats.end()) {
    command.format = format->write;
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
  row->place(command) = std::move(value);
  return "";
}

// What is wrong; empty: nothing.
std::string parse(std::span<const char* const> arguments, Command& command) {
  while (!arguments.empty()) {
    std::string fault = takeOption(arguments, command);
    if (!fault.empty()) return fault;
  }
  return faultOf(command);
}

std::vector<RunRecord> read(const Command& command) {
  if (!command.line.empty()) {
    Postgres server(command.line);
    checkLine(server);
    return readHistory(queryOf(server), command.filter);
  }
  Sqlite store(command.database, Sqlite::Mode::Read);
  checkDatabase(store, command.database);
  return readHistory(queryOf(store), command.filter);
}

bool write(const Command& command, const std::string& text, std::string& error) {
  if (!command.output.empty()) return replaceFile(command.output, text, error);
  if (std::fwrite(text.data(), 1, text.size(), stdout) == text.size() && std::fflush(stdout) == 0) {
    return true;
  }
  error = "stdout cannot be written";
  return false;
}

bool perform(const Command& command, std::string& error) {
  try {
    const std::vector<RunRecord> runs = read(command);
    const std::string text =
        command.isReport ? reportHtml(statisticsOf(runs), command.value) : command.format(runs);
    return write(command, text, error);
  } catch (const StoreError& failure) {
    error = failure.what();
    return false;
  }
}

}  // namespace

std::optional<int> runRecordsCommand(std::span<const char* const> arguments) {
  if (arguments.empty()) return {};
  const std::string_view word = arguments.front();
  if (word != "export" && word != "report") return {};
  const auto rest = arguments.subspan(1);
  const auto isHelp = [](std::string_view each) { return each == "--help" || each == "-h"; };
  if (std::ranges::any_of(rest, isHelp)) {
    std::fputs(recordsUsage().c_str() + 1, stdout);
    return EXIT_SUCCESS;
  }
  Command command = {.isReport = word == "report"};
  std::string error = parse(rest, command);
  if (!error.empty()) {
    complain(std::string(word) + ": " + error);
    return kUsageError;
  }
  if (perform(command, error)) return EXIT_SUCCESS;
  complain(error);
  return EXIT_FAILURE;
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
