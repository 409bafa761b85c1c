#include "session_log.h"

#include <android/log.h>

#include <brimol/input.h>

#include <array>
#include <atomic>
#include <cstdio>
#include <utility>

namespace factory_test {

namespace {

// Where the log's own callback, a plain function, finds it. No toolkit thread runs while either
// changes.
constinit std::atomic<SessionLog*> current = nullptr;
constinit std::atomic<bool> echoes = false;

void hear(const __android_logger_data* data, const char* message) {
  if (SessionLog* const log = current) log->add(message);
  if (echoes) __android_log_stderr_logger(data, message);
}

// The log's time, seconds and milliseconds, and the words.
std::string lineOf(uint32_t ticks, const std::string& words) {
  constexpr uint32_t kSecond = 1000;
  std::array<char, 32> time{};
  std::snprintf(time.data(), time.size(), "%4u.%03u ", ticks / kSecond, ticks % kSecond);
  return time.data() + words + "\n";
}

}  // namespace

SessionLog::SessionLog(Echo echo) {
  current = this;
  echoes = echo == Echo::ToStderr;
  __android_log_set_minimum_priority(ANDROID_LOG_VERBOSE);
  __android_log_set_logger(hear);
}

SessionLog::~SessionLog() {
  current = nullptr;
  __android_log_set_minimum_priority(ANDROID_LOG_SILENT);
}

void SessionLog::add(const std::string& words) {
  std::string line = lineOf(GetTicks(), words);
  const std::lock_guard guard(mutex);
  lines.push_back(std::move(line));
  if (lines.size() > kMostLines) lines.pop_front();
}

std::string SessionLog::text() const {
  const std::lock_guard guard(mutex);
  std::string all;
  for (const std::string& line : lines) all += line;
  return all;
}

}  // namespace factory_test
