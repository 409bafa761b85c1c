#include "scenes.h"

#include <algorithm>
#include <array>
#include <string>
#include <string_view>

namespace scenes {

namespace {

constexpr uint32_t kWhite = 0xFFFFFFFF;
constexpr uint32_t kBlack = 0xFF000000;
constexpr uint32_t kFace = 0xFFDDE6F0;
constexpr uint32_t kPressedFace = 0xFF87CEFA;
constexpr uint32_t kVeil = 0x80000000;
constexpr uint32_t kDarkerVeil = 0x90000000;
constexpr int32_t kMargin = 40;
constexpr int32_t kWidth = kScreen.w - 2 * kMargin;

constexpr auto kRows = std::to_array<const char*>(
    {"Touch screen", "Display colours", "Camera front", "Camera back", "Vibration", "Speaker",
     "Receiver", "Microphone", "Proximity sensor", "Light sensor", "Fingerprint", "Wireless",
     "Satellites", "Battery"});

SKIA_Item box(SKIA_Rect rect) { return {SKIA_BOX, rect, {}, {}}; }

SKIA_Item textItem(int32_t kind, SKIA_Rect rect, std::string_view words, int32_t size,
                   int32_t align = SKIA_ALIGN_CENTRE) {
  SKIA_Item item = {kind, rect, {}, {{}, static_cast<int32_t>(words.size()), kBlack, align, size}};
  std::ranges::copy(words, item.text.text);
  return item;
}

// By turns.
uint32_t white(int number) { return number % 2 == 0 ? kWhite : kFace; }
uint32_t face(int number) { return number % 2 == 0 ? kFace : kPressedFace; }

Frame fillOf(uint32_t color) { return {box({0, 0, kScreen.w, kScreen.h, color})}; }

// Fourteen rows of text over a ground, scrolled by so many pixels.
template <typename Words>
Frame rowsOver(uint32_t ground, int32_t scroll, Words words) {
  constexpr int32_t kRowHeight = 160;
  constexpr int32_t kRowGap = 16;
  Frame frame = fillOf(ground);
  int32_t y = kMargin - scroll;
  for (std::size_t i = 0; i < kRows.size(); ++i, y += kRowHeight + kRowGap) {
    frame.push_back(textItem(SKIA_TEXTBOX, {kMargin, y, kWidth, kRowHeight, kFace}, words(i), 64));
  }
  return frame;
}

std::string rowWords(std::size_t row) { return kRows.at(row); }

Frame menuWith(uint32_t ground, int32_t scroll = 0) { return rowsOver(ground, scroll, rowWords); }

Frame listOver(uint32_t ground, int32_t scroll) {
  constexpr int kCount = 64;
  constexpr int32_t kRowHeight = 36;
  constexpr int32_t kPitch = 40;
  Frame frame = fillOf(ground);
  for (int i = 0; i < kCount; ++i) {
    const std::string words =
        rowWords(static_cast<std::size_t>(i) % kRows.size()) + ", part " + std::to_string(i);
    frame.push_back(textItem(SKIA_TEXTBOX, {0, i * kPitch - scroll, kScreen.w, kRowHeight, kFace},
                             words, 28, SKIA_ALIGN_LEFT));
  }
  return frame;
}

// Sixty lines of eighty characters, from the line of that number on.
Frame logFrom(int first, uint32_t ground) {
  constexpr int kLines = 60;
  constexpr std::size_t kCharacters = 80;
  constexpr int32_t kPitch = 42;
  Frame frame = fillOf(ground);
  for (int i = 0; i < kLines; ++i) {
    std::string words = std::to_string(100000 + first + i) +
                        " sensor reads 0.5 of 3.9 V at 12:00:00, as it should be; next in 20 ms ";
    words.resize(kCharacters, '.');
    frame.push_back(textItem(SKIA_LABEL, {20, 10 + i * kPitch, kScreen.w - kMargin, kPitch, 0},
                             words, 32, SKIA_ALIGN_LEFT));
  }
  return frame;
}

}  // namespace

Frame fill(int number) { return fillOf(face(number)); }

Frame menu(int number) { return menuWith(white(number)); }

Frame menuWithNewTexts(int number) {
  return rowsOver(kWhite, 0, [number](std::size_t row) {
    return rowWords(row) + ' ' + std::to_string(number);
  });
}

Frame menuWithOneNewText(int number) {
  return rowsOver(kWhite, 0, [number](std::size_t row) {
    constexpr std::size_t kChanged = 5;
    return row == kChanged ? "Level " + std::to_string(number) + " dB" : rowWords(row);
  });
}

Frame menuScrolled(int number) { return menuWith(kWhite, number % 2 * 12); }

Frame menuWithPress(int number) {
  Frame frame = menuWith(kWhite);
  frame.push_back(textItem(SKIA_ROUNDBUTTONBOX, {420, 2300, 600, 180, face(number)}, "Back", 64));
  return frame;
}

Frame menuUnderVeil(int number) {
  Frame frame = menuWith(kWhite);
  frame.push_back(box({0, 0, kScreen.w, kScreen.h, number % 2 == 0 ? kVeil : kDarkerVeil}));
  return frame;
}

Frame list(int number) { return listOver(white(number), 0); }

// Ten steps down, ten steps up.
Frame listScrolled(int number) {
  constexpr int kSteps = 10;
  constexpr int kStep = 10;  // pixels
  const int place = number % (2 * kSteps);
  return listOver(kWhite, kStep * std::min(place, 2 * kSteps - place));
}

Frame keyboard(int number) {
  constexpr int kAcross = 7;
  constexpr int kKeys = 42;
  constexpr int32_t kKeyWidth = 190;
  constexpr int32_t kKeyHeight = 150;
  constexpr int32_t kGap = 14;
  constexpr int32_t kTop = 1500;
  Frame frame = {box({0, kTop, kScreen.w, kScreen.h - kTop, white(number)})};
  for (int i = 0; i < kKeys; ++i) {
    const SKIA_Rect key = {kGap + i % kAcross * (kKeyWidth + kGap),
                           kTop + kGap + i / kAcross * (kKeyHeight + kGap), kKeyWidth, kKeyHeight,
                           kFace};
    frame.push_back(textItem(SKIA_BUTTONBOX, key, std::string(1, static_cast<char>('0' + i)), 72));
  }
  return frame;
}

// A dialog with its frame, title, three lines and two buttons over a veil over a ground.
Frame veilWithDialog(int number) {
  Frame frame = fillOf(white(number));
  frame.push_back(box({0, 0, kScreen.w, kScreen.h, kVeil}));
  frame.push_back({SKIA_ROUNDBOX, {120, 760, 1200, 1000, kWhite}, {}, {}});
  frame.push_back(textItem(SKIA_LABEL, {120, 780, 1200, 140, 0}, "Fingerprint", 72));
  frame.push_back(textItem(SKIA_LABEL, {160, 980, 1120, 100, 0}, "The sensor did not answer.", 56));
  frame.push_back(textItem(SKIA_LABEL, {160, 1100, 1120, 100, 0}, "Clean it and try again,", 56));
  frame.push_back(textItem(SKIA_LABEL, {160, 1220, 1120, 100, 0}, "or mark it as failed.", 56));
  frame.push_back(textItem(SKIA_ROUNDBUTTONBOX, {180, 1520, 500, 180, kFace}, "Fail", 64));
  frame.push_back(textItem(SKIA_ROUNDBUTTONBOX, {760, 1520, 500, 180, kFace}, "Again", 64));
  return frame;
}

Frame log(int number) { return logFrom(0, white(number)); }

Frame logMovedByALine(int number) { return logFrom(number, kWhite); }

Frame logWithNewLines(int number) { return logFrom(number * 60, kWhite); }

Frame nothingChanged(int) { return listOver(kWhite, 0); }

}  // namespace scenes
