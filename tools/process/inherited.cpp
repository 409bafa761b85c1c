#include "process/inherited.h"

#include <fcntl.h>
#include <unistd.h>

#include <csignal>

namespace brimol::process {

void settleInherited() {
  int opened = 0;
  while (opened >= 0 && opened <= STDERR_FILENO) opened = ::open("/dev/null", O_RDWR);
  if (opened >= 0) ::close(opened);
  std::signal(SIGCHLD, SIG_DFL);
}

bool isIgnored(int signal) {
  struct sigaction now = {};
  return ::sigaction(signal, nullptr, &now) == 0 && now.sa_handler == SIG_IGN;
}

}  // namespace brimol::process
