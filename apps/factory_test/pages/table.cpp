#include "pages/table.h"

#include <algorithm>
#include <array>

namespace factory_test {

namespace {

using enum Group;
using enum DefaultPlan;

constexpr auto kEntries = std::to_array<TestEntry>({
    {Display, "colours", "Display colours", makeColours, In},
    {Display, "dead_pixels", "Dead pixels", makeDeadPixels, In},
    {Display, "backlight", "Backlight", makeBacklight, In},
    {Display, "brightness", "Brightness", makeBrightness, Out},

    {Input, "touch", "Touch panel", makeTouch, Out},
    {Input, "keys", "Keys", makeKeys, In},
    {Input, "stuck_touch", "Stuck touch", makeStuckTouch, In},
    {Input, "touch_grid", "Touch grid", makeTouchGrid, In},
    {Input, "touch_lines", "Touch accuracy", makeTouchLines, In},
    {Input, "touch_trails", "Touch trails", makeTouchTrails, In},
    {Input, "touch_rate", "Touch rate", makeTouchRate, In},
    {Input, "pinch", "Pinch", makePinch, In},
    {Input, "pad", "Multi-touch pad", makePad, Out},

    {Reports, "log", "Log", makeLogView, Out},
    {Reports, "result_list", "Results", makeResultList, Out},
    {Reports, "shell", "Shell", makeShell, Out},

    // What only shows widgets finds no fault of a phone.
    {Toolkit, "keyboard", "Keyboard", makeKeyboard, Out},
    {Toolkit, "buttons", "Buttons", makeButtons, Out},
    {Toolkit, "styles", "Button styles", makeStyles, Out},
    {Toolkit, "switches", "Slide switches", makeSwitches, Out},
    {Toolkit, "timed", "Toast and progress", makeTimed, Out},
    {Toolkit, "exit_slides", "Exit slides", makeExitSlides, Out},
    {Toolkit, "descriptors", "Descriptors", makeDescriptors, Out},
    {Toolkit, "prompts", "Built-in dialogs", makePrompts, Out},
    {Toolkit, "list_choice", "List choice", makeListChoice, Out},
    {Toolkit, "six_choice", "Six-way choice", makeSixChoice, Out},
    {Toolkit, "free_form", "Free-form dialogs", makeFreeForm, Out},
    {Toolkit, "warnings", "Warning pages", makeWarnings, Out},
});
static_assert(std::ranges::is_sorted(kEntries, {}, &TestEntry::group));

}  // namespace

std::span<const TestEntry> testEntries() { return kEntries; }

std::size_t placeOf(std::string_view id) {
  const auto* const found = std::ranges::find(kEntries, id, &TestEntry::id);
  return static_cast<std::size_t>(found - kEntries.begin());
}

const char* nameOf(Group group) {
  switch (group) {
    case Group::Display: return "Display";
    case Group::Input: return "Input";
    case Group::Reports: return "Reports";
    case Group::Toolkit: break;
  }
  return "Toolkit";
}

}  // namespace factory_test
