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
  const Callback second = word;
  Callback third = nullptr;
  third = second;
  third(2);
  third = word = nullptr;
  word(3);
  third(4);
  second(5);
  EXPECT_EQ(told, "25");
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
