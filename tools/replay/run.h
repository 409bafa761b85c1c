/// The application as a process of its own.
#pragma once

#include <chrono>
#include <filesystem>
#include <functional>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "session.h"
#include "verdict.h"

namespace brimol::replay {

struct Launch {
  std::vector<std::string> command;
  // Over this program's own; nothing: not set.
  std::map<std::string, std::optional<std::string>> environment;
  std::filesystem::path output;       // takes what it writes to stdout and stderr
  std::filesystem::path session;      // what it writes there is followed
  std::chrono::milliseconds timeout;  // without a new line there; 0: none
};

/// Runs it in a process group of its own until it ends, hangs, or this program is asked to end
/// (SIGINT, SIGQUIT, SIGTERM, SIGHUP, as far as they are not ignored). Whatever happens, nothing of
/// the group is left running, not even where this program is killed. What leaves the group (setsid,
/// timeout) stays; only the application itself, with the group that it then leads, is ended all the
/// same unless this program is killed. `look` is called with what the session has come to, about
/// ten times a second.
RunEnd run(const Launch& launch, const std::function<void(const Session&)>& look);

}  // namespace brimol::replay
