/// How callbacks, which are plain functions, find the object that they belong to.
#pragma once

namespace factory_test {

/// Makes its holder the one that `get` finds, from construction to destruction. Hold it before the
/// widgets whose callbacks use it: it then goes after them, and no callback runs any more.
template <typename Owner>
class Current {
 public:
  explicit Current(Owner* owner) { instance = owner; }
  ~Current() { instance = nullptr; }
  Current(const Current&) = delete;
  Current& operator=(const Current&) = delete;

  static Owner& get() { return *instance; }

 private:
  inline static Owner* instance = nullptr;  // set on the main thread while no callback can run
};

}  // namespace factory_test
