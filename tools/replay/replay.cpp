#include "replay.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <fstream>
#include <iostream>

#include "bundle.h"
#include "compare.h"
#include "files.h"
#include "junit.h"
#include "layout_lint.h"
#include "picture.h"
#include "progress.h"
#include "report.h"
#include "report_data.h"
#include "run.h"
#include "run_directory.h"
#include "trace_files.h"
#include "version.h"

namespace brimol::replay {

namespace fs = std::filesystem;

namespace {

// The platform's settings that a run depends on, and that a repeated run takes from the first.
constexpr auto kSettings = std::to_array<const char*>(
    {"BRIMOL_DEVICE", "BRIMOL_SCREEN", "BRIMOL_CLOCK_START", "BRIMOL_CLOCK_STEP"});
constexpr auto kRootVariable = "BRIMOL_TRACE_ROOT";
constexpr auto kUnfinished = "unfinished";  // a record's verdict while the run goes on

int complain(const std::string& message) {
  std::cerr << "brimol-replay: " << message << '\n';
  return exitCodeOf(Verdict::Unusable);
}

/// All that stands before the application starts.
struct Plan {
  Options options;
  fs::path folder;     // of the run
  fs::path traceRoot;  // where included files are; empty: in the trace's own folder
  RunRecord record;
  test::AcceptedFindings accepted;
};

bool writeFile(const fs::path& file, const std::string& text, std::string& error) {
  const auto write = [&text](const fs::path& target) {
    std::ofstream stream(target, std::ios::binary);
    stream << text;
    stream.close();
    return stream.good();
  };
  if (writeWhole(file, write)) return true;
  error = file.native() + ": cannot be written";
  return false;
}

// A word of a command as a shell would take it.
std::string quoted(const std::string& word) {
  constexpr std::string_view kPlain =
      "abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ0123456789_-+=./:,@%";
  if (!word.empty() && word.find_first_not_of(kPlain) == std::string::npos) return word;
  std::string text = "'";
  for (const char letter : word) text += letter == '\'' ? "'\\''" : std::string(1, letter);
  return text + "'";
}

std::string commandText(const std::vector<std::string>& command) {
  std::string text;
  for (const std::string& word : command) text.append(text.empty() ? "" : " ").append(quoted(word));
  return text;
}

fs::path traceRootOfUser() {
  const char* const root = std::getenv(kRootVariable);
  return root == nullptr ? "" : root;
}

// What the run reads: it may not be removed or written over.
std::vector<fs::path> neededFiles(const Options& options) {
  std::vector<fs::path> files;
  if (!options.trace.empty()) files = traceFiles(options.trace, traceRootOfUser()).files;
  for (const fs::path& file : {options.trace, options.fromBundle, options.accepted}) {
    if (!file.empty()) files.push_back(file);
  }
  if (!options.against.empty()) files.push_back(options.against / kSessionName);
  return files;
}

// Empty: what is named can be read and written, as far as can be told beforehand.
std::string whatIsMissing(const Options& options, const std::vector<fs::path>& needed) {
  for (const fs::path& file : {options.trace, options.fromBundle}) {
    if (!file.empty() && !std::ifstream(file)) return file.native() + ": cannot be read";
    if (fs::is_directory(file)) return file.native() + ": is a folder";
  }
  if (!options.against.empty() && !fs::exists(options.against / kSessionName)) {
    return options.against.native() + ": holds no run";
  }
  for (const fs::path& file : {options.report, options.junit, options.bundle}) {
    if (file.empty()) continue;
    if (!fs::is_directory(fs::absolute(file).parent_path()) || fs::is_directory(file)) {
      return file.native() + ": cannot be written there";
    }
    const auto isSame = [&file](const fs::path& one) {
      std::error_code failure;
      return fs::equivalent(file, one, failure);
    };
    if (std::ranges::any_of(needed, isSame)) {
      return file.native() + ": would be written over, and the run reads it";
    }
  }
  return {};
}

// The packed run's trace, arguments and settings, and the run itself to compare with.
bool takeFromBundle(Plan& plan, std::string& error) {
  Options& options = plan.options;
  const auto unpacked = unpackBundle(options.fromBundle, plan.folder / kUnpackedName, error);
  if (!unpacked) return false;
  options.trace = unpacked->record.trace;
  options.against = unpacked->run;
  plan.traceRoot = plan.folder / kUnpackedName;
  const std::vector<std::string> packed(unpacked->record.command.begin() + 1,
                                        unpacked->record.command.end());
  if (options.takesArguments) {
    options.command.insert(options.command.end(), packed.begin(), packed.end());
  } else if (options.command.size() == 1 && !packed.empty()) {
    // Arguments may make an application write files or run programs.
    error = options.fromBundle.native() + ": was packed with the arguments " + commandText(packed) +
            ": give them behind the application, or --packed-arguments";
    return false;
  }
  plan.record.environment = unpacked->record.environment;
  return true;
}

// This program's own settings, where no bundle gave others.
void takeSettings(Plan& plan) {
  auto& settings = plan.record.environment;
  for (const char* const name : kSettings) {
    const char* const value = std::getenv(name);
    if (plan.options.fromBundle.empty() && value != nullptr) settings[name] = value;
  }
  if (!plan.options.screen.empty()) settings["BRIMOL_SCREEN"] = plan.options.screen;
  if (!plan.options.device.empty()) settings["BRIMOL_DEVICE"] = plan.options.device;
}

// The folder of the run. Its record says from now on whose it is.
std::optional<fs::path> makeFolder(const Options& options, std::string& error) {
  const std::vector<fs::path> needed = neededFiles(options);
  error = whatIsMissing(options, needed);
  if (!error.empty()) return {};
  const fs::path& named = options.trace.empty() ? options.fromBundle : options.trace;
  auto folder = prepareRunDirectory(options.directory, named.stem(), needed, error);
  const RunRecord record{kVersion, named.native(), options.command, {}, kUnfinished};
  if (folder && !writeFile(*folder / kRecordFileName, jsonOf(record), error)) return {};
  return folder;
}

std::optional<Plan> prepare(Options options, std::string& error) {
  const auto folder = makeFolder(options, error);
  if (!folder) return {};
  Plan plan{std::move(options), *folder, traceRootOfUser(), {}, {}};
  if (!plan.options.accepted.empty()) plan.accepted = test::AcceptedFindings(plan.options.accepted);
  if (!plan.options.fromBundle.empty() && !takeFromBundle(plan, error)) return {};
  takeSettings(plan);
  plan.record.version = kVersion;
  plan.record.trace = fs::absolute(plan.options.trace).native();
  plan.record.command = plan.options.command;
  if (plan.options.report.empty()) plan.options.report = plan.folder / kReportName;
  return plan;
}

Launch launchOf(const Plan& plan) {
  const bool isWatched = plan.options.pace == Options::Pace::RealTime;
  Launch launch{plan.options.command,
                {},
                plan.folder / kOutputName,
                plan.folder / kSessionName,
                plan.options.timeout};
  for (const char* const name : kSettings) {
    const auto found = plan.record.environment.find(name);
    const bool isSet = found != plan.record.environment.end();
    launch.environment[name] = isSet ? std::optional(found->second) : std::nullopt;
  }
  launch.environment["BRIMOL_TRACE"] = plan.record.trace;
  if (!plan.traceRoot.empty()) launch.environment[kRootVariable] = plan.traceRoot;
  launch.environment["BRIMOL_RECORD"] = std::nullopt;
  launch.environment["BRIMOL_MONKEY"] = std::nullopt;
  launch.environment["BRIMOL_REPORT_DIR"] = plan.folder.native();
  if (plan.options.lints) launch.environment["BRIMOL_REPORT_ITEMS"] = "changed";
  launch.environment["BRIMOL_DISPLAY"] = isWatched ? "window" : "headless";
  launch.environment["BRIMOL_CLOCK"] = isWatched ? "paced" : "simulated";
  return launch;
}

/// A run that has ended, and what it is compared with.
struct Outcome {
  PlayedRun run;
  RunEnd end;
  std::optional<PlayedRun> other;
  Comparison comparison;
  Judgement judgement;
  std::string output;
};

Outcome runAndJudge(const Plan& plan) {
  Outcome outcome;
  {
    Progress progress(stderr);
    outcome.end =
        run(launchOf(plan), [&progress](const Session& session) { progress.show(session); });
  }
  outcome.run = {plan.folder, readSession(plan.folder / kSessionName)};
  // One byte more than is shown tells that there are more.
  outcome.output = endOf(plan.folder / kOutputName, kMostOutputBytes + 1);
  if (const fs::path& against = plan.options.against; !against.empty()) {
    outcome.other = PlayedRun{against, readSession(against / kSessionName)};
    outcome.comparison = compare(outcome.run, *outcome.other, kMostPairs);
  }
  const Session& session = outcome.run.session;
  outcome.judgement =
      judge(session, outcome.end, outcome.comparison.differences, plan.options.exitCode);
  if (plan.options.lints) {
    outcome.judgement = judgeLayout(outcome.judgement, session, plan.accepted);
  }
  return outcome;
}

std::string pageOf(const Plan& plan, const Outcome& outcome) {
  ReportInput input{outcome.run, outcome.end, outcome.judgement, {}};
  input.about = {{"Trace", plan.record.trace},
                 {"Application", commandText(plan.record.command)},
                 {"brimol-replay", kVersion}};
  input.output = outcome.output;
  input.page = fs::absolute(plan.options.report).parent_path();
  input.traces = fs::path(plan.record.trace).parent_path();
  if (outcome.other) {
    input.other = &*outcome.other;
    input.comparison = &outcome.comparison;
  }
  return reportPage(input);
}

bool writeAll(const Plan& plan, const Outcome& outcome, std::string& error) {
  const Options& options = plan.options;
  RunRecord record = plan.record;
  record.verdict = verdictName(outcome.judgement.verdict);
  if (!writeFile(plan.folder / kRecordFileName, jsonOf(record), error)) return false;
  if (!writeFile(options.report, pageOf(plan, outcome), error)) return false;
  if (!options.junit.empty()) {
    const std::string xml =
        junitXml(options.trace.filename(), outcome.run.session, outcome.judgement, outcome.output);
    if (!writeFile(options.junit, xml, error)) return false;
  }
  const bool isPacked = !options.bundle.empty() && outcome.judgement.verdict != Verdict::Unusable;
  return !isPacked || writeBundle(options.bundle, record, traceFiles(options.trace, plan.traceRoot),
                                  plan.folder, error);
}

// The end of what the application wrote, where it says more than the judgement.
std::string lastLines(const std::string& output) {
  constexpr int kLines = 20;
  auto from = output.size();
  for (int line = 0; line <= kLines && from != std::string::npos && from > 0; ++line) {
    from = output.rfind('\n', from - 1);
  }
  std::string lines = from == std::string::npos || from == 0 ? output : output.substr(from + 1);
  if (!lines.empty() && lines.back() != '\n') lines += '\n';
  return lines;
}

void tell(const Plan& plan, const Outcome& outcome) {
  const auto& [verdict, headline, detail, place] = outcome.judgement;
  const bool passed = verdict == Verdict::Passed;
  std::ostream& out = passed ? std::cout : std::cerr;
  if (!passed) std::cerr << lastLines(outcome.output);
  if (!place.file.empty()) out << place.text() << ": ";
  out << verdictName(verdict) << ": " << headline << '\n';
  if (!detail.empty()) out << detail << '\n';
  if (verdict == Verdict::Unusable && !plan.options.bundle.empty()) {
    out << "no bundle: there is no run to repeat\n";
  }
  out << "report: " << plan.options.report.native() << '\n';
}

}  // namespace

int replay(Options options) {
  std::string error;
  const auto plan = prepare(std::move(options), error);
  if (!plan) return complain(error);
  const Outcome outcome = runAndJudge(*plan);
  const bool isWritten = writeAll(*plan, outcome, error);
  tell(*plan, outcome);
  return isWritten ? exitCodeOf(outcome.judgement.verdict) : complain(error);
}

}  // namespace brimol::replay
