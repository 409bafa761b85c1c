#include <brimol3_widget_test/platform.h>
#include <brimol3_widget_test/screen.h>

#include <algorithm>
#include <iterator>
#include <sstream>
#include <utility>

#include "scene/rectangles.h"
#include "scene/shown_texts.h"
#include "text_pattern.h"

namespace brimol::test {

namespace {

constexpr std::size_t kFingers = 10;
constexpr std::size_t kToolkitThreads = 2;
constexpr unsigned int kRoundMs = 5;
constexpr unsigned int kHoldMs = 50;

std::vector<pc::ShownText> fitting(const Frame& frame, ScreenSize size, const std::string& text) {
  const pc::TextPattern pattern = patternOf(text);
  std::vector<pc::ShownText> found = pc::shownTexts(frame, {size.width, size.height});
  std::erase_if(found, [&](const pc::ShownText& each) { return !pattern.matches(each.text); });
  return found;
}

Spot middleOf(const pc::Pixels& area) {
  return {area.x + area.width / 2, area.y + area.height / 2};
}

std::string quoted(const std::string& text) { return '"' + text + '"'; }

template <typename Word>
std::string hexText(Word word) {
  std::ostringstream text;
  text << "0x" << std::hex << std::setfill('0') << std::setw(8) << word;
  return text.str();
}

void expectSame(const std::string& what, uint32_t expected, uint32_t actual, const Here& here) {
  if (expected == actual) return;
  throw Failure(here, what + ": expected " + hexText(expected) + ", got " + hexText(actual));
}

}  // namespace

Screen::Screen(ScreenSize size, Loop applicationsLoop, float dpi)
    : screen(size), loop(std::move(applicationsLoop)), fingers(kFingers, Spot{0, 0}) {
  platform().reset();
  platform().ticks = startTicks();
  platform().width = MW::Window::width = size.width;
  platform().height = MW::Window::height = size.height;
  platform().xdpi = platform().ydpi = dpi;
  MW::Window::xdpi = MW::Window::ydpi = 0;  // the toolkit asks the platform
  MW::isDisplayUpdate(0);
  platform().turns.hold();
  if (MW::Window::init() == 0) throw Failure(Here::now(), "the toolkit does not start");
  platform().turns.await(kToolkitThreads);
}

Screen::~Screen() {
  platform().turns.letGo();
  MW::Window::destroy();
}

void Screen::round(unsigned int ms) {
  platform().ticks += ms;
  platform().turns.give(platform().ticks);
  loop.update();
  MW::Window::updateTimer(platform().ticks);
  if (MW::isDisplayUpdate(0) == 1 || newest.empty()) draw();
}

void Screen::advance(unsigned int ms) {
  for (; ms > kRoundMs; ms -= kRoundMs) round(kRoundMs);
  round(ms);
}

void Screen::draw() {
  platform().takeDrawings();
  loop.draw();
  const std::lock_guard guard(platform().lock);
  newest = itemsOf(platform().drawings);
}

// One turn takes it to the toolkit's queue, and that of the round, in whichever order the threads
// come, to the widgets.
void Screen::post(const Event& event) {
  platform().feed(event);
  platform().turns.give(platform().ticks);
  round(0);
}

void Screen::pointer(BrimolEventType type, unsigned int finger, Spot to) {
  Spot& from = fingers.at(finger);
  Event event = pointerInput(type, to);
  event.pointer.finger = static_cast<decltype(event.pointer.finger)>(finger);
  event.pointer.state = type == BRIMOL_POINTER_UP ? 0 : 1;
  if (type == BRIMOL_POINTER_MOTION) {
    event.pointer.xrel = static_cast<decltype(event.pointer.xrel)>(to.x - from.x);
    event.pointer.yrel = static_cast<decltype(event.pointer.yrel)>(to.y - from.y);
  }
  from = to;
  post(event);
}

void Screen::press(Spot spot, unsigned int finger) {
  remember(Moment::Deed::None, spot);
  pointer(BRIMOL_POINTER_DOWN, finger, spot);
}
void Screen::moveTo(Spot spot, unsigned int finger) {
  pointer(BRIMOL_POINTER_MOTION, finger, spot);
}
void Screen::release(unsigned int finger) {
  pointer(BRIMOL_POINTER_UP, finger, fingers.at(finger));
}
void Screen::longPress(unsigned int finger) {
  pointer(BRIMOL_LONG_PRESS, finger, fingers.at(finger));
}

void Screen::tap(Spot spot) {
  remember(Moment::Deed::Tap, spot);
  pointer(BRIMOL_POINTER_DOWN, 0, spot);
  advance(kHoldMs);
  release();
}

void Screen::tap(const std::string& text, const Here& here) {
  if (newest.empty()) settle();
  const SKIA_Item& item = itemOf(text, here);
  const auto all = pc::wholeOf({screen.width, screen.height});
  tap(middleOf(pc::within(pc::edgesOf(item.rect), all)));
}

void Screen::drag(Spot from, Spot to) {
  constexpr int kSteps = 10;
  constexpr unsigned int kStepMs = 20;
  press(from);
  for (int step = 1; step <= kSteps; ++step) {
    advance(kStepMs);
    moveTo({from.x + (to.x - from.x) * step / kSteps, from.y + (to.y - from.y) * step / kSteps});
  }
  release();
}

void Screen::keyDown(unsigned int code) {
  remember(Moment::Deed::Key, {0, 0});
  post(keyInput(BRIMOL_KEY_DOWN, code));
}
void Screen::keyUp(unsigned int code) { post(keyInput(BRIMOL_KEY_UP, code)); }

void Screen::key(unsigned int code) {
  keyDown(code);
  advance(kHoldMs);
  keyUp(code);
}

std::vector<Moment> Screen::moments() const {
  std::vector<Moment> all = before;
  all.push_back({newest});
  return all;
}

std::vector<std::string> Screen::texts() const {
  std::vector<std::string> all;
  for (const pc::ShownText& each : pc::shownTexts(newest, {screen.width, screen.height})) {
    all.push_back(each.text);
  }
  return all;
}

std::string Screen::listOfTexts() const {
  std::string list = "; the screen shows";
  for (const std::string& text : texts()) list += "\n  " + quoted(text);
  return list;
}

bool Screen::shows(const std::string& text) const { return !fitting(newest, screen, text).empty(); }

const SKIA_Item& Screen::itemOf(const std::string& text, const Here& here) const {
  const auto found = fitting(newest, screen, text);
  if (found.size() == 1) return newest.at(found.front().item);
  throw Failure(here, (found.empty() ? "no item shows " : "several items show ") + quoted(text) +
                          listOfTexts());
}

void Screen::expectText(const std::string& text, const Here& here) const {
  if (!shows(text)) throw Failure(here, "no item shows " + quoted(text) + listOfTexts());
}

void Screen::expectNoText(const std::string& text, const Here& here) const {
  if (shows(text)) throw Failure(here, "an item shows " + quoted(text) + listOfTexts());
}

void Screen::expectTextColor(const std::string& text, uint32_t color, const Here& here) const {
  expectSame("colour of " + quoted(text), color, itemOf(text, here).text.color, here);
}

void Screen::expectBoxColor(const std::string& text, uint32_t color, const Here& here) const {
  expectSame("box of " + quoted(text), color, itemOf(text, here).rect.color, here);
}

void Screen::expectPixel(Spot spot, uint32_t rgb, const Here& here) const {
  const std::string where = std::to_string(spot.x) + "," + std::to_string(spot.y);
  expectSame("pixel at " + where, rgb, picture().at(spot.x, spot.y), here);
}

void Screen::expectLog(const std::string& text, const Here& here) {
  std::ranges::move(platform().takeLog(), std::back_inserter(unread));
  const auto found = std::ranges::find_if(unread, [&](const LogLine& line) {
    return (line.tag + ": " + line.message).find(text) != std::string::npos;
  });
  if (found == unread.end()) {
    std::ostringstream said;
    for (const LogLine& line : unread) said << "\n  " << line;
    throw Failure(
        here, "no line of the log has " + quoted(text) + " in it; since then it says" + said.str());
  }
  unread.erase(unread.begin(), found + 1);
}

void expectLayout(const Screen& screen, const Profile& profile, const AcceptedFindings& accepted,
                  const Here& here) {
  std::string all;
  for (const std::string& line : accepted.judge(lint(screen.moments(), profile), profile)) {
    all += "\n  " + line;
  }
  if (!all.empty()) throw Failure(here, "the layout has faults" + all);
}

}  // namespace brimol::test
