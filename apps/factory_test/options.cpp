#include "options.h"

#include <brimol/device.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <filesystem>
#include <string_view>
#include <system_error>
#include <utility>

#include "exit_code.h"
#include "language/language.h"
#include "pages/table.h"
#include "records/commands.h"
#include "records/sqlite.h"
#include "results/whole_file.h"
#include "run_start.h"

namespace factory_test {

namespace {

struct OptionRow {
  std::string_view name;
  const char* value;  // what its value is called; null: it takes none
  const char* meaning;
  void (*apply)(Options& options, const char* value);
};

constexpr auto kOptions = std::to_array<OptionRow>({
    {"--help", nullptr, "print this and end; also -h",
     [](Options& options, const char*) { options.action = Options::Action::Help; }},
    {"--version", nullptr, "print the version and end",
     [](Options& options, const char*) { options.action = Options::Action::Version; }},
    {"--headless", nullptr, "draw to memory instead of a window",
     [](Options& options, const char*) { options.headless = true; }},
    {"--device", "NAME", "use that phone's screen; the names stand below",
     [](Options& options, const char* value) { options.device = value; }},
    {"--language", "CODE", "show texts in en, de, ko or ar, instead of the environment's language",
     [](Options& options, const char* value) { options.language = value; }},
    {"--results", "FILE.json",
     "keep the verdicts in FILE.json, and go on from what it holds of the unit and the plan",
     [](Options& options, const char* value) { options.results = value; }},
    {"--junit", "FILE.xml", "write the verdicts for a CI system, too",
     [](Options& options, const char* value) { options.junit = value; }},
    {"--database", "FILE", "keep all runs in FILE, and go on with the unit's aborted one",
     [](Options& options, const char* value) { options.database = value; }},
    {"--new-run", nullptr, "begin a new run instead; the file of --results loses what it held",
     [](Options& options, const char*) { options.newRun = true; }},
    {"--line", "postgresql://...", "send the database's runs there, too",
     [](Options& options, const char* value) { options.line = value; }},
    {"--serial", "SERIAL", "the unit's serial number, instead of the property ro.serialno",
     [](Options& options, const char* value) { options.serial = value; }},
    {"--operator", "NAME", "who tests",
     [](Options& options, const char* value) { options.operatorName = value; }},
    {"--plan", "FILE.json", "test what this plan says, see docs/plans.md",
     [](Options& options, const char* value) { options.plan = value; }},
    {"--print-plan", nullptr, "print the plan with every field, and end",
     [](Options& options, const char*) {
       if (options.action == Options::Action::Run) options.action = Options::Action::PrintPlan;
     }},
    {"--run", nullptr, "perform the plan from first to last, without the menu",
     [](Options& options, const char*) { options.run = true; }},
    {"--simulate", "LIST",
     "of fail:ID and retry:ID: rehearse failures: always, or at the first attempt",
     [](Options& options, const char* value) { options.simulate = value; }},
    {"--log", "FILE", "show FILE in the log viewer, instead of the program's own log",
     [](Options& options, const char* value) { options.log = value; }},
    {"--shell", "CMD", "run CMD in the shell, instead of uname -a",
     [](Options& options, const char* value) { options.shell = value; }},
    {"--test", "ID", "show that test first, in the place of the menu",
     [](Options& options, const char* value) { options.test = value; }},
    {"--shot", "FILE.png", "draw the first screen, write it to FILE.png and end",
     [](Options& options, const char* value) { options.shot = value; }},
    {"--monkey", "SEED", "let random input use the program, in simulated time and without a window",
     [](Options& options, const char* value) {
       options.monkey = value;
       options.stays = true;
     }},
    {"--events", "N", "so many events of it; 10000 when not given",
     [](Options& options, const char* value) { options.events = value; }},
    {"--monkey-trace", "FILE", "write that input as a trace; monkey-SEED.trace when not given",
     [](Options& options, const char* value) { options.monkeyTrace = value; }},
    {"--stay", nullptr, "show the menu again where the user leaves the program, as with --monkey",
     [](Options& options, const char*) { options.stays = true; }},
    {"--verbose", nullptr, "write the toolkit's log to stderr",
     [](Options& options, const char*) { options.verbose = true; }},
});

constexpr std::size_t kNameColumns = 22;
constexpr std::size_t kCodeColumns = 4;
constexpr std::size_t kDeviceColumns = 14;

std::span<const BrimolDevice> devices() {
  int count = 0;
  const BrimolDevice* const first = brimol_devices(&count);
  return {first, static_cast<std::size_t>(count)};
}

// Takes one option and its value from the front. What is wrong with them; empty: nothing.
std::string takeOne(Arguments& arguments, Options& options) {
  const std::string_view given = arguments.front();
  const auto equals = given.starts_with("--") ? given.find('=') : std::string_view::npos;
  const bool holdsValue = equals != std::string_view::npos;
  const std::string name(given == "-h" ? "--help" : given.substr(0, equals));
  arguments = arguments.subspan(1);
  const auto* const row = std::ranges::find(kOptions, name, &OptionRow::name);
  if (row == kOptions.end()) return "unknown option '" + name + "', see --help";
  if (row->value == nullptr) {
    if (holdsValue) return name + " takes no value";
    row->apply(options, nullptr);
    return "";
  }
  const char* value = "";
  if (holdsValue) {
    value = given.substr(equals + 1).data();  // up to the argument's own end
  } else if (!arguments.empty()) {
    value = arguments.front();
    arguments = arguments.subspan(1);
  }
  if (*value == '\0') return name + " needs a value: " + row->value;
  row->apply(options, value);
  return "";
}

using NamedFile = std::pair<const char*, std::string>;

// What is wrong with a file that the program also makes for itself, beside another; empty: nothing.
std::string besideOthers(const NamedFile& named, const Options& options) {
  const auto& [name, file] = named;
  const std::string wrong = std::string(name) + " names ";
  if (!options.database.empty() && file != options.database &&
      isOfDatabase(file, options.database)) {
    return wrong + "the database";
  }
  for (const auto& [owner, kept] :
       {NamedFile("--results", options.results), NamedFile("--junit", options.junit)}) {
    if (!kept.empty() && isBeside(file, kept)) return wrong + "a file that " + owner + " makes";
  }
  return "";
}

// What two options say that must not name one file, as one of the two is written; empty: they do
// not.
std::string sameFiles(const Options& options) {
  const auto files = std::to_array<NamedFile>({{"--plan", options.plan},
                                               {"--log", options.log},
                                               {"--results", options.results},
                                               {"--junit", options.junit},
                                               {"--database", options.database},
                                               {"--shot", options.shot},
                                               {"--monkey-trace", options.monkeyTrace}});
  constexpr std::size_t kOnlyRead = 2;  // the first ones
  for (const auto& [name, file] : std::span(files).subspan(kOnlyRead)) {
    for (const auto& [other, its] : files) {
      if (name == other || file.empty() || its.empty() || !isSameFile(file, its)) continue;
      return std::string(name) + " and " + other + " name the same file";
    }
  }
  for (const NamedFile& named : files) {
    std::string wrong = named.second.empty() ? "" : besideOthers(named, options);
    if (!wrong.empty()) return wrong;
  }
  return "";
}

std::string wrongDevice(const std::string& name) {
  std::string error = "unknown device '" + name + "', known are:";
  for (const BrimolDevice& device : devices()) error.append(" ").append(device.name);
  return error;
}

bool isNumber(const std::string& text) {
  uint64_t number = 0;
  const char* const end = text.data() + text.size();
  const auto [stop, failure] = std::from_chars(text.data(), end, number);
  return failure == std::errc() && stop == end;
}

std::string wrongMonkey(const Options& options) {
  if (options.monkey.empty()) return "--events and --monkey-trace belong to --monkey";
  return "--monkey and --events need numbers";
}

std::string wrongLanguage(const std::string& code) {
  std::string error = "unknown language '" + code + "', known are:";
  for (const std::string_view each : languages()) {
    if (each != kMadeUpLanguage) error.append(" ").append(each);
  }
  return error;
}

std::string wrongTest(const std::string& id) {
  std::string error = "unknown test '" + id + "', known are:";
  for (const TestEntry& entry : testEntries()) error.append(" ").append(entry.id);
  return error;
}

std::string helpLine(std::string name, std::size_t columns, const std::string& meaning) {
  name.resize(std::max(columns, name.size() + 1), ' ');
  return "  " + name + meaning + "\n";
}

std::string sizeOf(const BrimolDevice& device) {
  return std::to_string(device.width) + "x" + std::to_string(device.height) + ", " +
         std::to_string(std::lround(device.density)) + " dots per inch, ";
}

// What is wrong with options that are right one by one; empty: nothing.
std::string wrongTogether(const Options& options) {
  std::string error = sameFiles(options);
  if (error.empty()) error = wrongRecords(options);
  if (!error.empty()) return error;
  if (!options.device.empty() && brimol_device_named(options.device.c_str()) == nullptr) {
    return wrongDevice(options.device);
  }
  const bool isMonkeys = !options.events.empty() || !options.monkeyTrace.empty();
  if (options.monkey.empty()
          ? isMonkeys
          : !isNumber(options.monkey) || (!options.events.empty() && !isNumber(options.events))) {
    return wrongMonkey(options);
  }
  if (!options.language.empty() && std::ranges::count(languages(), options.language) == 0) {
    return wrongLanguage(options.language);
  }
  if (options.run && !options.test.empty()) {
    return "--run performs the plan, --test one test: not both";
  }
  const bool isUnknown = !options.test.empty() && placeOf(options.test) == testEntries().size();
  return isUnknown ? wrongTest(options.test) : "";
}

}  // namespace

std::optional<Options> parseOptions(Arguments arguments, std::string& error) {
  using Action = Options::Action;
  Options options;
  std::string first;  // that was wrong
  while (!arguments.empty()) {
    const std::string wrong = takeOne(arguments, options);
    if (first.empty()) first = wrong;
  }
  if (options.action == Action::Help || options.action == Action::Version) return options;
  if (first.empty()) first = wrongTogether(options);
  if (first.empty()) return options;
  error = first;
  return {};
}

std::string usage() {
  std::string text =
      "Usage: factory_test [OPTION]...\n"
      "A factory test's menu, built from the toolkit's widgets: by touch or by keys.\n\n"
      "Options:\n";
  for (const OptionRow& row : kOptions) {
    std::string name(row.name);
    if (row.value != nullptr) name.append(" ").append(row.value);
    text += helpLine(std::move(name), kNameColumns, row.meaning);
  }
  text += "\nExit codes:\n";
  for (const ExitRow& row : exitRows()) {
    text += helpLine(std::to_string(static_cast<int>(row.code)), kCodeColumns, row.meaning);
  }
  text += recordsUsage();
  text +=
      "\nEnvironment:\n"
      "  BRIMOL_DISPLAY=window|browser|headless\n"
      "                                   where to draw; a window when there is a display, else "
      "memory\n"
      "  BRIMOL_LISTEN=ADDRESS:PORT       where browsers connect\n"
      "  BRIMOL_DEVICE=NAME               as --device; 1440x2560 pixels when not set\n"
      "  BRIMOL_SCREEN=WIDTHxHEIGHT       screen size in pixels, instead of the device's\n"
      "  BRIMOL_TRACE, BRIMOL_RECORD      a file with a session to play, or to record\n"
      "\nDevices:\n";
  for (const BrimolDevice& device : devices()) {
    text += helpLine(device.name, kDeviceColumns,
                     sizeOf(device) + std::to_string(device.year) + ": " + device.title);
  }
  return text;
}

}  // namespace factory_test
