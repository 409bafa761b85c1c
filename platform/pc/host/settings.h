/// What the environment asks of the platform.
#pragma once

#include <functional>
#include <string>

#include "display/display.h"
#include "scene/geometry.h"

namespace brimol::pc {

inline constexpr Size kDefaultScreen = {1440, 2560};
inline constexpr int kMaxScreenSide = 16384;  // pixels

struct Settings {
  DisplayChoice display = DisplayChoice::WindowIfPossible;
  Size screen = kDefaultScreen;  // pixels, each side 1 to kMaxScreenSide
};

struct SettingsResult {
  Settings settings;  ///< what is wrong stands at its default
  std::string error;  ///< one line about the first wrong value; empty: none is wrong
};

/// Gives the value of a variable, or null where it is not set.
using VariableLookup = std::function<const char*(const char* name)>;

/// Reads BRIMOL_DISPLAY and BRIMOL_SCREEN; an empty value is no value. Without BRIMOL_DISPLAY, a
/// desktop (DISPLAY or WAYLAND_DISPLAY) gets a window. Opens nothing.
SettingsResult readSettings(const VariableLookup& lookup);

/// The same from the process's own environment.
SettingsResult readSettings();

}  // namespace brimol::pc
