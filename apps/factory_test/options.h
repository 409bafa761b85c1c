/// The command line of the factory test.
#pragma once

#include <optional>
#include <span>
#include <string>

namespace factory_test {

struct Options {
  enum class Action { Run, Help, Version, PrintPlan };

  Action action = Action::Run;
  bool headless = false;      // draw to memory, without a window
  std::string device = {};    // the phone's screen that is played; empty: what BRIMOL_DEVICE says
  std::string language = {};  // as chooseLanguage() takes it; empty: the environment's
  bool verbose = false;       // write the toolkit's log to stderr
  std::string test = {};      // the page of this id comes first; empty: the menu
  std::string shot = {};      // draw once, write this PNG file and end; empty: no
  std::string results = {};   // the JSON file that keeps the verdicts; empty: none
  std::string junit = {};     // the same as a report for a CI system; empty: none
  std::string database = {};  // the station's database; empty: none
  std::string line = {};      // the address of the line's database; empty: none
  std::string serial = {};    // of the unit under test; empty: not said
  std::string operatorName = {};  // empty: not said
  bool newRun = false;            // do not go on with an aborted run
  std::string plan = {};          // the JSON file of what to test; empty: the default plan
  bool run = false;              // perform the plan from its first step to its last, without a menu
  std::string simulate = {};     // failures to rehearse; empty: none
  std::string log = {};          // the file that the log viewer shows; empty: the program's own log
  std::string monkey = {};       // the seed of random input; empty: none
  std::string events = {};       // how many of it; empty: as the platform says
  std::string monkeyTrace = {};  // where it is written; empty: beside the caller
  bool stays = false;            // the user cannot end it
  std::string shell = "uname -a";  // what the shell runs, for /bin/sh
};

using Arguments = std::span<const char* const>;

/// The options, or nothing for a wrong command line; `error` then says in one line what is wrong
/// first. --help and --version win over that, wherever they stand.
/// `arguments` does not hold the program's name.
std::optional<Options> parseOptions(Arguments arguments, std::string& error);

/// What --help prints: options, exit codes, environment, devices; without the keys of the host.
std::string usage();

}  // namespace factory_test
