/// What a run has come to, in one line of a terminal.
#pragma once

#include <cstdio>

#include "session.h"

namespace brimol::replay {

/// Shows nothing where `shownOn` is no terminal.
class Progress {
 public:
  explicit Progress(std::FILE* shownOn);
  ~Progress();
  Progress(const Progress&) = delete;
  Progress& operator=(const Progress&) = delete;

  void show(const Session& session);

 private:
  std::FILE* const stream;  // null: no terminal
};

/// The line, without control characters and not longer than `columns`.
std::string progressLine(const Session& session, std::size_t columns);

}  // namespace brimol::replay
