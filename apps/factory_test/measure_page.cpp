#include "measure_page.h"

#include <MW/window.h>
#include <brimol/display.h>
#include <brimol/input.h>

#include <algorithm>
#include <cmath>
#include <sstream>

#include "language/language.h"
#include "layout.h"
#include "results/measure_text.h"

namespace factory_test {

namespace {

constexpr uint32_t kStillMs = 2000;
constexpr double kStillMm = 2;
constexpr int kLinePercent = 3;  // of the screen's longer side, from one line to the next

// As measureText(), in the operator's language.
std::string valueLine(const Measure& measure) {
  std::string line = std::string(tr(measure.name.c_str())) + ": " + numberText(measure.value);
  if (!measure.unit.empty()) line += " " + measure.unit;
  if (measure.least && measure.most) {
    return line + " (" + numberText(*measure.least) + tr(" to ") + numberText(*measure.most) + ")";
  }
  if (measure.least) return line + " (" + tr("at least ") + numberText(*measure.least) + ")";
  return measure.most ? line + " (" + tr("at most ") + numberText(*measure.most) + ")" : line;
}

}  // namespace

MeasurePage::MeasurePage(const Context& program, const char* test, const char* title,
                         const char* usualWords)
    : LookTest(title, usualWords), step(stepOf(program, test)), instructions(usualWords) {}

std::string MeasurePage::question() const {
  return isDone() ? tr("Done. Is it right?") : tr("Not everything was seen.");
}

int MeasurePage::wordsAt() const {
  constexpr int kMiddle = 40;
  return kMiddle;
}

Measure MeasurePage::measure(std::string_view name, double value) const {
  return measured(step.test, name, value);
}

std::vector<Measure> MeasurePage::measure(std::initializer_list<Figure> figures) const {
  return measured(step.test, figures);
}

double MeasurePage::millimetres(double pixels) {
  constexpr double kInch = 25.4;
  float across = 0;
  float down = 0;
  getDpi(&across, &down);
  return across > 0 ? pixels * kInch / across : kNotMeasured;
}

void MeasurePage::updateLook() {
  const uint32_t now = GetTicks();
  for (const Input& input : watch->take()) {
    if (input.kind == Input::Kind::KeyPress && input.key == kKeyBack) finishLook();
    if (isOfAnOldTouch(input) && !followsOldTouches()) continue;
    followStill(input);
    follow(input);
    MW::isDisplayUpdate(1);
  }
  updateAt(now);
  if (still && now - still->since >= kStillMs) finishLook();
  if (!isDone() || (waitsForLift() && !fingers.empty())) return;
  if (isForEyes()) {
    finishLook();
  } else {
    hasPassed = true;
  }
}

// The finger that chose this page may still be down.
bool MeasurePage::isOfAnOldTouch(const Input& input) const {
  using enum Input::Kind;
  return (input.kind == Move || input.kind == Lift) && !fingers.contains(input.finger);
}

void MeasurePage::followStill(const Input& input) {
  using enum Input::Kind;
  if (input.kind == Press) fingers.insert(input.finger);
  if (input.kind == Lift) fingers.erase(input.finger);
  if (input.kind == Press && fingers.size() == 1) {
    still = {input.finger, input.x, input.y, input.ticks};
  } else if (still && !(input.kind == Move && isWhereItWas(input))) {
    still.reset();
  }
}

bool MeasurePage::isWhereItWas(const Input& input) const {
  return millimetres(std::hypot(input.x - still->x, input.y - still->y)) <= kStillMm;
}

std::vector<std::string> MeasurePage::instructionLines() const {
  std::vector<std::string> words;
  std::istringstream text(instructions);
  for (std::string line; std::getline(text, line);) words.push_back(line);
  words.emplace_back(tr("Hold a finger still, or Back: end."));
  return words;
}

std::vector<std::string> MeasurePage::valueLines() const {
  std::vector<std::string> words;
  for (Measure each : values()) {
    const auto limits = step.limits.find(each.name);
    if (limits != step.limits.end()) {
      each.least = limits->second.least;
      each.most = limits->second.most;
    }
    words.push_back(valueLine(each));
  }
  return words;
}

int MeasurePage::drawLines(const std::vector<std::string>& words, SKIA_Rect area) {
  const ScreenSize screen = screenSize();
  area.h = percentOf(std::max(screen.width, screen.height), kLinePercent);
  for (const std::string& each : words) {
    skia_add_label_c(area,
                     textOf(each.c_str(), kPageInk.text, SKIA_ALIGN_CENTRE, textSize(screen)));
    area.y += area.h;
  }
  return area.y;
}

void MeasurePage::instruct(const std::string& words) {
  instructions = words;
  LookTest::instruct(words);
}

void MeasurePage::draw() {
  if (page.isAsking()) {
    page.draw();
    drawLines(valueLines(), contentArea());
    return;
  }
  drawLook();
  if (!hasWords()) return;
  const ScreenSize screen = screenSize();
  SKIA_Rect area = {0, percentOf(screen.height, wordsAt()), screen.width, 0, 0};
  area.y = drawLines(instructionLines(), area);
  drawLines(valueLines(), area);
}

}  // namespace factory_test
