/// How a member of a class becomes an Operation.
#pragma once

#include <string>
#include <tuple>
#include <type_traits>
#include <utility>

#include "widget_classes.h"

namespace brimol::test {

using Operations = std::vector<Operation>;

/// Calls something with arguments of these types.
template <typename Callee, typename... Parameters>
void callWith(Arguments& from, const Callee& callee) {
  std::tuple<std::remove_cvref_t<Parameters>...> values{from.take<Parameters>()...};
  std::apply(callee, std::move(values));
}

/// The call of a member.
template <typename Class, typename Result, typename... Parameters>
Operation operation(Result (Class::*member)(Parameters...)) {
  return [member](MW::Widget& widget, Arguments& from) {
    auto& own = static_cast<Class&>(widget);
    const auto call = [&](auto... values) { (void)(own.*member)(values...); };
    callWith<decltype(call), Parameters...>(from, call);
  };
}

template <typename Class, typename Result, typename... Parameters>
Operation operation(Result (Class::*member)(Parameters...) const) {
  return [member](MW::Widget& widget, Arguments& from) {
    auto& own = static_cast<const Class&>(widget);
    const auto call = [&](auto... values) { (void)(own.*member)(values...); };
    callWith<decltype(call), Parameters...>(from, call);
  };
}

/// That of one of several of a name, told by its parameters.
template <typename... Parameters>
struct With {
  template <typename Class, typename Result>
  static Operation call(Result (Class::*member)(Parameters...)) {
    return operation(member);
  }
  template <typename Class, typename Result>
  static Operation call(Result (Class::*member)(Parameters...) const) {
    return operation(member);
  }
};

/// That of one that takes a text with the number of its bytes, in which it trusts.
template <typename Class>
Operation counted(void (Class::*member)(const char*, int)) {
  return [member](MW::Widget& widget, Arguments& from) {
    const std::string text = from.bytes();
    (static_cast<Class&>(widget).*member)(text.c_str(), from.take<int>());
  };
}

}  // namespace brimol::test
