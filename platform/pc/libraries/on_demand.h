/// Libraries of the system that are opened when something first needs them. Linked, they would cost
/// every session the time and the memory of all that they need in turn.
#pragma once

#include <string>

namespace brimol::pc {

/// A library that stays open as long as the process lives. Of the version that the platform was
/// built with: `file` is its name for the loader.
class OnDemand {
 public:
  explicit OnDemand(const char* file);

  /// One line that says why it cannot be used; empty where it can.
  const std::string& error() const { return problem; }

  /// What stands for a function until its type is known.
  class Found {
   public:
    explicit Found(void* place) : address(place) {}
    template <class Function>
    operator Function*() const {
      return reinterpret_cast<Function*>(address);
    }

   private:
    void* address;  // the loader's own type
  };

  /// The function of that name. Null, and an error, where there is none.
  Found function(const char* name);

 private:
  void* handle;  // the loader's own type
  std::string problem;
};

}  // namespace brimol::pc
