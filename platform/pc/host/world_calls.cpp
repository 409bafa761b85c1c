// What an application asks the host of the world.
#include <brimol/host.h>

#include <chrono>
#include <random>

#include "host/session.h"
#include "scene/utf8.h"

using brimol::pc::Session;
using brimol::pc::session;

int64_t brimol_host_utc_ms() {
  if (Session* const played = session()) {
    if (const auto time = played->utcMs()) return static_cast<int64_t>(*time);
  }
  using std::chrono::duration_cast;
  using std::chrono::milliseconds;
  return duration_cast<milliseconds>(std::chrono::system_clock::now().time_since_epoch()).count();
}

uint32_t brimol_host_random() {
  if (Session* const played = session()) {
    if (const auto number = played->random()) return *number;
  }
  thread_local std::random_device numbers;
  return numbers();
}

// NOLINTNEXTLINE(readability-identifier-naming): the parameters are named as in the contract
int brimol_host_figure(const char* name, const char* real_value, char* value, int bytes) {
  std::string text = real_value == nullptr ? "" : real_value;
  if (Session* const played = session()) {
    text = played->figure(name == nullptr ? "" : name, text).value_or(text);
  }
  if (value != nullptr && bytes > 0) {
    const std::size_t most = static_cast<std::size_t>(bytes) - 1;
    value[text.copy(value, brimol::pc::wholeBytes(text, most))] = '\0';
  }
  return static_cast<int>(text.size());
}
