/// The callback word that applications store their functions in.
#pragma once

#include <MW/api.h>
#include <MW/records.h>

#include <concepts>
#include <cstddef>
#include <type_traits>

namespace MW {

/// A plain function of the application, or null: not wanted. One pointer wide.
///
/// It takes `nullptr`, a function or a captureless lambda that returns nothing and takes one int,
/// mouse_event*, kbd_event* or int*. Which of them a class calls it with stands at the class; a
/// function of another kind compiles, but must not be stored there. Calling a null one does
/// nothing. A word may be assigned at any time on the thread that calls it, and elsewhere while its
/// widget is not active.
class Callback {
 public:
  constexpr Callback() = default;
  constexpr Callback(std::nullptr_t) {}  // NOLINT(google-explicit-constructor): assigned from null

  template <typename Function>
  requires(std::convertible_to<Function, void (*)(int)>)
      Callback(Function function)  // NOLINT(bugprone-forwarding-reference-overload)
      : word(erase(static_cast<void (*)(int)>(function))) {}

  template <typename Function>
  requires(std::convertible_to<Function, void (*)(mouse_event*)>) Callback(Function function)
      : word(erase(static_cast<void (*)(mouse_event*)>(function))) {}

  template <typename Function>
  requires(std::convertible_to<Function, void (*)(kbd_event*)>) Callback(Function function)
      : word(erase(static_cast<void (*)(kbd_event*)>(function))) {}

  template <typename Function>
  requires(std::convertible_to<Function, void (*)(int*)>) Callback(Function function)
      : word(erase(static_cast<void (*)(int*)>(function))) {}

  explicit operator bool() const { return word != nullptr; }

  void operator()(int value) const { call(value); }
  void operator()(mouse_event* event) const { call(event); }
  void operator()(kbd_event* event) const { call(event); }
  void operator()(int* values) const { call(values); }

 private:
  using Word = void (*)();

  template <typename Argument>
  static Word erase(void (*function)(Argument)) {
    return reinterpret_cast<Word>(function);
  }

  // A function pointer that went through another function pointer type comes back unchanged.
  template <typename Argument>
  void call(Argument argument) const {
    if (word != nullptr) reinterpret_cast<void (*)(Argument)>(word)(argument);
  }

  Word word = nullptr;
};

static_assert(sizeof(Callback) == sizeof(void (*)()), "descriptors count on one word each");
static_assert(std::is_trivially_copyable_v<Callback>);

}  // namespace MW
