#include "test.h"

#include <algorithm>
#include <tuple>

namespace factory_test {

namespace {

// Constructed with the first registration, and so before all others, whatever the order of files.
std::vector<TestEntry>& registry() {
  static std::vector<TestEntry> entries;  // NOLINT: what registrations are for
  return entries;
}

}  // namespace

TestRegistration::TestRegistration(const TestEntry& entry) {
  std::vector<TestEntry>& entries = registry();
  const auto key = [](const TestEntry& each) { return std::tuple(each.group, each.place); };
  entries.insert(std::ranges::upper_bound(entries, key(entry), {}, key), entry);
}

const std::vector<TestEntry>& testEntries() { return registry(); }

const char* nameOf(Group group) {
  switch (group) {
    case Group::Display: return "Display";
    case Group::Input: return "Input";
    case Group::Widgets: return "Widgets";
    case Group::Dialogs: return "Dialogs";
    case Group::Reports: break;
  }
  return "Reports";
}

}  // namespace factory_test
