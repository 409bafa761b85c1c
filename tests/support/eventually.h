/// Waiting for what another thread or program does.
#pragma once

#include <chrono>
#include <thread>

namespace brimol::test {

/// True as soon as `holds` is; false when it is not within a minute.
template <typename Condition>
bool eventually(Condition holds) {
  constexpr std::chrono::seconds kBound{60};
  constexpr std::chrono::milliseconds kPause{5};
  const auto end = std::chrono::steady_clock::now() + kBound;
  while (!holds()) {
    if (std::chrono::steady_clock::now() > end) return false;
    std::this_thread::sleep_for(kPause);
  }
  return true;
}

}  // namespace brimol::test
