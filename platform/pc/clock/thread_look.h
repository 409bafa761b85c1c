/// What a thread of this process is doing, as the kernel shows it.
#pragma once

#include <sys/types.h>

#include <chrono>
#include <cstdint>
#include <string_view>
#include <vector>

namespace brimol::pc {

enum class ThreadState {
  Running,   ///< or ready to, or waiting for a disk or for memory, which end by themselves
  OnThread,  ///< waits for what another thread of the process does: a lock, a condition, an end
  Outside,   ///< waits for anything else: a pipe, a child process, a pause; or cannot be looked at,
             ///< as where the process has no descriptor left
  Gone,
};

/// From the text of the thread's `syscall` file.
ThreadState stateOf(std::string_view syscallText);

ThreadState lookAt(pid_t thread);

/// What the processors have spent on the thread so far, to 10 ms; 0 where it is gone. Other than
/// real time, this does not pass for a thread that a busy machine keeps waiting.
std::chrono::milliseconds cpuTimeOf(pid_t thread);

/// How often the thread has gone to sleep by itself so far; 0 where that cannot be told.
uint64_t sleepsOf(pid_t thread);

/// All threads that the process has at the moment.
std::vector<pid_t> threadsOfProcess();

}  // namespace brimol::pc
