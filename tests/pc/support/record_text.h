/// Input records as text, so that tests compare and print them.
#pragma once

#include <brimol/input.h>
#include <gtest/gtest.h>

#include <map>
#include <sstream>
#include <string>
#include <vector>

#include "input/input_service.h"

namespace brimol::pc {

inline const std::map<int, std::string> kRecordNames = {
    {BRIMOL_KEY_DOWN, "key down "}, {BRIMOL_KEY_UP, "key up "}, {BRIMOL_POINTER_MOTION, "motion "},
    {BRIMOL_POINTER_DOWN, "down "}, {BRIMOL_POINTER_UP, "up "}, {BRIMOL_LONG_PRESS, "long "}};

/// For example "down 0 at 10,20", "motion 1 at 30,20 by 20,0", "key down 273". A state byte that
/// does not fit the type is added.
inline std::string textOf(const Event& record) {
  const bool isKey = record.type == BRIMOL_KEY_DOWN || record.type == BRIMOL_KEY_UP;
  const bool isUp = record.type == BRIMOL_KEY_UP || record.type == BRIMOL_POINTER_UP;
  const BrimolPointerEvent& pointer = record.pointer;
  std::ostringstream text;
  text << kRecordNames.at(record.type) << (isKey ? record.key.code : pointer.finger);
  if (!isKey) text << " at " << pointer.x << "," << pointer.y;
  if (!isKey && (pointer.xrel != 0 || pointer.yrel != 0)) {
    text << " by " << pointer.xrel << "," << pointer.yrel;
  }
  const int state = isKey ? record.key.state : pointer.state;
  if (state != (isUp ? 0 : 1)) text << " state " << state;
  return text.str();
}

/// Takes every record that waits.
inline std::vector<std::string> takeTexts(InputService& service) {
  std::vector<std::string> texts;
  for (Event record = {}; service.poll(record);) texts.push_back(textOf(record));
  return texts;
}

/// Waits for the next record of the C calls and compares it.
inline void expectNext(const std::string& text) {
  Event record = {};
  while (PollEvent(&record) == 0) Delay(60'000);
  EXPECT_EQ(textOf(record), text);
}

}  // namespace brimol::pc
