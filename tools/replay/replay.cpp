#include "replay.h"

#include <array>
#include <cstdlib>
#include <fstream>
#include <iostream>

#include "bundle.h"
#include "compare.h"
#include "junit.h"
#include "layout_lint.h"
#include "picture.h"
#include "progress.h"
#include "report.h"
#include "report_data.h"
#include "run.h"
#include "run_directory.h"
#include "version.h"

namespace brimol::replay {

namespace fs = std::filesystem;

namespace {

// The platform's settings that a run depends on, and that a repeated run takes from the first.
constexpr auto kSettings =
    std::to_array<const char*>({"BRIMOL_DEVICE", "BRIMOL_SCREEN", "BRIMOL_CLOCK_START"});

int complain(const std::string& message) {
  std::cerr << "brimol-replay: " << message << '\n';
  return exitCodeOf(Verdict::Unusable);
}

/// All that stands before the application starts.
struct Plan {
  Options options;
  fs::path folder;  // of the run
  RunRecord record;
  test::AcceptedFindings accepted;
};

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

// Empty: what is named can be read and written, as far as can be told beforehand.
std::string whatIsMissing(const Options& options) {
  for (const fs::path& file : {options.trace, options.fromBundle}) {
    if (!file.empty() && !std::ifstream(file)) return file.native() + ": cannot be read";
    if (fs::is_directory(file)) return file.native() + ": is a folder";
  }
  if (!options.against.empty() && !fs::exists(options.against / kSessionName)) {
    return options.against.native() + ": holds no run";
  }
  std::error_code failure;
  if (fs::equivalent(options.against, options.directory, failure)) {
    return options.against.native() + ": would be replaced by the run that is compared with it";
  }
  for (const fs::path& file : {options.report, options.junit, options.bundle}) {
    if (file.empty()) continue;
    if (!fs::is_directory(fs::absolute(file).parent_path()) || fs::is_directory(file)) {
      return file.native() + ": cannot be written there";
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

std::optional<Plan> prepare(Options options, std::string& error) {
  error = whatIsMissing(options);
  if (!error.empty()) return {};
  const fs::path& named = options.trace.empty() ? options.fromBundle : options.trace;
  const auto folder = prepareRunDirectory(options.directory, named.stem(), error);
  if (!folder) return {};
  Plan plan{std::move(options), *folder, {}, {}};
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
  if (!plan.options.fromBundle.empty()) {
    launch.environment["BRIMOL_TRACE_ROOT"] = plan.folder / kUnpackedName;
  }
  launch.environment["BRIMOL_RECORD"] = std::nullopt;
  launch.environment["BRIMOL_REPORT_DIR"] = plan.folder.native();
  if (plan.options.lints) launch.environment["BRIMOL_REPORT_ITEMS"] = "changed";
  launch.environment["BRIMOL_DISPLAY"] = isWatched ? "window" : "headless";
  launch.environment["BRIMOL_CLOCK"] = isWatched ? "paced" : "simulated";
  return launch;
}

bool writeBytes(const fs::path& file, const std::string& text) {
  std::ofstream stream(file, std::ios::binary);
  stream << text;
  stream.close();
  return stream.good();
}

// Whole, or what was there stays. A device does not give way to a file.
bool writeFile(const fs::path& file, const std::string& text, std::string& error) {
  std::error_code failure;
  const fs::path target = fs::weakly_canonical(file, failure);
  if (fs::is_regular_file(target, failure) || !fs::exists(target, failure)) {
    const fs::path temporary = fs::path(target).concat(".tmp");
    const bool isWhole = writeBytes(temporary, text);
    if (isWhole) fs::rename(temporary, target, failure);
    if (isWhole && !failure) return true;
    fs::remove(temporary, failure);
  } else if (writeBytes(target, text)) {
    return true;
  }
  error = file.native() + ": cannot be written";
  return false;
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
  outcome.output = bytesOf(plan.folder / kOutputName);
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
  return options.bundle.empty() ||
         writeBundle(options.bundle, record, options.trace, plan.folder, error);
}

// The end of what the application wrote, where it says more than the judgement.
std::string lastLines(const std::string& output) {
  constexpr int kLines = 20;
  auto from = output.size();
  for (int line = 0; line <= kLines && from != std::string::npos && from > 0; ++line) {
    from = output.rfind('\n', from - 1);
  }
  return from == std::string::npos || from == 0 ? output : output.substr(from + 1);
}

void tell(const Plan& plan, const Outcome& outcome) {
  const auto& [verdict, headline, detail, place] = outcome.judgement;
  const bool passed = verdict == Verdict::Passed;
  std::ostream& out = passed ? std::cout : std::cerr;
  if (!passed) std::cerr << lastLines(outcome.output);
  if (!place.file.empty()) out << place.text() << ": ";
  out << verdictName(verdict) << ": " << headline << '\n';
  if (!detail.empty()) out << detail << '\n';
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
