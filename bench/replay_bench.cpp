// What simulated time, played traces and recordings cost: whole sessions of the example
// application. Without arguments; the program that is run stands in FACTORY_TEST.
#include <benchmark/benchmark.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <chrono>
#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <map>
#include <stdexcept>
#include <string>
#include <thread>

namespace {

namespace fs = std::filesystem;

const fs::path kFolder = fs::temp_directory_path() / ("replay_bench." + std::to_string(::getpid()));

constexpr int kNotAllPassed = 4;  // what an application says that is left from its menu

using Variables = std::map<std::string, std::string>;

/// A session without a window.
pid_t start(const Variables& variables) {
  const pid_t process = ::fork();
  if (process != 0) return process;
  ::setenv("BRIMOL_DISPLAY", "headless", 1);
  ::setenv("BRIMOL_SCREEN", "720x1280", 1);
  for (const auto& [name, value] : variables) ::setenv(name.c_str(), value.c_str(), 1);
  std::string program = FACTORY_TEST;
  const std::array<char*, 2> arguments = {program.data(), nullptr};
  ::execv(program.c_str(), arguments.data());
  std::_Exit(EXIT_FAILURE);
}

/// Waits for its end. The milliseconds that processors spent on it.
double finish(pid_t process) {
  int status = 0;
  rusage used = {};
  ::wait4(process, &status, 0, &used);
  if (!WIFEXITED(status) || WEXITSTATUS(status) != kNotAllPassed)
    throw std::runtime_error("a session failed");
  const auto ms = [](const timeval& time) {
    constexpr double kMs = 1000;
    return static_cast<double>(time.tv_sec) * kMs + static_cast<double>(time.tv_usec) / kMs;
  };
  return ms(used.ru_utime) + ms(used.ru_stime);
}

void run(const Variables& variables) { finish(start(variables)); }

double runFor(std::chrono::seconds time, const Variables& variables) {
  const pid_t process = start(variables);
  std::this_thread::sleep_for(time);
  ::kill(process, SIGTERM);
  return finish(process);
}

std::string writeTrace(const std::string& steps) {
  fs::create_directories(kFolder);
  std::string path = kFolder / "bench.trace";
  std::ofstream(path) << "brimol-trace 1\n" << steps;
  return path;
}

// Of an idle application, which looks at its figures once a second.
void simulatedSeconds(benchmark::State& state) {
  constexpr int kSeconds = 60;
  const std::string trace = writeTrace("wait " + std::to_string(kSeconds) + "000\n");
  for ([[maybe_unused]] auto round : state) run({{"BRIMOL_TRACE", trace}});
  state.counters["simulated_per_real"] =
      benchmark::Counter(kSeconds, benchmark::Counter::kIsIterationInvariantRate);
}

// A list that is dragged up and down: a frame in every round of the main loop.
void replayedFrames(benchmark::State& state) {
  std::string steps;
  for (int i = 0; i < 20; ++i) {
    steps += "drag 50% 90% to 50% 50% over 1000\ndrag 50% 50% to 50% 90% over 1000\n";
  }
  const std::string trace = writeTrace(steps);
  const fs::path report = kFolder / "report";
  run({{"BRIMOL_TRACE", trace}, {"BRIMOL_REPORT_DIR", report}, {"BRIMOL_REPORT_PICTURES", "none"}});
  int frames = 0;
  std::ifstream lines(report / "session.jsonl");
  for (std::string line; std::getline(lines, line);) {
    if (line.find(R"("kind":"frame")") != std::string::npos) ++frames;
  }
  for ([[maybe_unused]] auto round : state) run({{"BRIMOL_TRACE", trace}});
  state.counters["frames_per_second"] =
      benchmark::Counter(frames, benchmark::Counter::kIsIterationInvariantRate);
}

// What an idle session costs the processor in a second, under the real clock and recorded.
void recordedSecond(benchmark::State& state) {
  constexpr std::chrono::seconds kTime{3};
  fs::create_directories(kFolder);
  double real = 0;
  double recorded = 0;
  for ([[maybe_unused]] auto round : state) {
    real += runFor(kTime, {});
    recorded += runFor(kTime, {{"BRIMOL_RECORD", kFolder / "bench.recording"}});
  }
  const auto seconds = static_cast<double>(kTime.count() * state.iterations());
  state.counters["real_cpu_ms"] = real / seconds;
  state.counters["recorded_cpu_ms"] = recorded / seconds;
}

BENCHMARK(recordedSecond)->Unit(benchmark::kMillisecond)->UseRealTime()->Iterations(3);
BENCHMARK(simulatedSeconds)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(replayedFrames)->Unit(benchmark::kMillisecond)->UseRealTime();

}  // namespace

int main(int count, char** arguments) {
  benchmark::Initialize(&count, arguments);
  if (benchmark::ReportUnrecognizedArguments(count, arguments)) return EXIT_FAILURE;
  benchmark::RunSpecifiedBenchmarks();
  fs::remove_all(kFolder);
  return EXIT_SUCCESS;
}
