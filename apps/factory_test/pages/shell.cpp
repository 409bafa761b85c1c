// A console that shows what a command writes, as it writes it.
#include <MW/dialog_shell.h>
#include <MW/window.h>

#include <algorithm>
#include <memory>
#include <optional>
#include <string>

#include "command.h"
#include "current.h"
#include "language/language.h"
#include "page_test.h"
#include "pages/table.h"
#include "utf8.h"

namespace factory_test {

namespace {

constexpr std::size_t kLongestLine = 60;   // bytes: what fits the dialog
constexpr std::size_t kCharacterRest = 3;  // bytes of a character behind its first

/// Runs the command of --shell, and is complete once that has ended. OK and the keys select and
/// back end the look, and the command.
class ShellTest : public LookTest {
 public:
  explicit ShellTest(const Context& program)
      : LookTest(tr("Shell"), tr("Read what the command writes, then OK.")),
        line(program.shellCommand) {}

  bool isComplete() const override { return hasEnded; }
  void drawOver() override { drawHintOverLook(); }

 protected:
  void beginLook() override {
    shell.emplace(tr("Shell"));
    shell->button1Callback = [](int) { Current<ShellTest>::get().finishLook(); };
    shell->keyPressCallback = [](MW::kbd_event* event) {
      Current<ShellTest>::get().finishLookOn(event->code);
    };
    shell->setActive(1);
    std::ranges::for_each("$ " + line + "\n", [this](char byte) { take(byte); });
    command.emplace(line);
  }

  void endLook() override {
    command.reset();
    shell.reset();
  }

  void updateLook() override {
    if (!command) return;
    const std::string bytes = command->read();
    std::ranges::for_each(bytes, [this](char byte) { take(byte); });
    if (const auto outcome = command->outcome()) {
      endLine();
      pending = "[" + *outcome + "]";
      endLine();
      hasEnded = true;
      command.reset();
    }
    if (!bytes.empty() || !command) MW::isDisplayUpdate(1);
  }

  std::string question() const override { return tr("Did the command do its work?"); }

 private:
  void take(char byte) {
    constexpr char kTab = '\t';
    if (byte == '\n') {
      shell->addShell(pending.c_str());
      pending.clear();
      return;
    }
    if (pending.size() >= kLongestLine + (isInsideCharacter(byte) ? kCharacterRest : 0)) endLine();
    if (byte == kTab) byte = ' ';
    if (!isControl(byte)) pending += byte;
  }

  void endLine() {
    if (pending.empty()) return;
    shell->addShell(pending.c_str());
    pending.clear();
  }

  Current<ShellTest> current{this};
  std::string line;     // for /bin/sh
  std::string pending;  // what the command has written of its last line
  std::optional<MW::DialogShell> shell;
  std::optional<Command> command;
  bool hasEnded = false;  // by itself
};

}  // namespace

std::unique_ptr<Test> makeShell(const Context& context) {
  return std::make_unique<ShellTest>(context);
}

}  // namespace factory_test
