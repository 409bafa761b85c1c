#include <MW/callback.h>

#include <gtest/gtest.h>

#include <latch>
#include <string>
#include <thread>

namespace {

using MW::Callback;

std::string told;
void tell(int value) { told += std::to_string(value); }

TEST(CallbackTest, CallsWhatWasStoredLast) {
  told.clear();
  Callback word;
  EXPECT_FALSE(word);
  word(1);
  word = tell;
  EXPECT_TRUE(word);
  word(2);
  const Callback second = word;
  Callback third = nullptr;
  third = second;
  third(3);
  third = word = nullptr;
  third(4);
  third = &tell;
  third = {};
  third(4);
  word(5);
  second(6);
  EXPECT_EQ(told, "236");
}

TEST(CallbackTest, TakesEachKindOfFunction) {
  told.clear();
  Callback word = [](MW::mouse_event* mouse) { told += std::to_string(mouse->x); };
  MW::mouse_event mouse = {.state = 0, .finger = 0, .x = 1, .y = 0, .xrel = 0, .yrel = 0};
  word(&mouse);
  word = [](MW::kbd_event* key) { told += std::to_string(key->code); };
  MW::kbd_event key = {.state = 0, .code = 2};
  word(&key);
  word = [](int* values) { told += std::to_string((*values)++); };
  int values = 3;
  word(&values);
  EXPECT_EQ(told, "123");
}

int first;
int other;

// The word of a widget that is active from its construction on.
TEST(CallbackTest, IsAssignedWhileAnotherThreadCallsIt) {
  constexpr int kCalls = 1000;
  first = other = 0;
  Callback word = [](int) { ++first; };
  std::latch bothThere(2);
  const auto call = [&] {
    bothThere.arrive_and_wait();
    for (int i = 0; i < kCalls; ++i) word(i);
  };
  {
    const std::jthread calling(call);
    bothThere.arrive_and_wait();
    Callback next;
    word = next = [](int) { ++other; };
    word = next;
    const Callback last = next;
    word = last;
    word = Callback(next);
  }
  EXPECT_EQ(first + other, kCalls);
}

}  // namespace
