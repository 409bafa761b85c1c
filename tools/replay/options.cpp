#include "options.h"

#include <algorithm>
#include <charconv>
#include <filesystem>
#include <set>
#include <string>
#include <string_view>

#include "verdict.h"

namespace brimol::replay {

namespace {

using Arguments = std::span<const char* const>;

// A whole number of 1 to 6 digits; negative: it is none.
int numberOf(std::string_view text) {
  constexpr std::size_t kMostDigits = 6;
  int number = -1;
  const char* const end = text.data() + text.size();
  const auto [rest, failure] = std::from_chars(text.data(), end, number);
  const bool isNumber = failure == std::errc() && rest == end && text.size() <= kMostDigits;
  return isNumber && number >= 0 ? number : -1;
}

bool setScreen(Options& options, std::string_view value) {
  const auto cross = value.find('x');
  if (cross == std::string_view::npos) return false;
  options.screen = value;
  return numberOf(value.substr(0, cross)) > 0 && numberOf(value.substr(cross + 1)) > 0;
}

bool setTimeout(Options& options, std::string_view value) {
  const int seconds = numberOf(value);
  options.timeout = std::chrono::seconds(seconds);
  return seconds >= 0;
}

bool setExitCode(Options& options, std::string_view value) {
  constexpr int kMost = 255;
  options.exitCode = numberOf(value);
  return options.exitCode >= 0 && options.exitCode <= kMost;
}

bool setSpeed(Options& options, std::string_view value) {
  options.pace = Options::Pace::RealTime;
  return value == "1";
}

template <std::filesystem::path Options::*file>
bool setFile(Options& options, std::string_view value) {
  options.*file = value;
  return !value.empty();
}

template <Options::Action action>
bool setAction(Options& options, std::string_view) {
  options.action = action;
  return true;
}

bool setDevice(Options& options, std::string_view value) {
  options.device = value;
  return !value.empty();
}

bool setTakesArguments(Options& options, std::string_view) {
  options.takesArguments = true;
  return true;
}

bool setLint(Options& options, std::string_view) {
  options.lints = true;
  return true;
}

struct OptionRow {
  std::string_view name;
  std::string_view value;  // what its value is called; empty: it takes none
  std::string_view meaning;
  bool (*apply)(Options& options, std::string_view value);  // false: no such value
};

constexpr auto kOptions = std::to_array<OptionRow>({
    {"--dir", "DIR", "the run's folder: new, empty, or with an earlier run, which it replaces",
     setFile<&Options::directory>},
    {"--report", "FILE.html", "the report; report.html in the run's folder when not given",
     setFile<&Options::report>},
    {"--junit", "FILE.xml", "a report for a CI system, too", setFile<&Options::junit>},
    {"--bundle", "FILE.tar.gz", "pack all that repeats the run elsewhere",
     setFile<&Options::bundle>},
    {"--from-bundle", "FILE", "replay what was packed, and compare with what was packed",
     setFile<&Options::fromBundle>},
    {"--packed-arguments", "", "give the application the arguments that the bundle says",
     setTakesArguments},
    {"--against", "DIR", "compare with the run in DIR; a difference is a failure",
     setFile<&Options::against>},
    {"--screen", "WIDTHxHEIGHT", "the screen's size in pixels", setScreen},
    {"--device", "NAME", "the screen of a phone: its size and density", setDevice},
    {"--lint", "", "look for faults of the layout; one is a failure", setLint},
    {"--accepted", "FILE",
     "findings of the lint that are accepted; an entry that accepts nothing is a failure",
     setFile<&Options::accepted>},
    {"--speed", "1", "in a window and in real time, to watch it", setSpeed},
    {"--timeout", "SECONDS",
     "how long nothing may happen before it counts as hung: 60; 0: for ever", setTimeout},
    {"--exit-code", "NUMBER", "with which the application is to end: 0", setExitCode},
    {"--help", "", "print this and end; also -h", setAction<Options::Action::Help>},
    {"--version", "", "print the version and end", setAction<Options::Action::Version>},
});

const OptionRow* findOption(std::string_view name) {
  const auto* const row =
      std::ranges::find(kOptions, name == "-h" ? "--help" : name, &OptionRow::name);
  return row == kOptions.end() ? nullptr : row;
}

// What is left behind one option and its value. Nothing, with `error`, where it is wrong.
std::optional<Arguments> parseOne(Arguments arguments, Options& options, std::string& error) {
  const std::string_view given = arguments.front();
  const auto equals = given.find('=');
  const std::string name(given.substr(0, equals));
  const bool holdsValue = equals != std::string_view::npos;
  arguments = arguments.subspan(1);
  const OptionRow* const row = findOption(name);
  if (row == nullptr) {
    error = "unknown option '" + name + "', see --help";
    return {};
  }
  if (row->value.empty()) {
    if (holdsValue) error = name + " takes no value";
    row->apply(options, "");
    return holdsValue ? std::optional<Arguments>() : arguments;
  }
  if (!holdsValue && arguments.empty()) {
    error = name + " needs a value: " + std::string(row->value);
    return {};
  }
  const std::string_view value = holdsValue ? given.substr(equals + 1) : arguments.front();
  if (!row->apply(options, value)) {
    error = name + " does not take '" + std::string(value) + "', but " + std::string(row->value);
    return {};
  }
  return holdsValue ? arguments : arguments.subspan(1);
}

// One name for all names of a file, whether there is one or not.
std::filesystem::path placeOf(const std::filesystem::path& file) {
  std::error_code failure;
  const std::filesystem::path whole = std::filesystem::absolute(file, failure);
  const std::filesystem::path place = std::filesystem::weakly_canonical(whole, failure);
  return failure ? file : place;
}

// Empty: each file to write is another one, and none that the application is given.
std::string whatIsOverwritten(const Options& options) {
  std::set<std::filesystem::path> taken;
  for (const std::string& word : options.command) taken.insert(placeOf(word));
  for (const auto& file : {options.report, options.junit, options.bundle}) {
    if (!file.empty() && !taken.insert(placeOf(file)).second) {
      return file.native() + " would be written over: it is used as another file, too";
    }
  }
  return {};
}

// Empty: the options fit together.
std::string whatIsWrong(const Options& options) {
  if (options.trace.empty() == options.fromBundle.empty()) {
    return options.trace.empty() ? "which trace? Give TRACE -- APP ARGS, see --help"
                                 : "a bundle has a trace of its own: give one of the two";
  }
  if (!options.fromBundle.empty() && !options.against.empty()) {
    return "a bundle is compared with what was packed: --against does not go with --from-bundle";
  }
  if (options.takesArguments && (options.fromBundle.empty() || options.command.size() > 1)) {
    return "--packed-arguments goes with --from-bundle and an APP without arguments alone";
  }
  if (options.command.empty() || options.command.front().empty()) {
    return "which application? Give -- APP ARGS behind the trace, see --help";
  }
  if (!options.accepted.empty() && !options.lints) return "--accepted goes with --lint alone";
  return whatIsOverwritten(options);
}

bool isOption(std::string_view argument) { return argument.size() > 1 && argument.front() == '-'; }

// All before "--". False, with `error`, where it is wrong.
bool parseOwn(Arguments own, Options& options, std::string& error) {
  while (!own.empty()) {
    if (isOption(own.front())) {
      const auto rest = parseOne(own, options, error);
      if (!rest) return false;
      own = *rest;
      continue;
    }
    if (!options.trace.empty()) {
      error = std::string(own.front()) + ": one trace too many; is there a -- before APP?";
      return false;
    }
    options.trace = own.front();
    own = own.subspan(1);
  }
  return true;
}

}  // namespace

std::optional<Options> parseOptions(Arguments arguments, std::string& error) {
  Options options;
  const auto border = std::ranges::find(arguments, std::string_view("--"),
                                        [](const char* text) { return std::string_view(text); });
  const auto own = static_cast<std::size_t>(border - arguments.begin());
  if (border != arguments.end()) options.command.assign(border + 1, arguments.end());
  if (!parseOwn(arguments.first(own), options, error)) return {};
  if (options.action != Options::Action::Replay) return options;
  error = whatIsWrong(options);
  if (!error.empty()) return {};
  return options;
}

std::string usage() {
  constexpr std::size_t kColumn = 26;
  std::string text =
      "Usage: brimol-replay [OPTION]... TRACE -- APP [ARGUMENT]...\n"
      "       brimol-replay [OPTION]... --from-bundle FILE -- APP [ARGUMENT]...\n"
      "Runs an application under a trace, without a window, and writes a report of the session.\n"
      "Where a bundle holds arguments of the application, give yours behind APP, or "
      "--packed-arguments.\n\n"
      "Options:\n";
  for (const OptionRow& row : kOptions) {
    std::string name(row.name);
    if (!row.value.empty()) name.append(" ").append(row.value);
    name.resize(std::max(kColumn, name.size() + 1), ' ');
    text.append("  ").append(name).append(row.meaning).append("\n");
  }
  text += "\nExit codes:\n";
  for (const ExitRow& row : kExitRows) {
    text.append("  ").append(std::to_string(row.code)).append("  ").append(row.meaning);
    text += '\n';
  }
  return text;
}

}  // namespace brimol::replay
