#include "measure_page.h"

#include <MW/window.h>
#include <brimol/input.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>
#include <utility>
#include <vector>

#include "language/language.h"
#include "layout.h"
#include "text_fit.h"
#include "value_lines.h"

namespace factory_test {

namespace {

constexpr uint32_t kStillMs = 2000;
constexpr double kStillMm = 2;
constexpr uint32_t kCardColor = 0xA8000000 | (kPanelInk.ground & 0x00FFFFFF);

bool measuresMm(std::string_view test) {
  return std::ranges::count(testKind(test).values, "mm", &ValueKind::unit) > 0;
}

}  // namespace

MeasurePage::MeasurePage(const Context& program, const char* test, const char* title,
                         const std::string& usualWords)
    : LookTest(title, usualWords.c_str()), instructions(usualWords) {
  planStep = stepOf(program, test);
}

std::string MeasurePage::counted(const char* words, double count) {
  constexpr std::size_t kMostBytes = 300;
  std::array<char, kMostBytes> text = {};
  std::snprintf(text.data(), text.size(), words, static_cast<int>(count));
  return text.data();
}

std::string MeasurePage::question() const {
  return isDone() ? tr("Done. Is it right?") : tr("Not everything was seen.");
}

int MeasurePage::wordsAt() const {
  constexpr int kMiddle = 40;
  return kMiddle;
}

Measure MeasurePage::measure(std::string_view name, double value) const {
  return measured(planStep.test, name, value);
}

std::vector<Measure> MeasurePage::measure(std::initializer_list<Figure> figures) const {
  return measured(planStep.test, figures);
}

double MeasurePage::millimetres(double pixels) {
  return isDensityKnown() ? pixels / pixelsPerMillimetre() : kNotMeasured;
}

bool MeasurePage::isWithinMm(double pixels, double most) {
  return pixels <= most * pixelsPerMillimetre();
}

void MeasurePage::updateLook() {
  const std::vector<Input> inputs = watch->take();
  const uint32_t now = GetTicks();  // after the inputs' times
  for (const Input& input : inputs) {
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
  return isWithinMm(std::hypot(input.x - still->x, input.y - still->y), kStillMm);
}

void MeasurePage::prepare(const PlanStep& planned) {
  if (!planned.text.empty()) instructions = planned.text;
  LookTest::prepare(planned);
}

void MeasurePage::showProgress(const RunProgress& sofar) {
  progress = sofar;
  LookTest::showProgress(sofar);
}

// What to do in large letters, then how to end, and the values.
std::vector<MeasurePage::CardLine> MeasurePage::linesOfCard(int width) const {
  constexpr int kLargePercent = 115;
  const int size = textSize(screenSize());
  const int large = percentOf(size, kLargePercent);
  std::vector<CardLine> lines;
  for (std::string& words : wrapped(instructions, large, width)) {
    lines.push_back({std::move(words), large});
  }
  const auto addLine = [&](const std::string& words) {
    lines.push_back({words, fitted(words, size, width, lineHeight(size)).size});
  };
  if (!progress.whose.empty()) addLine(progress.whose);
  addLine(tr("Hold a finger still, or Back: end."));
  lines.push_back({"", size / 2});
  for (const ValueLine& value : valueLines(values(), planStep)) addLine(value.words);
  if (!isDensityKnown() && measuresMm(planStep.test)) {
    addLine(tr("The screen's density is unknown: no distances in mm."));
  }
  if (!page.shownStanding().empty()) addLine(page.shownStanding());
  return lines;
}

// Half transparent: what it stands on is under test, too.
void MeasurePage::drawCard() const {
  constexpr int kMostLetters = 30;
  const ScreenSize screen = screenSize();
  const int gap = gapOf(screen);
  const int width = std::min(screen.width - 4 * gap, kMostLetters * textSize(screen));
  const std::vector<CardLine> lines = linesOfCard(width - 2 * gap);
  int height = 3 * gap;
  for (const CardLine& line : lines) height += lineHeight(line.size);
  const SKIA_Rect card = {(screen.width - width) / 2, percentOf(screen.height, wordsAt()), width,
                          height, kCardColor};
  skia_add_box_c(card);
  drawProgress(progress, {card.x, card.y, card.w, gap / 2, 0});
  SKIA_Rect row = {card.x + gap, card.y + 2 * gap, card.w - 2 * gap, 0, 0};
  for (const CardLine& line : lines) {
    row.h = lineHeight(line.size);
    if (!line.words.empty()) {
      skia_add_label_c(row,
                       textOf(line.words.c_str(), kPanelInk.text, SKIA_ALIGN_CENTRE, line.size));
    }
    row.y += row.h;
  }
}

void MeasurePage::draw() {
  if (page.isAsking()) {
    LookTest::draw();
    return;
  }
  drawLook();
  if (hasWords()) drawCard();
}

}  // namespace factory_test
