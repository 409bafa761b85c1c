#include "pages/table.h"
#include "language/language.h"

#include <algorithm>
#include <array>

namespace factory_test {

namespace {

using enum Group;
using enum DefaultPlan;

constexpr auto kEntries = std::to_array<TestEntry>({
    {Display, "colours", msg("Display colours"), makeColours, In},
    {Display, "dead_pixels", msg("Dead pixels"), makeDeadPixels, In},
    {Display, "backlight", msg("Backlight"), makeBacklight, In},
    {Display, "brightness", msg("Brightness"), makeBrightness, Out},

    {Input, "touch", msg("Touch panel"), makeTouch, Out},
    {Input, "keys", msg("Keys"), makeKeys, In},
    {Input, "stuck_touch", msg("Stuck touch"), makeStuckTouch, In},
    {Input, "touch_grid", msg("Touch grid"), makeTouchGrid, In},
    {Input, "touch_lines", msg("Touch accuracy"), makeTouchLines, In},
    {Input, "touch_trails", msg("Touch trails"), makeTouchTrails, In},
    {Input, "touch_rate", msg("Touch rate"), makeTouchRate, In},
    {Input, "pinch", msg("Pinch"), makePinch, In},
    {Input, "pad", msg("Multi-touch pad"), makePad, Out},

    {Reports, "log", msg("Log"), makeLogView, Out},
    {Reports, "result_list", msg("Results"), makeResultList, Out},
    {Reports, "shell", msg("Shell"), makeShell, Out},

    // What only shows widgets finds no fault of a phone.
    {Toolkit, "keyboard", msg("Keyboard"), makeKeyboard, Out},
    {Toolkit, "buttons", msg("Buttons"), makeButtons, Out},
    {Toolkit, "styles", msg("Button styles"), makeStyles, Out},
    {Toolkit, "switches", msg("Slide switches"), makeSwitches, Out},
    {Toolkit, "timed", msg("Toast and progress"), makeTimed, Out},
    {Toolkit, "exit_slides", msg("Exit slides"), makeExitSlides, Out},
    {Toolkit, "descriptors", msg("Descriptors"), makeDescriptors, Out},
    {Toolkit, "prompts", msg("Built-in dialogs"), makePrompts, Out},
    {Toolkit, "list_choice", msg("List choice"), makeListChoice, Out},
    {Toolkit, "six_choice", msg("Six-way choice"), makeSixChoice, Out},
    {Toolkit, "free_form", msg("Free-form dialogs"), makeFreeForm, Out},
    {Toolkit, "warnings", msg("Warning pages"), makeWarnings, Out},
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
    case Group::Display: return tr("Display");
    case Group::Input: return tr("Input");
    case Group::Reports: return tr("Reports");
    case Group::Toolkit: break;
  }
  return tr("Toolkit");
}

}  // namespace factory_test
