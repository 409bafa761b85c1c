#include <MW/button.h>
#include <MW/button3.h>
#include <MW/c_api.h>
#include <MW/dialog.h>
#include <MW/dialog_new.h>
#include <MW/key.h>
#include <MW/screen.h>
#include <MW/slide_e.h>
#include <MW/timed.h>
#include <MW/widget_rcui.h>

#include <algorithm>
#include <array>
#include <new>
#include <optional>
#include <utility>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/geometry.h"

namespace MW {

namespace {

constexpr ClassLog kLog("WIDGETRCUI");

constexpr std::size_t kDescTexts = 5;

using Made = std::unique_ptr<Widget>;

template <typename Class, typename... Arguments>
Made make(Arguments... arguments) {
  return Made(new (std::nothrow) Class(arguments...));
}

void complain(const char* what) { kLog.print(LogLevel::Error, "WidgetRcui -> %s", what); }

bool isSound(const SKIA_Text& given, int length) {
  return given.string_len >= 0 && given.string_len <= length;
}

// A copy that holds what its length says, whatever the descriptor says.
SKIA_Text soundText(const SKIA_Text& given) {
  SKIA_Text text = copyText(&given);
  if (std::ranges::count(given.text, '\0') == 0) complain("text has no NUL");
  if (isSound(given, text.string_len)) {
    text.string_len = given.string_len;
  } else {
    kLog.print(LogLevel::Error, "WidgetRcui -> text length is bad : %d", given.string_len);
  }
  return text;
}

// What a maker reads: the descriptor's records by themselves, and its text made sound.
struct Parts {
  int dialogKind;
  SKIA_Rect rect;
  SKIA_Text text;
  const SKIA_Text* desc;
};

Made makeDialog(const Parts& from) { return make<Dialog>(from.dialogKind); }

// A copy of at most 126 bytes.
SKIA_Text dialogText(const SKIA_Text& given) {
  constexpr std::size_t kMost = kTextMax - 1;
  SKIA_Text text = soundText(given);
  putText(text, cutText({text.text, static_cast<std::size_t>(text.string_len)}, kMost));
  return text;
}

const char* orNone(const SKIA_Text& text) { return text.string_len != 0 ? text.text : nullptr; }

// The texts are the three lines and the two captions; an empty one is none.
void describe(Widget& dialog, const SKIA_Text* desc) {
  std::array<SKIA_Text, kDescTexts> texts;
  std::transform(desc, desc + kDescTexts, texts.begin(), dialogText);
  const auto& [line1, line2, line3, caption1, caption2] = texts;
  const int align = line1.string_len != 0 ? line1.align : SKIA_ALIGN_LEFT;
  dialog.setDesc(orNone(line1), orNone(line2), orNone(line3), align);
  dialog.setbutton(orNone(caption1), orNone(caption2));
}

Made makeDialogNew(const Parts& from) {
  Made made = make<DialogNew>(from.text.text, from.text.align, static_cast<int>(from.text.color));
  if (made != nullptr && from.desc != nullptr) describe(*made, from.desc);
  return made;
}

Made makeButton(const Parts& from) { return make<Button>(&from.rect, &from.text); }

template <int position>
Made makeButton3(const Parts& from) {
  return make<Button3>(position, &from.text, from.rect.y);
}

// The picture files are not read.
Made makeSlideFromLeft(const Parts& from) {
  return make<SlideE>(0, &from.rect, &from.text, "/vendor/data/640_slidebtn.png");
}
Made makeSlideFromRight(const Parts& from) {
  return make<SlideE>(1, &from.rect, &from.text, "/vendor/data/640_slidebtn_reverse.png");
}

Made makeToastbox(const Parts& from) {
  if (from.desc != nullptr) {
    const SKIA_Text message = soundText(*from.desc);
    if (message.string_len != 0) return make<Toastbox>(&from.rect, &from.text, &message);
  }
  return make<Toastbox>(&from.rect, &from.text);
}

Made makeFullScreen(const Parts&) { return make<FullScreen>(0); }
Made makeProgressbar(const Parts& from) { return make<Progressbar>(0, &from.rect, &from.text); }
Made makeKey(const Parts&) { return make<Key>(); }

struct InterfaceKind {
  int kind;
  Made (*make)(const Parts& from);
};

// Ascending by kind; the kinds between build nothing.
constexpr auto kInterfaceKinds = std::to_array<InterfaceKind>({
    {10, makeDialog},
    {14, makeDialogNew},
    {15, makeButton},
    {17, makeButton3<1>},
    {18, makeButton3<5>},
    {19, makeButton3<2>},
    {21, makeSlideFromLeft},
    {22, makeSlideFromRight},
    {23, makeToastbox},
    {24, makeFullScreen},
    {25, makeProgressbar},
    {26, makeKey},
});
static_assert(std::ranges::is_sorted(kInterfaceKinds, {}, &InterfaceKind::kind));
constexpr int kFirstInterface = 10;
constexpr int kLastInterface = 42;

// By kind. The types are not the numbers of the pictures that they are named after: meant so.
enum class Column { None, Continue, Begin };
struct ItemKind {
  int type;
  Column column;  // where the item stands while it is visible
};
constexpr int kStackedType = 1;
constexpr int kTypeLimit = 15;
constexpr auto kItemKinds = std::to_array<ItemKind>({
    {1, Column::None},
    {14, Column::None},
    {3, Column::None},
    {14, Column::None},
    {6, Column::None},
    {7, Column::None},
    {14, Column::None},
    {14, Column::Continue},
    {14, Column::Begin},
    {0, Column::None},
});
static_assert(kItemKinds.size() == kFirstInterface);
constexpr ItemKind kRefused = {kTypeLimit, Column::None};

ItemKind itemKind(int kind) {
  const auto row = static_cast<std::size_t>(kind);
  return row < kItemKinds.size() ? kItemKinds.at(row) : kRefused;
}

// Where the next item of the column stands, or nothing before the first. One thread.
constinit std::optional<SKIA_Rect> nextInColumn;

SKIA_Rect placeInColumn(const SKIA_Rect& own, Column column) {
  if (column == Column::Begin) nextInColumn.reset();
  const SKIA_Rect place = nextInColumn.value_or(own);
  nextInColumn = makeRect(place.x, int64_t{place.y} + place.h, place.w, place.h, place.color);
  return place;
}

// The widget's word, and what it gets; word 9 of the descriptor goes nowhere.
struct CallbackCopy {
  Callback Widget::*to;
  Callback ref_cb_t::*from;
};
constexpr auto kCallbackCopies = std::to_array<CallbackCopy>({
    {&Widget::pressCallback, &ref_cb_t::cbPress},
    {&Widget::hoverCallback, &ref_cb_t::cbHover},
    {&Widget::clickCallback, &ref_cb_t::cbClick},
    {&Widget::longPressCallback, &ref_cb_t::cbLongPress},
    {&Widget::doubleClickCallback, &ref_cb_t::cbDoubleClick},
    {&Widget::callbackWord5, &ref_cb_t::cbTouchPress},
    {&Widget::keyPressCallback, &ref_cb_t::cbKeyPress},
    {&Widget::keyReleaseCallback, &ref_cb_t::cbKeyRelease},
    {&Widget::plugCallback, &ref_cb_t::cbPlug},
    {&Widget::doubleKeyCallback, &ref_cb_t::cbDoubleKey},
    {&Widget::tripleKeyCallback, &ref_cb_t::cbTripleKey},
    {&Widget::touchPressCallback, &ref_cb_t::cbTouchPress},
    {&Widget::touchReleaseCallback, &ref_cb_t::cbTouchRelease},
    {&Widget::button1Callback, &ref_cb_t::cbTouchRelease},
    {&Widget::button2Callback, &ref_cb_t::cbRight},
    {&Widget::hookKeyCallback, &ref_cb_t::cbExtra},
    {&Widget::rowPressCallback, &ref_cb_t::cbTouchPress},
    {&Widget::callbackWord17, &ref_cb_t::cbTouchRelease},
    {&Widget::callbackWord18, &ref_cb_t::cbRight},
    {&Widget::leftCallback, &ref_cb_t::cbTouchRelease},
    {&Widget::rightCallback, &ref_cb_t::cbRight},
    {&Widget::exitCallback, &ref_cb_t::cbTouchRelease},
});
static_assert(kCallbackCopies.size() == 22, "every callback word of the base");

}  // namespace

WidgetRcui::WidgetRcui(ref_t* ref, const ref_cb_t* cb, unsigned int unused) {
  if (ref == nullptr) {
    complain("ref is NULL");
  } else if (ref->kind >= 0 && ref->kind < kFirstInterface) {
    ref->index = makeRcuiWidget(ref, unused);
  } else {
    makeRcuiInterface(ref, cb, unused);
  }
}

WidgetRcui::~WidgetRcui() { leaveLayers(); }

int WidgetRcui::makeRcuiWidget(const ref_t* ref, unsigned int) {
  if (ref == nullptr) {
    complain("ref is NULL");
    return 0;
  }
  auto [type, column] = itemKind(ref->kind);
  if (type >= kTypeLimit) {
    kLog.print(LogLevel::Debug, "makeRcuiWidget item(%d) iyys not allow", ref->kind);
    return 0;
  }
  rect = ref->rect;
  point = {rect.x, rect.y, rect.w, rect.h, rect.color, ref->lineWidth};
  if (column != Column::None && ref->visible != 0) {
    rect = placeInColumn(rect, column);
    type = kStackedType;
  }
  const SKIA_Text caption = soundText(ref->text);
  return MWWList_addQueue_c(type, &rect, &point, &caption);
}

void WidgetRcui::makeRcuiInterface(const ref_t* ref, const ref_cb_t* cb, unsigned int unused) {
  if (ref == nullptr) {
    complain("ref is NULL");
    return;
  }
  if (ref->kind < kFirstInterface || ref->kind > kLastInterface) {
    kLog.print(LogLevel::Error, "WidgetRcui -> kind is unknown : %d", ref->kind);
    return;
  }
  const auto row = std::ranges::find(kInterfaceKinds, ref->kind, &InterfaceKind::kind);
  if (row == kInterfaceKinds.end()) return;
  Made made = row->make({ref->dialogKind, ref->rect, soundText(ref->text), ref->desc});
  if (made == nullptr) return;
  made->setActive(0);  // a Key is active already, and its callbacks are still to come
  w = std::move(made);
  if (ref->cbIndex != 0) registerCallBack(cb, ref->cbIndex, unused);
  w->setActive(ref->visible != 0 ? 1 : 0);
}

void WidgetRcui::registerCallBack(const ref_cb_t* cb, unsigned char cbIndex, unsigned int) {
  kLog.print(LogLevel::Debug, "WidgetRcui::registerCallBack() // cb_index = %d ", cbIndex);
  if (cb == nullptr) {
    kLog.print(LogLevel::Debug, "WidgetRcui -> ref_cb is NULL : %d ", cbIndex);
  } else if (w == nullptr) {
    kLog.print(LogLevel::Debug, "WidgetRcui -> w is NULL : %d ", cbIndex);
  } else {
    for (const auto& [to, from] : kCallbackCopies) (*w).*to = cb->*from;
  }
}

Widget* WidgetRcui::getPointer() const {
  if (w == nullptr) kLog.print(LogLevel::Debug, "getPointer -> w is null.");
  return w.get();
}

}  // namespace MW
