#include "stage.h"

#include <MW/event_service.h>
#include <MW/widget_list.h>
#include <MW/window.h>
#include <brimol3_widget_test/platform.h>

#include <algorithm>
#include <cstdlib>
#include <iostream>

#include "core/dispatch_thread.h"

namespace brimol::fuzz {

namespace {

using test::platform;

struct ScreenSize {
  int width;
  int height;
};
constexpr auto kScreens = std::to_array<ScreenSize>({
    {1440, 2560},
    {1440, 2560},
    {480, 800},
    {2560, 1440},
    {0, 0},
    {1, 7},
    {-1080, -5},
    {INT32_MAX, INT32_MIN},
});
constexpr unsigned int kStartTicks = 1000;

MW::func_dispatchEvent& dispatcher() {
  static const android::sp<MW::func_dispatchEvent> only = new MW::func_dispatchEvent;
  return *only;
}

void endToolkit() {
  platform().turns.letGo();
  MW::Window::destroy();
}

}  // namespace

// Called by the fuzzer before its first run.
extern "C" int LLVMFuzzerInitialize(int*, char***) {
  constexpr std::size_t kThreads = 2;
  platform().reset();
  platform().records = false;
  platform().turns.hold();
  if (MW::Window::init() == 0) std::abort();
  platform().turns.await(kThreads);
  return std::atexit(endToolkit);
}

FuzzStage::FuzzStage(test::Arguments& given) : from(given) {
  const ScreenSize& screen = kScreens.at(from.below(kScreens.size()));
  MW::Window::width = screen.width;
  MW::Window::height = screen.height;
  MW::Window::xdpi = MW::Window::ydpi = 0;
  platform().xdpi = platform().ydpi = static_cast<float>(from.byte());
  platform().ticks = kStartTicks + from.take<unsigned int>();
  MW::WidgetList::index_num = 0;
}

FuzzStage::~FuzzStage() {
  test::whenTold = nullptr;
  for (Occupant& each : occupants) each.reset();
  while (MW::EventService::recvEvent() != nullptr) continue;
  MW::WidgetList::destroy();
  MW::isDisplayUpdate(0);
}

void FuzzStage::make(std::size_t place) {
  const auto& classes = test::widgetClasses();
  const test::WidgetClass& chosen = classes.at(from.below(classes.size()));
  auto made = chosen.make(from);
  chosen.listen(*made);
  made->setActive(1);
  occupants.at(place) = {std::move(made), &chosen};
}

void FuzzStage::operate(std::size_t place) {
  const Occupant& occupant = occupants.at(place);
  if (occupant.widget == nullptr) return;
  const auto& own = occupant.itsClass->operations;
  const auto& base = test::baseOperations();
  const std::size_t which = from.below(base.size() + own.size());
  const test::Operation& chosen =
      which < base.size() ? base.at(which) : own.at(which - base.size());
  chosen(*occupant.widget, from);
}

void FuzzStage::dispatch(const Event& event) {
  MW::EventService::sendEvent(&event);
  dispatcher().threadLoop();
}

void FuzzStage::dispatchTouch() {
  constexpr auto kTypes = std::to_array<BrimolEventType>(
      {BRIMOL_POINTER_DOWN, BRIMOL_POINTER_MOTION, BRIMOL_POINTER_UP, BRIMOL_LONG_PRESS});
  constexpr int64_t kSteps = 256;
  const auto part = [this](int side) {
    return static_cast<uint16_t>(int64_t{side} * from.byte() / kSteps);
  };
  const auto motion = [this] {
    constexpr int kBack = 128;  // from here on to the left, or up
    const int step = from.byte();
    return static_cast<int16_t>(step < kBack ? step : step - 2 * kBack);
  };
  const uint8_t what = from.byte();
  Event event = {};
  event.pointer.type = static_cast<uint8_t>(kTypes.at(what % kTypes.size()));
  event.pointer.finger = static_cast<uint8_t>(what / kTypes.size() % 3);
  event.pointer.x = part(MW::Window::width);
  event.pointer.y = part(MW::Window::height);
  event.pointer.xrel = motion();
  event.pointer.yrel = motion();
  dispatch(event);
}

void FuzzStage::wait() {
  constexpr unsigned int kStepMs = 8;
  const unsigned int steps = from.byte();
  platform().ticks += steps < UINT8_MAX ? steps * kStepMs : from.take<unsigned int>();
}

void FuzzStage::round() {
  MW::Window::updateTimer(platform().ticks);
  platform().records = true;
  MW::Window::show(platform().ticks);
  platform().records = false;
  platform().takeLog();
  const auto isOutside = [](const test::Drawing& each) {
    return each.text.text.size() >= SKIA_TEXT_BYTES;
  };
  if (!std::ranges::any_of(platform().takeDrawings(), isOutside)) return;
  std::cerr << "a text is drawn beyond its record\n";
  std::abort();
}

}  // namespace brimol::fuzz
