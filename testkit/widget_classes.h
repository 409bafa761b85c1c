/// Every class of widgets: what makes one, what an application can call on it, and its callbacks.
#pragma once

#include <MW/widget.h>

#include <functional>
#include <memory>
#include <vector>

#include "arguments.h"

namespace brimol::test {

/// Calls something of a widget with arguments that it takes.
using Operation = std::function<void(MW::Widget& widget, Arguments& from)>;

struct WidgetClass {
  const char* name;
  std::unique_ptr<MW::Widget> (*make)(Arguments& from);
  /// Gives each of the class's callbacks a function that calls whenTold().
  void (*listen)(MW::Widget& widget);
  /// What the class has beside baseOperations().
  std::vector<Operation> operations;
};

/// All classes of which there can be widgets, by name.
const std::vector<WidgetClass>& widgetClasses();
/// What every widget has, onRecvEvent() and its parts among it.
const std::vector<Operation>& baseOperations();

/// What the callbacks do. It may delete widgets. Empty: nothing.
extern std::function<void()> whenTold;

}  // namespace brimol::test
