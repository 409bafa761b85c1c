/// A file descriptor that closes itself.
#pragma once

#include <unistd.h>

#include <utility>

namespace factory_test {

class UniqueFd {
 public:
  UniqueFd() = default;
  /// Owns `opened`; a negative one is none.
  explicit UniqueFd(int opened) : descriptor(opened) {}
  ~UniqueFd() { close(); }
  UniqueFd(UniqueFd&& other) noexcept : descriptor(std::exchange(other.descriptor, kNone)) {}
  UniqueFd& operator=(UniqueFd&& other) noexcept {
    if (this == &other) return *this;
    close();
    descriptor = std::exchange(other.descriptor, kNone);
    return *this;
  }
  UniqueFd(const UniqueFd&) = delete;
  UniqueFd& operator=(const UniqueFd&) = delete;

  int get() const { return descriptor; }
  bool isOpen() const { return descriptor >= 0; }
  /// False: the system could not keep what was written.
  bool close() { return !isOpen() || ::close(std::exchange(descriptor, kNone)) == 0; }

 private:
  static constexpr int kNone = -1;

  int descriptor = kNone;
};

}  // namespace factory_test
