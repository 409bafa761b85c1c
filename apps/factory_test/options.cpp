#include "options.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace factory_test {

namespace {

struct OptionRow {
  std::string_view name;
  const char* value;  // what its value is called; null: it takes none
  const char* meaning;
  void (*apply)(Options& options, const char* value);
};

constexpr auto kOptions = std::to_array<OptionRow>({
    {"--help", nullptr, "print this and end",
     [](Options& options, const char*) { options.action = Options::Action::Help; }},
    {"--headless", nullptr, "draw to memory instead of a window",
     [](Options& options, const char*) { options.headless = true; }},
    {"--results", "FILE.json", "keep the verdicts in FILE.json, and go on from what it holds",
     [](Options& options, const char* value) { options.results = value; }},
    {"--junit", "FILE.xml", "write the verdicts for a CI system, too",
     [](Options& options, const char* value) { options.junit = value; }},
    {"--log", "FILE", "show FILE in the log viewer, instead of the program's own log",
     [](Options& options, const char* value) { options.log = value; }},
    {"--shell", "CMD", "run CMD in the shell, instead of uname -a",
     [](Options& options, const char* value) { options.shell = value; }},
    {"--shot", "FILE.png", "draw the menu, write it to FILE.png and end",
     [](Options& options, const char* value) { options.shot = value; }},
    {"--verbose", nullptr, "write the toolkit's log to stderr",
     [](Options& options, const char*) { options.verbose = true; }},
});

constexpr std::size_t kNameColumns = 22;

// What is left behind one option and its value; nothing, with `error`, where it is wrong.
std::optional<Arguments> parseOne(Arguments arguments, Options& options, std::string& error) {
  const std::string_view name = arguments.front();
  const auto* const row = std::ranges::find(kOptions, name, &OptionRow::name);
  if (row == kOptions.end()) {
    error = "unknown option '" + std::string(name) + "', see --help";
    return {};
  }
  if (row->value == nullptr) {
    row->apply(options, nullptr);
    return arguments.subspan(1);
  }
  if (arguments.size() < 2 || *arguments[1] == '\0') {
    error = std::string(name) + " needs a value: " + row->value;
    return {};
  }
  row->apply(options, arguments[1]);
  return arguments.subspan(2);
}

}  // namespace

std::optional<Options> parseOptions(Arguments arguments, std::string& error) {
  Options options;
  while (!arguments.empty()) {
    const auto rest = parseOne(arguments, options, error);
    if (!rest) return {};
    arguments = *rest;
  }
  if (!options.results.empty() && options.results == options.junit) {
    error = "--results and --junit name the same file";
    return {};
  }
  return options;
}

std::string usage() {
  std::string text =
      "Usage: factory_test [OPTION]...\n"
      "A factory test's menu, built from the toolkit's widgets: by touch or by keys.\n\n"
      "Options:\n";
  for (const OptionRow& row : kOptions) {
    std::string name(row.name);
    if (row.value != nullptr) name.append(" ").append(row.value);
    name.resize(std::max(kNameColumns, name.size() + 1), ' ');
    text.append("  ").append(name).append(row.meaning).append("\n");
  }
  text +=
      "\nEnvironment:\n"
      "  BRIMOL_DISPLAY=window|headless   where to draw; a window when there is a display\n"
      "  BRIMOL_SCREEN=WIDTHxHEIGHT       screen size in pixels, 1440x2560 when not set\n";
  return text;
}

}  // namespace factory_test
