#include "host/session_settings.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <string_view>
#include <system_error>

namespace brimol::pc {

namespace {

constexpr const char* kClockVariable = "BRIMOL_CLOCK";
constexpr const char* kStartVariable = "BRIMOL_CLOCK_START";
constexpr const char* kMonkeyVariable = "BRIMOL_MONKEY";
constexpr const char* kPicturesVariable = "BRIMOL_REPORT_PICTURES";
constexpr const char* kItemsVariable = "BRIMOL_REPORT_ITEMS";

std::string valueOf(const VariableLookup& lookup, const char* name) {
  const char* const value = lookup(name);
  return value == nullptr ? "" : value;
}

struct ClockRow {
  std::string_view word;
  ClockChoice clock;
};
constexpr auto kClocks = std::to_array<ClockRow>({{"real", ClockChoice::Real},
                                                  {"simulated", ClockChoice::Simulated},
                                                  {"paced", ClockChoice::Paced}});

// What stands for no choice.
ClockChoice usualClock(const SessionSettings& settings) {
  if (settings.monkey) return ClockChoice::Simulated;
  if (!settings.recording.empty()) return ClockChoice::Paced;
  return settings.trace.empty() ? ClockChoice::Real : ClockChoice::Simulated;
}

std::string readClock(const VariableLookup& lookup, SessionSettings& settings) {
  const std::string value = valueOf(lookup, kClockVariable);
  settings.clock = usualClock(settings);
  if (value.empty()) return {};
  const auto* const row = std::ranges::find(kClocks, value, &ClockRow::word);
  if (row == kClocks.end()) {
    return std::string(kClockVariable) + "=" + value + ": wanted real, simulated or paced";
  }
  settings.clock = row->clock;
  const bool isSession = !settings.trace.empty() || !settings.recording.empty() || settings.monkey;
  if (isSession && settings.clock == ClockChoice::Real) {
    return "BRIMOL_CLOCK=real: a real clock plays no trace and records none";
  }
  return {};
}

std::string readStart(const VariableLookup& lookup, SessionSettings& settings) {
  const std::string value = valueOf(lookup, kStartVariable);
  if (value.empty()) return {};
  uint32_t start = 0;
  const char* const end = value.data() + value.size();
  const auto [stop, failure] = std::from_chars(value.data(), end, start);
  if (failure != std::errc() || stop != end) {
    return std::string(kStartVariable) + "=" + value + ": wanted milliseconds, 0 to 4294967295";
  }
  settings.clockStart = start;
  return {};
}

// "SEED" or "SEED:EVENTS".
std::string readMonkey(const VariableLookup& lookup, SessionSettings& settings) {
  const std::string value = valueOf(lookup, kMonkeyVariable);
  if (value.empty()) return {};
  MonkeyWish& wish = settings.monkey.emplace();
  const char* const end = value.data() + value.size();
  std::from_chars_result read = std::from_chars(value.data(), end, wish.seed);
  if (read.ec == std::errc() && read.ptr != end && *read.ptr == ':') {
    read = std::from_chars(read.ptr + 1, end, wish.events);
  }
  if (read.ec == std::errc() && read.ptr == end) return {};
  return std::string(kMonkeyVariable) + "=" + value + ": wanted SEED or SEED:EVENTS";
}

std::string readPictures(const VariableLookup& lookup, SessionSettings& settings) {
  const std::string value = valueOf(lookup, kPicturesVariable);
  settings.keepsPictures = value != "none";
  if (value.empty() || value == "none" || value == "changed") return {};
  return std::string(kPicturesVariable) + "=" + value + ": wanted changed or none";
}

std::string readItems(const VariableLookup& lookup, SessionSettings& settings) {
  const std::string value = valueOf(lookup, kItemsVariable);
  settings.listsItems = value == "changed";
  if (value.empty() || value == "none" || value == "changed") return {};
  return std::string(kItemsVariable) + "=" + value + ": wanted changed or none";
}

}  // namespace

SessionSettings readSessionSettings(const VariableLookup& lookup) {
  SessionSettings settings;
  settings.trace = valueOf(lookup, "BRIMOL_TRACE");
  settings.recording = valueOf(lookup, "BRIMOL_RECORD");
  settings.reportFolder = valueOf(lookup, "BRIMOL_REPORT_DIR");
  const std::string monkeyError = readMonkey(lookup, settings);
  const std::string clockError = readClock(lookup, settings);
  for (const std::string& error : {monkeyError, clockError, readStart(lookup, settings),
                                   readPictures(lookup, settings), readItems(lookup, settings)}) {
    if (settings.error.empty()) settings.error = error;
  }
  if (!settings.trace.empty() && !settings.recording.empty()) {
    settings.error = "BRIMOL_TRACE and BRIMOL_RECORD: a session is played or recorded, not both";
  }
  if (!settings.trace.empty() && settings.monkey) {
    settings.error = "BRIMOL_TRACE and BRIMOL_MONKEY: only one of the two plays";
  }
  return settings;
}

}  // namespace brimol::pc
