#include "host/session_settings.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <string_view>
#include <system_error>
#include <vector>

namespace brimol::pc {

namespace {

constexpr const char* kClockVariable = "BRIMOL_CLOCK";
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
    return wrongValue(kClockVariable, value, "real, simulated or paced");
  }
  settings.clock = row->clock;
  const bool isSession = !settings.trace.empty() || !settings.recording.empty() || settings.monkey;
  if (isSession && settings.clock == ClockChoice::Real) {
    return "BRIMOL_CLOCK=real: a real clock plays no trace and records none";
  }
  return {};
}

struct MillisecondsRow {
  const char* variable;
  uint32_t least, most;
  std::optional<uint32_t> SessionSettings::*value;
};
constexpr auto kMilliseconds = std::to_array<MillisecondsRow>(
    {{"BRIMOL_CLOCK_START", 0, UINT32_MAX, &SessionSettings::clockStart},
     {"BRIMOL_CLOCK_STEP", 1, 1000, &SessionSettings::clockStep}});

std::string readMilliseconds(const VariableLookup& lookup, const MillisecondsRow& row,
                             SessionSettings& settings) {
  const std::string value = valueOf(lookup, row.variable);
  if (value.empty()) return {};
  uint32_t read = 0;
  const char* const end = value.data() + value.size();
  const auto [stop, failure] = std::from_chars(value.data(), end, read);
  if (failure != std::errc() || stop != end || read < row.least || read > row.most) {
    return wrongValue(
        row.variable, value,
        "milliseconds, " + std::to_string(row.least) + " to " + std::to_string(row.most));
  }
  settings.*row.value = read;
  return {};
}

// "SEED", "SEED:EVENTS" or "SEED:EVENTS:REST".
std::string readMonkey(const VariableLookup& lookup, SessionSettings& settings) {
  const std::string value = valueOf(lookup, kMonkeyVariable);
  if (value.empty()) return {};
  MonkeyWish& wish = settings.monkey.emplace();
  const char* next = value.data();
  const char* const end = next + value.size();
  for (uint64_t* const number : {&wish.seed, &wish.events, &wish.restMs}) {
    const auto [stop, failure] = std::from_chars(next, end, *number);
    if (failure != std::errc()) break;
    if (stop == end) return {};
    if (*stop != ':') break;
    next = stop + 1;
  }
  return wrongValue(kMonkeyVariable, value, "SEED, SEED:EVENTS or SEED:EVENTS:REST");
}

std::string readPictures(const VariableLookup& lookup, SessionSettings& settings) {
  const std::string value = valueOf(lookup, kPicturesVariable);
  settings.keepsPictures = value != "none";
  if (value.empty() || value == "none" || value == "changed") return {};
  return wrongValue(kPicturesVariable, value, "changed or none");
}

std::string readItems(const VariableLookup& lookup, SessionSettings& settings) {
  const std::string value = valueOf(lookup, kItemsVariable);
  settings.listsItems = value == "changed";
  if (value.empty() || value == "none" || value == "changed") return {};
  return wrongValue(kItemsVariable, value, "changed or none");
}

}  // namespace

SessionSettings readSessionSettings(const VariableLookup& lookup) {
  SessionSettings settings;
  settings.trace = valueOf(lookup, "BRIMOL_TRACE");
  settings.traceRoot = valueOf(lookup, "BRIMOL_TRACE_ROOT");
  settings.recording = valueOf(lookup, "BRIMOL_RECORD");
  settings.reportFolder = valueOf(lookup, "BRIMOL_REPORT_DIR");
  std::vector<std::string> errors = {readMonkey(lookup, settings), readClock(lookup, settings)};
  for (const MillisecondsRow& row : kMilliseconds) {
    errors.push_back(readMilliseconds(lookup, row, settings));
  }
  errors.push_back(readPictures(lookup, settings));
  errors.push_back(readItems(lookup, settings));
  const auto first = std::ranges::find_if_not(errors, &std::string::empty);
  if (first != errors.end()) settings.error = *first;
  if (!settings.trace.empty() && !settings.recording.empty()) {
    settings.error = "BRIMOL_TRACE and BRIMOL_RECORD: a session is played or recorded, not both";
  }
  if (!settings.trace.empty() && settings.monkey) {
    settings.error = "BRIMOL_TRACE and BRIMOL_MONKEY: only one of the two plays";
  }
  return settings;
}

}  // namespace brimol::pc
