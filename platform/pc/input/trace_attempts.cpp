// What the steps of a trace do.
#include <algorithm>
#include <array>
#include <utility>

#include "input/trace_runner.h"
#include "scene/quoted_text.h"
#include "scene/shown_texts.h"
#include "scene/utf8.h"

namespace brimol::pc {

namespace {

constexpr uint64_t kFindMs = 1000;
constexpr uint32_t kTapMs = 50;
constexpr uint32_t kMoveStepMs = 10;
constexpr int kMostShifts = 3;  // the layouts of the keyboard

ScreenPoint middleOf(const Pixels& area) {
  return {area.x + area.width / 2, area.y + area.height / 2};
}

std::string listOf(const std::vector<ShownText>& texts) {
  std::string list;
  for (const ShownText& each : texts) {
    const auto [x, y] = middleOf(each.area);
    list += "\n  " + inQuotes(each.text) + " at " + std::to_string(x) + ' ' + std::to_string(y);
  }
  return list.empty() ? " nothing" : list;
}

std::string hexColour(uint32_t colour) {
  constexpr std::string_view kDigits = "0123456789ABCDEF";
  std::string text = "#";
  for (int shift = 20; shift >= 0; shift -= 4) text += kDigits[colour >> shift & 0xF];
  return text;
}

// One for each place: a caption that is drawn twice is one target.
std::vector<ShownText> fitting(const std::vector<ShownText>& texts, const TextPattern& pattern) {
  std::vector<ShownText> found;
  for (const ShownText& each : texts) {
    const auto isThere = [middle = middleOf(each.area)](const ShownText& other) {
      return middleOf(other.area) == middle;
    };
    if (pattern.matches(each.text) && std::ranges::none_of(found, isThere)) found.push_back(each);
  }
  return found;
}

// The bytes of the character that begins there.
std::size_t lengthOfCharacter(std::string_view text) {
  const auto* const end = std::find_if_not(text.begin() + 1, text.end(), isInsideCharacter);
  return static_cast<std::size_t>(end - text.begin());
}

}  // namespace

TraceRunner::Outcome TraceRunner::lookAgainUntil(uint64_t deadline, uint64_t now,
                                                 const std::string& why) {
  lookUntil = deadline;
  if (now >= deadline) fail(why);
  return Outcome::Later;
}

std::optional<ScreenPoint> TraceRunner::find(const Place& place, std::string& why) const {
  if (!place.text)
    return ScreenPoint{place.x.pixels(stage.screen.w), place.y.pixels(stage.screen.h)};
  return pick(shownTexts(newest, stage.screen), *place.text, why);
}

// A key of a keyboard; what a field shows of a text that is being typed is none.
std::optional<ScreenPoint> TraceRunner::findKey(const std::string& text, std::string& why) const {
  std::vector<ShownText> texts = shownTexts(newest, stage.screen);
  std::erase_if(
      texts, [this](const ShownText& each) { return newest.at(each.item).kind != SKIA_BUTTONBOX; });
  return pick(texts, TextPattern({text}), why);
}

std::optional<ScreenPoint> TraceRunner::pick(const std::vector<ShownText>& texts,
                                             const TextPattern& wanted, std::string& why) {
  const std::vector<ShownText> found = fitting(texts, wanted);
  if (found.size() == 1) return middleOf(found.front().area);
  why = found.empty() ? "no item shows this text; shown are:" + listOf(texts)
                      : "several items show this text:" + listOf(found);
  return std::nullopt;
}

TraceRunner::Outcome TraceRunner::attempt(const Touch& touch, uint64_t now) {
  if (hasActed) return Outcome::Done;
  const bool isMoved = touch.kind != Touch::Kind::Tap && touch.kind != Touch::Kind::Press &&
                       touch.kind != Touch::Kind::Drag;
  if (isMoved && !fingers.isDown(touch.finger)) {
    fail("finger " + std::to_string(touch.finger) + " is not down");
    return Outcome::Later;
  }
  std::string why;
  const auto place = find(touch.place, why);
  const auto to = place ? find(touch.to, why) : std::nullopt;
  if (!place || !to) return lookAgainUntil(*begun + kFindMs, now, why);
  planTouch(touch, *place, *to, now);
  hasActed = true;
  return Outcome::Later;
}

void TraceRunner::planTouch(const Touch& touch, ScreenPoint place, ScreenPoint to, uint64_t now) {
  const int finger = touch.finger;
  const uint64_t end = now + touch.duration;
  const auto press = [this, finger, place](uint64_t when) { fingers.press(finger, place, when); };
  const auto release = [this, finger](uint64_t) { fingers.release(finger); };
  const ScreenPoint from = fingers.position(finger);
  switch (touch.kind) {
    case Touch::Kind::Press: return plan(now, press);
    case Touch::Kind::Release: return plan(now, release);
    case Touch::Kind::Move:
      return planned.push_back(moveStep({finger, from, place, now, touch.duration}, 1));
    case Touch::Kind::MoveBy: {
      const ScreenPoint by = {from.x + place.x, from.y + place.y};
      return planned.push_back(moveStep({finger, from, by, now, touch.duration}, 1));
    }
    case Touch::Kind::Tap: break;
    case Touch::Kind::Drag: {
      plan(now, press);
      planned.push_back(moveStep({finger, place, to, now, touch.duration}, 1));
      return plan(end, release);
    }
  }
  plan(now, press);
  plan(end, release);
}

// One step plans the next, since a move may take a day.
TraceRunner::Planned TraceRunner::moveStep(const Motion& motion, int number) {
  const int steps = static_cast<int>(std::max(motion.duration / kMoveStepMs, 1U));
  const auto share = [number, steps](int64_t whole) { return whole * number / steps; };
  const auto between = [&](int begin, int end) {
    return begin + static_cast<int>(share(int64_t{end} - begin));
  };
  const ScreenPoint place = {between(motion.from.x, motion.to.x),
                             between(motion.from.y, motion.to.y)};
  return {motion.start + static_cast<uint64_t>(share(motion.duration)),
          [this, motion, number, place, steps](uint64_t) {
            fingers.move(motion.finger, place);
            if (number < steps) planned.push_front(moveStep(motion, number + 1));
          }};
}

TraceRunner::Outcome TraceRunner::attempt(const KeyStroke& stroke, uint64_t now) {
  if (hasActed) return Outcome::Done;
  const auto post = [this, code = stroke.code](BrimolEventType type) {
    return [this, type, code](uint64_t) { stage.post(keyRecord(type, code)); };
  };
  if (stroke.kind != KeyStroke::Kind::Up) plan(now, post(BRIMOL_KEY_DOWN));
  if (stroke.kind != KeyStroke::Kind::Down) plan(now + stroke.duration, post(BRIMOL_KEY_UP));
  hasActed = true;
  return Outcome::Later;
}

TraceRunner::Outcome TraceRunner::attempt(const Typing& typing, uint64_t now) {
  const std::string_view left = std::string_view(typing.text).substr(typed);
  if (left.empty()) return Outcome::Done;
  const std::size_t length = lengthOfCharacter(left);
  const std::string key = left.front() == ' ' ? "space" : std::string(left.substr(0, length));
  std::string why;
  auto place = findKey(key, why);
  if (place) {
    typed += length;
    shifts = 0;
  } else if (shifts < kMostShifts) {
    std::string ignored;
    place = findKey("shift", ignored);
    if (place) ++shifts;
  }
  if (!place)
    return lookAgainUntil(lookUntil.value_or(now + kFindMs), now, inQuotes(key) + ": " + why);
  lookUntil = std::nullopt;
  planTouch({.kind = Touch::Kind::Tap, .place = {}, .to = {}, .duration = kTapMs, .finger = 0},
            *place, *place, now);
  plan(now + uint64_t{2} * kTapMs, [](uint64_t) {});
  return Outcome::Later;
}

std::string TraceRunner::whyNot(const Look& look) {
  using Subject = Look::Subject;
  if (look.subject == Subject::Pixel) {
    const ScreenPoint at = {look.x.pixels(stage.screen.w), look.y.pixels(stage.screen.h)};
    const auto colour = stage.pixel(at);
    if (colour == look.colour) return {};
    return colour ? "the pixel is " + hexColour(*colour) : "there is no picture, or no such pixel";
  }
  if (look.subject == Subject::Log || look.subject == Subject::NoLog) {
    const auto found =
        std::find_if(log.begin() + static_cast<std::ptrdiff_t>(logRead), log.end(),
                     [&](const std::string& line) { return look.pattern.isFoundIn(line); });
    const bool isFound = found != log.end();
    if (look.subject == Subject::NoLog) return isFound ? "logged: " + *found : "";
    if (isFound) logRead = static_cast<std::size_t>(found - log.begin()) + 1;
    return isFound ? "" : "no such line was logged";
  }
  std::vector<ShownText> texts = shownTexts(newest, stage.screen);
  if (look.area) {
    const SearchArea& area = *look.area;
    const Pixels limits = {area.x.pixels(stage.screen.w), area.y.pixels(stage.screen.h),
                           area.w.pixels(stage.screen.w), area.h.pixels(stage.screen.h)};
    std::erase_if(texts, [&](const ShownText& each) { return isEmpty(within(each.area, limits)); });
  }
  const std::vector<ShownText> found = fitting(texts, look.pattern);
  if (look.subject == Subject::NoText) return found.empty() ? "" : "shown:" + listOf(found);
  return found.empty() ? "not shown; shown are:" + listOf(texts) : "";
}

TraceRunner::Outcome TraceRunner::attempt(const Look& look, uint64_t now) {
  if (lookUntil && !hasSeen && now < *lookUntil) return Outcome::Later;
  const std::string why = whyNot(look);
  const uint64_t deadline = *begun + look.within;
  if (!why.empty() && now < deadline) return lookAgainUntil(deadline, now, why);
  stage.judge(step().line, why);
  if (!why.empty()) fail(why);
  return Outcome::Done;
}

TraceRunner::Outcome TraceRunner::attempt(const Pause& pause, uint64_t now) {
  if (hasActed) return Outcome::Done;
  plan(now + pause.duration, [](uint64_t) {});
  hasActed = true;
  return Outcome::Later;
}

TraceRunner::Outcome TraceRunner::attempt(const Shot& shot, uint64_t) {
  const std::string why = stage.shoot(shot.file);
  if (!why.empty()) fail(why);
  return Outcome::Done;
}

TraceRunner::Outcome TraceRunner::attempt(const WorldChange& change, uint64_t) const {
  stage.changeWorld(change);
  return Outcome::Done;
}

TraceRunner::Outcome TraceRunner::attempt(const RawRecord& raw, uint64_t) const {
  stage.post(raw.record);
  return Outcome::Done;
}

TraceRunner::Outcome TraceRunner::attempt(const CloseWish&, uint64_t) const {
  stage.close();
  return Outcome::Done;
}

// The recorded session ended in the course of this moment, the played one does too.
TraceRunner::Outcome TraceRunner::attempt(const SessionEnd&, uint64_t now) {
  if (hasActed) return Outcome::Done;
  plan(now + 1, [](uint64_t) {});
  hasActed = true;
  return Outcome::Later;
}

}  // namespace brimol::pc
