/// What pages need of the program around them.
#pragma once

#include <optional>
#include <string>

#include "results/results.h"
#include "session_log.h"

namespace factory_test {

/// Everything lives as long as the program; used on the main thread, the log on any.
struct Context {
  const ResultBook& results;
  SessionLog& log;
  std::optional<std::string> logText;  // what the log viewer shows; none: the program's own log
  std::string shellCommand;            // for /bin/sh
};

}  // namespace factory_test
