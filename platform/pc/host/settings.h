/// What the environment asks of the platform. These are all of its variables; an empty value is no
/// value, and a wrong one keeps the platform from opening.
///
/// | variable | value | without it |
/// |---|---|---|
/// | BRIMOL_DISPLAY | window, browser or headless | a window where SDL finds a driver for one |
/// | BRIMOL_LISTEN | ADDRESS:PORT, where browsers connect | 127.0.0.1, port 5800 or a free one |
/// | BRIMOL_DEVICE | a name of brimol/device.h: size and density | 1440x2560, 489.5 dots per inch |
/// | BRIMOL_SCREEN | WIDTHxHEIGHT in pixels, each 1 to 16384; the density stays | the device's |
/// | BRIMOL_TRACE | the trace that is played | none is |
/// | BRIMOL_RECORD | the file that the session is recorded into | it is not |
/// | BRIMOL_CLOCK | real, simulated or paced | what the session asks for, else real |
/// | BRIMOL_CLOCK_START | GetTicks() at the start, in milliseconds | 0 |
/// | BRIMOL_CLOCK_STEP | pauses end at multiples of so many milliseconds | 1 |
/// | BRIMOL_MONKEY | SEED, SEED:EVENTS or SEED:EVENTS:REST: who plays random input | nobody does |
/// | BRIMOL_REPORT_DIR | the folder of a session's report and pictures | none is written |
///
/// Those from BRIMOL_TRACE on are read by host/session_settings.h; docs/traces.md tells what they
/// do.
#pragma once

#include <functional>
#include <optional>
#include <string>
#include <string_view>

#include "display/display.h"
#include "remote/listener.h"
#include "scene/geometry.h"

namespace brimol::pc {

inline constexpr Size kDefaultScreen = {1440, 2560};
// Dots per inch, across and down: those of a phone whose screen of the default size measures six
// inches from corner to corner. The same whatever the size, so that layouts are the same.
inline constexpr float kDefaultDensity = 489.5f;
inline constexpr int kMaxScreenSide = 16384;  // pixels

struct Settings {
  DisplayChoice display = DisplayChoice::WindowIfPossible;
  Size screen = kDefaultScreen;  // pixels, each side 1 to kMaxScreenSide
  float density = kDefaultDensity;
  bool isSizeGiven = false;     // by BRIMOL_DEVICE or BRIMOL_SCREEN
  bool isDensityGiven = false;  // by BRIMOL_DEVICE
  std::optional<ListenAddress> listen;
};

struct SettingsResult {
  Settings settings;  ///< a wrong value leaves its default
  std::string error;  ///< one line about the first wrong value; empty: none is wrong
};

/// Gives the value of a variable, or null where it is not set.
using VariableLookup = std::function<const char*(const char* name)>;

/// "NAME=VALUE: wanted ...", in one line whatever the value.
std::string wrongValue(const char* name, std::string_view value, const std::string& wanted);

/// Reads BRIMOL_DISPLAY, BRIMOL_LISTEN, BRIMOL_DEVICE and BRIMOL_SCREEN. DISPLAY or WAYLAND_DISPLAY
/// tell of a desktop. Opens nothing.
SettingsResult readSettings(const VariableLookup& lookup);

/// The same from the process's own environment.
SettingsResult readSettings();

}  // namespace brimol::pc
