#include "process/child.h"

#include <sys/wait.h>

#include <cerrno>
#include <csignal>

namespace brimol::process {

bool hasEnded(pid_t process) {
  siginfo_t info = {};
  const int options = WEXITED | WNOHANG | WNOWAIT;
  return ::waitid(P_PID, static_cast<id_t>(process), &info, options) != 0 || info.si_pid != 0;
}

std::optional<int> finish(pid_t process) {
  ::kill(-process, SIGKILL);
  const int options = ::kill(process, SIGKILL) == 0 ? 0 : WNOHANG;
  int status = 0;
  pid_t waited = ::waitpid(process, &status, options);
  while (waited < 0 && errno == EINTR) waited = ::waitpid(process, &status, options);
  if (waited <= 0) return std::nullopt;
  return status;
}

}  // namespace brimol::process
