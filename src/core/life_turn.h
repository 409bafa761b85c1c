/// Whose turn it is to start or end the window.
#pragma once

namespace MW {

/// One thread at a time starts or ends the window. A thread outside handlers waits for its turn. A
/// handler never does, since whoever has the turn may be waiting for that very handler: it gets a
/// turn that is free, or else none.
class LifeTurn {
 public:
  enum class For { Start, End };

  /// A handler that wants the end and gets no turn asks the thread that has it.
  explicit LifeTurn(For what);
  ~LifeTurn();
  LifeTurn(const LifeTurn&) = delete;
  LifeTurn& operator=(const LifeTurn&) = delete;

  bool isMine() const { return mine; }
  /// Gives the turn back. False: it stays, since a handler asked for the end meanwhile. Who has
  /// ended the window has done what was asked, and need not look.
  bool giveBack();

 private:
  bool mine;
};

}  // namespace MW
