/// What a test of the menu is.
#pragma once

#include <cstdint>
#include <memory>
#include <type_traits>
#include <vector>

#include "surroundings.h"

namespace factory_test {

/// What became of a test so far.
enum class Outcome { Running, Pass, Fail, Retry, Left };

/// One test, one file in tests/. All operations are called on the main thread; what callbacks,
/// which come on the dispatch thread, leave behind is atomic or stands in widgets.
class Test {
 public:
  virtual ~Test() = default;

  /// Puts the test's widgets on the screen.
  virtual void enter() = 0;
  /// Takes them off again. No callback runs any more when it returns.
  virtual void leave() = 0;
  /// Anything but Running ends the test.
  virtual Outcome verdict() const = 0;

  /// Draws what stands under the window's widgets.
  virtual void draw() = 0;
  /// Comes in every round of the main loop, at GetTicks() milliseconds.
  virtual void update(uint32_t now) { static_cast<void>(now); }
};

enum class Group { Display, Input, Widgets, Dialogs, Reports };

/// A line of the menu.
struct TestEntry {
  Group group;
  int place;         ///< within the group, from 0
  const char* id;    ///< what results call it; never changes
  const char* name;  ///< what the menu calls it
  std::unique_ptr<Test> (*make)(const Surroundings& program);
};

/// A test's own line, in the test's file. It stands at namespace scope:
///
///     const TestRegistration kRegistration({Group::Input, 1, "keys", "Keys", makeTest<KeyTest>});
class TestRegistration {
 public:
  explicit TestRegistration(const TestEntry& entry);
};

/// Kinds that need something of the program are constructed with its Surroundings.
template <typename Kind>
std::unique_ptr<Test> makeTest(const Surroundings& program) {
  if constexpr (std::is_constructible_v<Kind, const Surroundings&>) {
    return std::make_unique<Kind>(program);
  } else {
    return std::make_unique<Kind>();
  }
}

/// All of them, by group and place.
const std::vector<TestEntry>& testEntries();

const char* nameOf(Group group);

}  // namespace factory_test
