// From the start of a process to its first painted frame, and what is resident then. The program
// that is started stands in FIRST_FRAME.
#include <benchmark/benchmark.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <chrono>
#include <cstdlib>
#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

#include "percentile.h"

namespace {

using Clock = std::chrono::steady_clock;
using Milliseconds = std::chrono::duration<double, std::milli>;

// Runs the program and returns what it prints.
std::string outputOf(const char* program) {
  std::array<int, 2> ends = {};
  if (::pipe(ends.data()) != 0) throw std::runtime_error("no pipe");
  const pid_t process = ::fork();
  if (process == 0) {
    ::dup2(ends[1], STDOUT_FILENO);
    ::close(ends[0]);
    ::execl(program, program, nullptr);
    std::_Exit(EXIT_FAILURE);
  }
  ::close(ends[1]);
  std::string output;
  std::array<char, 64> part = {};
  for (ssize_t bytes = 0; (bytes = ::read(ends[0], part.data(), part.size())) > 0;) {
    output.append(part.data(), static_cast<std::size_t>(bytes));
  }
  ::close(ends[0]);
  int status = 0;
  ::waitpid(process, &status, 0);
  if (status != 0) throw std::runtime_error("the application failed");
  return output;
}

void toFirstFrame(benchmark::State& state, const char* screen) {
  ::setenv("BRIMOL_SCREEN", screen, 1);
  std::vector<double> times;
  std::vector<double> sizes;
  for ([[maybe_unused]] auto round : state) {
    const auto start = Clock::now();
    std::istringstream output(outputOf(FIRST_FRAME));
    Clock::rep painted = 0;
    double kilobytes = 0;
    output >> painted >> kilobytes;
    times.push_back(Milliseconds(Clock::time_point(Clock::duration(painted)) - start).count());
    constexpr double kMega = 1024;
    sizes.push_back(kilobytes / kMega);
  }
  state.counters["least_ms"] = percentile(times, 0);
  state.counters["median_ms"] = median(times);
  state.counters["resident_mb"] = median(sizes);
}

constexpr int kProcesses = 20;
BENCHMARK_CAPTURE(toFirstFrame, 480x800, "480x800")->Iterations(kProcesses);
BENCHMARK_CAPTURE(toFirstFrame, 1080x1920, "1080x1920")->Iterations(kProcesses);
BENCHMARK_CAPTURE(toFirstFrame, 1440x2560, "1440x2560")->Iterations(kProcesses);

}  // namespace

int main(int count, char** arguments) {
  ::setenv("BRIMOL_DISPLAY", "headless", 1);
  benchmark::Initialize(&count, arguments);
  if (benchmark::ReportUnrecognizedArguments(count, arguments)) return EXIT_FAILURE;
  benchmark::RunSpecifiedBenchmarks();
  return EXIT_SUCCESS;
}
