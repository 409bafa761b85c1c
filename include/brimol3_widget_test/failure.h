/// How the kit says that something is not as expected.
#pragma once

#include <stdexcept>
#include <string>

namespace brimol::test {

/// A line of a test. As a default argument it is the line of the call.
struct Here {
  const char* file;  ///< its path, as the compiler was given it
  int line;          ///< from 1

  /// The caller's line.
  static constexpr Here now(const char* callersFile = __builtin_FILE(),
                            int callersLine = __builtin_LINE()) {
    return {callersFile, callersLine};
  }
};

/// What every check throws. what() is "FILE:LINE: " and what is wrong, of one or more lines. Test
/// frameworks report an exception as a failure of the test; a plain main() catches and prints it.
class Failure : public std::runtime_error {
 public:
  /// `message`: what is wrong, without the line.
  Failure(const Here& where, const std::string& message)
      : std::runtime_error(std::string(where.file) + ":" + std::to_string(where.line) + ": " +
                           message) {}
};

}  // namespace brimol::test
