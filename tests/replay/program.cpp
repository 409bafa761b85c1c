#include "program.h"

#include <fcntl.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <stdexcept>
#include <utility>

namespace brimol::test {

Program::Program(const std::filesystem::path& folder, const Variables& variables,
                 std::vector<std::string> arguments) {
  arguments.insert(arguments.begin(), FACTORY_TEST);
  std::vector<char*> words;
  words.reserve(arguments.size() + 1);
  for (std::string& each : arguments) words.push_back(each.data());
  words.push_back(nullptr);
  process = ::fork();
  if (process < 0) throw std::runtime_error("cannot start a process");
  if (process > 0) return;
  const int errors = ::open((folder / "stderr").c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
  ::dup2(errors, STDERR_FILENO);
  std::filesystem::current_path(folder);
  for (const auto& [name, value] : variables) ::setenv(name.c_str(), value.c_str(), 1);
  ::execv(words.front(), words.data());
  std::_Exit(127);
}

Program::~Program() {
  if (process > 0) ::kill(process, SIGKILL);
  waitForEnd();
}

int Program::waitForEnd() {
  int status = 0;
  if (process <= 0 || ::waitpid(std::exchange(process, 0), &status, 0) < 0) return -1;
  return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

bool Program::isRunning() const {
  siginfo_t end = {};
  const auto number = static_cast<id_t>(process);
  return ::waitid(P_PID, number, &end, WEXITED | WNOHANG | WNOWAIT) == 0 && end.si_pid == 0;
}

void Program::kill() const { ::kill(process, SIGKILL); }

std::string readAll(const std::filesystem::path& file) {
  std::ifstream in(file, std::ios::binary);
  return {std::istreambuf_iterator<char>(in), {}};
}

BusyCore::BusyCore() : process(::fork()) {
  if (process != 0) return;
  while (::getppid() != 1) {  // ends with the test, however that ends
  }
  std::_Exit(0);
}

BusyCore::~BusyCore() {
  ::kill(process, SIGKILL);
  ::waitpid(process, nullptr, 0);
}

}  // namespace brimol::test
