/// The callback word that applications store their functions in.
#pragma once

#include <MW/records.h>

#include <atomic>
#include <concepts>
#include <cstddef>
#include <type_traits>

namespace MW {

/// A plain function of the application, or null: not wanted. One pointer wide.
///
/// It takes `nullptr`, a function or a captureless lambda that returns nothing and takes one int,
/// mouse_event*, kbd_event* or int*. The class that calls the word says which of them it calls it
/// with. A function of another kind compiles, and is then called with an argument that it does not
/// understand. Calling a null word does nothing.
///
/// A word may be assigned on any thread at any time, also while its widget is active: a handler
/// calls either the old or the new function, and the old one may still be running when the
/// assignment returns. Making a new word as a copy is not atomic: nobody may assign the copied word
/// meanwhile.
class Callback {
 public:
  /// No function.
  constexpr Callback() = default;
  constexpr Callback(std::nullptr_t) {}  // NOLINT(google-explicit-constructor): assigned from null
  /// A copy of the function.
  constexpr Callback(const Callback&) = default;

  /// From a function or a captureless lambda.
  template <typename Function>
  requires(std::convertible_to<Function, void (*)(int)>)
      Callback(Function function)  // NOLINT(bugprone-forwarding-reference-overload)
      : word(erase(static_cast<void (*)(int)>(function))) {}

  /// The same.
  template <typename Function>
  requires(std::convertible_to<Function, void (*)(mouse_event*)>) Callback(Function function)
      : word(erase(static_cast<void (*)(mouse_event*)>(function))) {}

  /// The same.
  template <typename Function>
  requires(std::convertible_to<Function, void (*)(kbd_event*)>) Callback(Function function)
      : word(erase(static_cast<void (*)(kbd_event*)>(function))) {}

  /// The same.
  template <typename Function>
  requires(std::convertible_to<Function, void (*)(int*)>) Callback(Function function)
      : word(erase(static_cast<void (*)(int*)>(function))) {}

  /// No function any more.
  Callback& operator=(std::nullptr_t) {
    store({});
    return *this;
  }
  /// From a function, a lambda or another word.
  // A template, since a copy assignment that is written by hand is not trivial.
  template <std::convertible_to<Callback> Source>
  Callback& operator=(Source&& source) {  // NOLINT(misc-unconventional-assign-operator)
    store(source);
    return *this;
  }
  // Trivial, and so the word is trivially copyable. No word that has a name can be its target:
  // there every source comes to the template.
  Callback& operator=(const Callback&) && = delete;

  /// Whether there is a function.
  explicit operator bool() const { return load() != nullptr; }

  /// Calls the function, on the calling thread, with what it takes.
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
    const Word function = load();
    if (function != nullptr) reinterpret_cast<void (*)(Argument)>(function)(argument);
  }

  // What the assigning thread wrote before is seen by the function.
  Word load() const { return std::atomic_ref(word).load(std::memory_order_acquire); }
  void store(const Callback& source) {
    std::atomic_ref(word).store(source.load(), std::memory_order_release);
  }

  mutable Word word = nullptr;  // mutable: std::atomic_ref reads nothing that is const
};

static_assert(sizeof(Callback) == sizeof(void (*)()), "descriptors count on one word each");
static_assert(std::is_trivially_copyable_v<Callback>);

}  // namespace MW
