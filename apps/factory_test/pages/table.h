/// The menu's pages, in the order in which it shows them.
#pragma once

#include <memory>
#include <span>
#include <string_view>

#include "context.h"
#include "test.h"

namespace factory_test {

enum class Group { Display, Input, Reports, Toolkit };

const char* nameOf(Group group);

/// Whether a run takes the page where nobody says otherwise.
enum class DefaultPlan { In, Out };

using MakeTest = std::unique_ptr<Test>(const Context& context);

/// A line of the menu.
struct TestEntry {
  Group group;
  const char* id;    ///< what results call it; never changes
  const char* name;  ///< what the menu calls it
  MakeTest* make;
  DefaultPlan plan;
};

/// All of them; those of a group stand together.
std::span<const TestEntry> testEntries();

/// The place of a page in testEntries(), or their number for an unknown id.
std::size_t placeOf(std::string_view id);

// Each in the file of its name.
MakeTest makeBacklight;
MakeTest makeBrightness;
MakeTest makeButtons;
MakeTest makeColours;
MakeTest makeDeadPixels;
MakeTest makeDescriptors;
MakeTest makeExitSlides;
MakeTest makeFreeForm;
MakeTest makeKeyboard;
MakeTest makeKeys;
MakeTest makeListChoice;
MakeTest makeLogView;
MakeTest makePad;
MakeTest makePinch;
MakeTest makePrompts;
MakeTest makeResultList;
MakeTest makeShell;
MakeTest makeSixChoice;
MakeTest makeStuckTouch;
MakeTest makeStyles;
MakeTest makeSwitches;
MakeTest makeTimed;
MakeTest makeTouch;
MakeTest makeTouchGrid;
MakeTest makeTouchLines;
MakeTest makeTouchRate;
MakeTest makeTouchTrails;
MakeTest makeWarnings;

}  // namespace factory_test
