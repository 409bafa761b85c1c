/// The command line.
#pragma once

#include <chrono>
#include <filesystem>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace brimol::replay {

struct Options {
  enum class Action { Replay, Help, Version };
  enum class Pace { Fastest, RealTime };

  Action action = Action::Replay;
  Pace pace = Pace::Fastest;
  std::filesystem::path trace = {};       // empty with fromBundle
  std::filesystem::path fromBundle = {};  // what follows may be empty: not wanted, or the default
  std::filesystem::path directory = {};
  std::filesystem::path report = {};
  std::filesystem::path junit = {};
  std::filesystem::path bundle = {};
  std::filesystem::path against = {};
  std::string screen = {};              // WIDTHxHEIGHT
  std::string device = {};              // a name
  std::filesystem::path accepted = {};  // findings of the lint
  bool lints = false;
  bool takesArguments = false;            // the bundle's
  std::chrono::seconds timeout{60};       // 0: none
  int exitCode = 0;                       // with which the application is to end
  std::vector<std::string> command = {};  // the application and its arguments
};

/// Nothing, with one line in `error`, where the arguments (without the program's own name) are
/// wrong.
std::optional<Options> parseOptions(std::span<const char* const> arguments, std::string& error);

std::string usage();

}  // namespace brimol::replay
