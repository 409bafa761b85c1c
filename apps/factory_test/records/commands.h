/// What the program does with its records, without a screen.
#pragma once

#include <optional>
#include <span>
#include <string>

#include "exit_code.h"

namespace factory_test {

/// Does `export` or `report`, with the options behind the word, and returns the program's exit
/// code: Passed; Trouble when a database or a file could not be read or written; WrongUse for wrong
/// options. Errors go to stderr in one line. Nothing is returned where the first argument is
/// neither word.
std::optional<ExitCode> runRecordsCommand(std::span<const char* const> arguments);

/// What --help says of them.
std::string recordsUsage();

}  // namespace factory_test
