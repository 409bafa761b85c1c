#include "records/run.h"

#include <algorithm>
#include <string_view>

#include "language/language.h"
#include "utf8.h"
#include "xml/xml_text.h"

namespace factory_test {

namespace {

constexpr std::size_t kMostBytes = 400;  // room for a plan's name in any script
constexpr std::size_t kMostSerialBytes = 64;
constexpr std::string_view kReplacement = "\xef\xbf\xbd";  // U+FFFD

}  // namespace

const char* stateName(RunState state) {
  switch (state) {
    case RunState::Running: return "running";
    case RunState::Finished: return "finished";
    default: return "aborted";
  }
}

std::string storable(const std::string& text) {
  std::string clean;
  for (const char letter : brimol::xml::validUtf8(text)) {
    clean += isControl(letter) ? kReplacement : std::string_view(&letter, 1);
  }
  clean.resize(wholeBytes(clean, kMostBytes));
  return clean;
}

RunStart storable(RunStart start) {
  for (std::string* const text : {&start.unit, &start.operatorName, &start.planName,
                                  &start.planHash, &start.software, &start.station}) {
    *text = storable(*text);
  }
  for (std::string& test : start.tests) test = storable(test);
  return start;
}

bool isSerial(const std::string& text, std::string& error) {
  const bool isShort = !text.empty() && text.size() <= kMostSerialBytes;
  if (isShort &&
      std::ranges::all_of(text, [](char letter) { return letter > ' ' && letter <= '~'; })) {
    return true;
  }
  error = msg("a serial number has 1 to 64 letters, digits and marks, without spaces");
  return false;
}

}  // namespace factory_test
