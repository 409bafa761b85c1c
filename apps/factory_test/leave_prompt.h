/// The question before the application ends.
#pragma once

#include <MW/dialog.h>

#include <atomic>

#include "current.h"

namespace factory_test {

/// Over everything from construction to destruction. The left button or the select key says yes,
/// the right button or the back key no. There is one at a time.
class LeavePrompt {
 public:
  enum class Answer { None, Yes, No };

  LeavePrompt();
  /// Any thread.
  Answer answer() const { return given; }

 private:
  void answer(Answer said) { given = said; }

  Current<LeavePrompt> current{this};
  std::atomic<Answer> given = Answer::None;
  MW::Dialog dialog;
};

}  // namespace factory_test
