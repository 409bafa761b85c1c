/// What the environment asks of a played or recorded session.
#pragma once

#include <cstdint>
#include <optional>
#include <string>

#include "host/settings.h"
#include "input/monkey.h"

namespace brimol::pc {

enum class ClockChoice { Real, Simulated, Paced };

struct SessionSettings {
  ClockChoice clock = ClockChoice::Real;
  std::optional<uint32_t> clockStart;
  std::optional<uint32_t> clockStep;
  std::string trace;                 // what is played; empty: nothing
  std::string traceRoot;             // where it includes from; empty: its own folder
  std::string recording;             // what is recorded into; empty: nothing
  std::optional<MonkeyWish> monkey;  // who plays instead of a trace or a user
  std::string reportFolder;          // empty: none
  bool keepsPictures = true;         // of the frames, in that folder
  bool listsItems = false;           // of the frames, in the session's file
  std::string error;                 // one line about the first wrong value; empty: none is wrong
};

/// Reads BRIMOL_CLOCK, BRIMOL_CLOCK_START, BRIMOL_CLOCK_STEP, BRIMOL_TRACE, BRIMOL_TRACE_ROOT,
/// BRIMOL_RECORD, BRIMOL_MONKEY, BRIMOL_REPORT_DIR, BRIMOL_REPORT_PICTURES and BRIMOL_REPORT_ITEMS;
/// an empty value is no value.
SessionSettings readSessionSettings(const VariableLookup& lookup);

}  // namespace brimol::pc
