#include "task.h"

#include "pages/table.h"
#include "plan/plan_reader.h"
#include "records/run.h"

namespace factory_test {

namespace {

std::vector<KnownTest> knownTests() {
  std::vector<KnownTest> known;
  for (const TestEntry& entry : testEntries()) {
    known.push_back({entry.id, entry.plan == DefaultPlan::In});
  }
  return known;
}

}  // namespace

std::optional<Task> chooseTask(const Options& options, std::string& error) {
  const auto known = knownTests();
  auto plan = options.plan.empty() ? defaultPlan(known) : readPlan(options.plan, known, error);
  if (!plan) return {};
  auto simulation = Simulation::parse(options.simulate, *plan, error);
  if (!simulation) return {};
  if (!simulation->isEmpty()) plan->name += kRehearsal;
  return Task{*std::move(plan), *std::move(simulation), !options.plan.empty(), options.run};
}

}  // namespace factory_test
