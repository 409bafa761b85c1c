// A walk through the whole menu: every entry opens, and between them they show every widget class
// and every kind of dialog.
#include <MW/MW.h>
#include <cxxabi.h>
#include <dlfcn.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <map>
#include <mutex>

#include "e2e/eventually.h"
#include "e2e/user.h"
#include "test.h"

namespace {

/// What came to the screen since the last look.
class Sightings {
 public:
  void add(const std::string& what) {
    const std::lock_guard guard(mutex);
    seen.try_emplace(what, frames);
  }
  void add(const MW::Widget& widget) {
    const char* const name = typeid(widget).name();
    char* const plain = abi::__cxa_demangle(name, nullptr, nullptr, nullptr);
    add(plain != nullptr ? plain : name);
    std::free(plain);
  }
  void endFrame() {
    const std::lock_guard guard(mutex);
    ++frames;
  }
  /// With a whole frame behind it: all that belongs to it is there.
  bool has(const std::string& what) {
    const std::lock_guard guard(mutex);
    const auto found = seen.find(what);
    return found != seen.end() && found->second < frames;
  }
  void clear() {
    const std::lock_guard guard(mutex);
    seen.clear();
  }

 private:
  std::mutex mutex;
  int frames = 0;                   // drawn by now
  std::map<std::string, int> seen;  // and the frames drawn before it was
} sightings;

struct DialogKind : MW::Dialog {
  static int of(const MW::Dialog& dialog) { return dialog.*&DialogKind::kind; }
};

// A function of the library, found behind the one of this program.
template <typename Function>
Function libraryOwn(const char* symbol, Function) {
  Function own = nullptr;
  void* const address = dlsym(RTLD_NEXT, symbol);
  std::memcpy(&own, &address, sizeof address);
  return own;
}

}  // namespace

// The library calls these in place of its own, and they call its own.

int MW::Window::registerWidget(Widget* widget) {
  sightings.add(*widget);
  if (const auto* const dialog = dynamic_cast<const Dialog*>(widget)) {
    sightings.add("dialog " + std::to_string(DialogKind::of(*dialog)));
  }
  static const auto own =
      libraryOwn("_ZN2MW6Window14registerWidgetEPNS_6WidgetE", &Window::registerWidget);
  return own(widget);
}

void MW::Widget::setActive(int on) {
  if (on != 0) sightings.add(*this);
  static const auto own = libraryOwn("_ZN2MW6Widget9setActiveEi", &Widget::setActive);
  (this->*own)(on);
}

int MW::WidgetList::addQueue(int kind, const SKIA_Rect* rect, const SKIA_Point* point,
                             const SKIA_Text* text) {
  sightings.add("item " + std::to_string(kind));
  static const auto own = libraryOwn(
      "_ZN2MW10WidgetList8addQueueEiPK9SKIA_RectPK10SKIA_PointPK9SKIA_Text", &WidgetList::addQueue);
  return own(kind, rect, point, text);
}

void MW::Window::show() {
  static const auto own =
      libraryOwn("_ZN2MW6Window4showEv", static_cast<void (*)()>(&Window::show));
  own();
  sightings.endFrame();
}

int MW::DialogShell::addShell(const char* line) {
  sightings.add(std::string("line ") + line);
  static const auto own = libraryOwn("_ZN2MW11DialogShell8addShellEPKc", &DialogShell::addShell);
  return (this->*own)(line);
}

namespace factory_test {
namespace {

using brimol::test::eventually;

enum class Leave { Page, Look, Keys };  // how the back key leaves it

struct Visit {
  const char* id;
  Leave leave;
  std::vector<std::string> shows;
  std::vector<std::string> next = {};  // what comes with each right key
};

std::vector<std::string> otherDialogs() {
  constexpr int kLast = 39;
  std::vector<std::string> kinds;
  for (int kind = 1; kind <= kLast; ++kind) kinds.push_back("dialog " + std::to_string(kind));
  return kinds;
}

// In the menu's order.
const std::vector<Visit> kVisits = {
    {"colours", Leave::Look, {"MW::FullScreen", "MW::Screen", "MW::Key"}},
    {"brightness", Leave::Page, {"MW::SlideMove"}},
    {"touch", Leave::Look, {"MW::Screen"}},
    {"keys", Leave::Keys, {"MW::Key"}},
    {"pad", Leave::Page, {"MW::Button8", "MW::ButtonNew"}},
    {"keyboard", Leave::Page, {"MW::Ime"}},
    {"buttons", Leave::Page, {"MW::Button", "MW::Button3", "item 0", "item 3", "item 6", "item 7"}},
    {"styles", Leave::Page, {"MW::ButtonS", "MW::ButtonNew"}},
    {"switches", Leave::Page, {"MW::Slide", "MW::SlideV"}},
    {"timed", Leave::Page, {"MW::Toastbox", "MW::Progressbar"}},
    {"exit_slides", Leave::Page, {"MW::SlideE"}},
    {"descriptors",
     Leave::Page,
     {"MW::Button", "MW::Button3", "MW::Dialog", "MW::DialogNew", "MW::FullScreen", "MW::Key",
      "MW::Progressbar", "MW::SlideE", "MW::Toastbox", "item 0", "item 1", "item 3", "item 6"}},
    {"prompts", Leave::Look, {"dialog 0"}, otherDialogs()},
    {"list_choice", Leave::Look, {"MW::DialogList"}},
    {"six_choice", Leave::Look, {"MW::DialogSelect"}},
    {"free_form",
     Leave::Look,
     {"MW::DialogNew"},
     {"MW::DialogNew", "MW::DialogNew", "MW::DialogNew", "MW::DialogSlide"}},
    {"shell", Leave::Look, {"MW::DialogShell", "line two  words", "line [exit code 3]"}},
    {"warnings", Leave::Look, {"MW::DialogWarn"}, {"MW::AutoCapScreen"}},
    {"log", Leave::Page, {"MW::StaticText", "MW::Ime"}},
    {"result_list", Leave::Look, {"MW::MpdWid"}},
};

void expectToShow(const std::string& what) {
  EXPECT_TRUE(eventually([&] { return sightings.has(what); })) << what;
}

void leave(Leave how) {
  sightings.clear();
  User::key(SDLK_ESCAPE);
  if (how == Leave::Look) {
    expectToShow("MW::Button3");
    User::key(SDLK_ESCAPE);
  }
  if (how == Leave::Keys) {
    User::key(SDLK_ESCAPE);
    User::key(SDLK_ESCAPE);
  }
  EXPECT_TRUE(User::seesMenu());
}

void visit(const Visit& page) {
  SCOPED_TRACE(page.id);
  sightings.clear();
  User::start(page.id);
  std::ranges::for_each(page.shows, expectToShow);
  for (const std::string& what : page.next) {
    sightings.clear();
    User::key(SDLK_RIGHT);
    expectToShow(what);
  }
  leave(page.leave);
}

TEST(MenuWalk, ShowsEveryWidgetClassAndDialogKind) {
  const auto isPageOf = [](const Visit& page, const TestEntry& entry) {
    return std::string_view(page.id) == entry.id;
  };
  EXPECT_TRUE(std::ranges::equal(kVisits, testEntries(), isPageOf));
  const int code = runWith({"--shell", "printf 'two\\t words' >&2; sleep 9 & exit 3"},
                           [] { std::ranges::for_each(kVisits, visit); });
  EXPECT_EQ(code, EXIT_SUCCESS);
}

}  // namespace
}  // namespace factory_test
