/// Signals are the application's: what serves viewers neither raises any nor changes what they do.
#pragma once

#include <pthread.h>

#include <csignal>

namespace brimol::pc {

/// A write to a viewer who has gone raises a signal in the thread that writes: not in this one.
inline void blockBrokenPipes() {
  sigset_t signals;
  sigemptyset(&signals);
  sigaddset(&signals, SIGPIPE);
  pthread_sigmask(SIG_BLOCK, &signals, nullptr);
}

/// Restores what the signal of a broken pipe did, when it goes out of scope.
class BrokenPipeKeeper {
 public:
  BrokenPipeKeeper() { sigaction(SIGPIPE, nullptr, &usual); }
  ~BrokenPipeKeeper() { sigaction(SIGPIPE, &usual, nullptr); }
  BrokenPipeKeeper(const BrokenPipeKeeper&) = delete;
  BrokenPipeKeeper& operator=(const BrokenPipeKeeper&) = delete;

 private:
  struct sigaction usual = {};
};

}  // namespace brimol::pc
