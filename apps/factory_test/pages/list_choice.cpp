// A list of which one row is chosen.
#include <MW/dialog_list.h>

#include <array>
#include <atomic>
#include <memory>
#include <optional>
#include <string>

#include "current.h"
#include "language/language.h"
#include "page_test.h"
#include "pages/table.h"

namespace factory_test {

namespace {

// As short as the dialog's large letters need on a small screen.
constexpr auto kRows = std::to_array<const char*>({"LCD", "SIM", "GPS", "NFC"});
constexpr int kFirstChoice = 1;

/// OK, CANCEL and the keys select and back end the look.
class ListTest : public LookTest {
 public:
  ListTest() : LookTest(tr("List choice"), tr("Choose a row, then OK.")) {}

  void drawOver() override { drawHintOverLook(); }

 protected:
  void beginLook() override {
    list.emplace(tr("Part?"));
    for (const char* const row : kRows) list->addIndex(row);
    list->initFinish(chosen);
    // NOLINTBEGIN(readability-non-const-parameter): the callbacks' type
    list->rowPressCallback = [](int* row) { self().mark(*row); };
    list->button1Callback = [](int* row) { self().choose(*row); };
    list->button2Callback = [](int* row) { self().choose(*row); };
    // NOLINTEND(readability-non-const-parameter)
    list->keyPressCallback = [](MW::kbd_event* event) { self().finishLookOn(event->code); };
    list->setActive(1);
  }

  void endLook() override { list.reset(); }

  std::string question() const override { return nameOf(chosen) + tr(". Was that your choice?"); }

 private:
  static ListTest& self() { return Current<ListTest>::get(); }
  static std::string nameOf(int row) { return kRows.at(static_cast<std::size_t>(row)); }

  void mark(int row) { page.say(nameOf(row).c_str()); }

  void choose(int row) {
    chosen = row;
    finishLook();
  }

  Current<ListTest> current{this};
  std::atomic<int> chosen = kFirstChoice;
  std::optional<MW::DialogList> list;
};

}  // namespace

std::unique_ptr<Test> makeListChoice(const Context&) { return std::make_unique<ListTest>(); }

}  // namespace factory_test
