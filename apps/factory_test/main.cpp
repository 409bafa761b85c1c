// The example application: a factory test that shows the toolkit's widgets at work.
#include <brimol/host.h>

#include <cstdio>
#include <cstdlib>
#include <span>
#include <string>

#include "application.h"
#include "complain.h"
#include "options.h"
#include "plan/plan_json.h"
#include "records/commands.h"
#include "task.h"
#include "version.h"

namespace {

void printHelp() {
  std::printf("%s\nOn a PC:\n%s", factory_test::usage().c_str(), brimol_host_help());
}

int printPlan(const factory_test::Options& options) {
  std::string error;
  const auto task = factory_test::chooseTask(options, error);
  if (!task) {
    factory_test::complain(error);
    return static_cast<int>(factory_test::ExitCode::WrongUse);
  }
  std::fputs(factory_test::planJson(task->plan).c_str(), stdout);
  return EXIT_SUCCESS;
}

}  // namespace

int main(int count, char** arguments) {
  std::string error;
  const std::span<const char* const> all(arguments, static_cast<std::size_t>(count));
  const auto words = all.subspan(all.empty() ? 0 : 1);
  if (const auto done = factory_test::runRecordsCommand(words)) return *done;
  const auto options = factory_test::parseOptions(words, error);
  if (!options) {
    factory_test::complain(error);
    return static_cast<int>(factory_test::ExitCode::WrongUse);
  }
  if (options->action == factory_test::Options::Action::Help) {
    printHelp();
    return EXIT_SUCCESS;
  }
  if (options->action == factory_test::Options::Action::Version) {
    std::printf("factory_test %s\n", factory_test::kVersion);
    return EXIT_SUCCESS;
  }
  if (options->action == factory_test::Options::Action::PrintPlan) return printPlan(*options);
  return static_cast<int>(factory_test::runApplication(*options));
}
