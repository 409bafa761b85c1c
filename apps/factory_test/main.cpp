// The example application: a factory test that shows the toolkit's widgets at work.
#include <brimol/host.h>

#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <span>
#include <string>

#include "application.h"
#include "complain.h"
#include "options.h"
#include "plan/plan_json.h"
#include "process/inherited.h"
#include "records/commands.h"
#include "task.h"
#include "version.h"

namespace {

int print(const std::string& text) {
  if (std::fputs(text.c_str(), stdout) != EOF && std::fflush(stdout) == 0) return EXIT_SUCCESS;
  factory_test::complain("stdout cannot be written");
  return EXIT_FAILURE;
}

int printPlan(const factory_test::Options& options) {
  std::string error;
  const auto task = factory_test::chooseTask(options, error);
  if (!task) {
    factory_test::complain(error);
    return static_cast<int>(factory_test::ExitCode::WrongUse);
  }
  return print(factory_test::planJson(task->plan));
}

}  // namespace

int main(int count, char** arguments) {
  brimol::process::settleInherited();
  // What goes beyond a limit for files fails as on a full disk, instead of ending the program.
  std::signal(SIGXFSZ, SIG_IGN);
  std::string error;
  const std::span<const char* const> all(arguments, static_cast<std::size_t>(count));
  const auto words = all.subspan(all.empty() ? 0 : 1);
  if (const auto done = factory_test::runRecordsCommand(words)) return static_cast<int>(*done);
  const auto options = factory_test::parseOptions(words, error);
  if (!options) {
    factory_test::complain(error);
    return static_cast<int>(factory_test::ExitCode::WrongUse);
  }
  if (options->action == factory_test::Options::Action::Help) {
    return print(factory_test::usage() + "\nOn a PC:\n" + brimol_host_help());
  }
  if (options->action == factory_test::Options::Action::Version) {
    return print(std::string("factory_test ") + factory_test::kVersion + "\n");
  }
  if (options->action == factory_test::Options::Action::PrintPlan) return printPlan(*options);
  return static_cast<int>(factory_test::runApplication(*options));
}
