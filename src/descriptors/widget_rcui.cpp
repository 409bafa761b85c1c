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

using Made = std::unique_ptr<Widget>;

template <typename Class, typename... Arguments>
Made make(Arguments... arguments) {
  return Made(new (std::nothrow) Class(arguments...));
}

void complain(const char* what) { kLog.print(LogLevel::Error, "WidgetRcui -> %s", what); }

// A copy that stays within its record, whatever the descriptor says. NULs before its length stay.
SKIA_Text soundText(const SKIA_Text& given) {
  SKIA_Text text = given;
  if (std::ranges::count(given.text, '\0') == 0) {
    complain("text has no NUL");
    putText(text, boundedText(given.text));
    text.string_len = given.string_len;
  }
  if (given.string_len < 0 || given.string_len > kTextMax) {
    kLog.print(LogLevel::Error, "WidgetRcui -> text length is bad : %d", given.string_len);
    putText(text, boundedText(given.text));
  }
  return text;
}

Made makeDialog(const ref_t& from) { return make<Dialog>(from.dialogKind); }

// One of the five texts as a C string of at most 126 bytes; null where its length is 0.
class DialogText {
 public:
  explicit DialogText(const SKIA_Text& given) : isGiven(given.string_len != 0) {
    constexpr std::size_t kMost = kTextMax - 1;
    if (!isGiven) return;
    text = soundText(given);
    putText(text, cutText({text.text, static_cast<std::size_t>(text.string_len)}, kMost));
  }
  const char* words() const { return isGiven ? text.text : nullptr; }
  int align() const { return isGiven ? text.align : SKIA_ALIGN_LEFT; }

 private:
  bool isGiven;
  SKIA_Text text = {};
};

void describe(Widget& dialog, const SKIA_Text* desc) {
  const DialogText line1(desc[0]);
  const DialogText line2(desc[1]);
  const DialogText line3(desc[2]);
  const DialogText caption1(desc[3]);
  const DialogText caption2(desc[4]);
  dialog.setDesc(line1.words(), line2.words(), line3.words(), line1.align());
  dialog.setbutton(caption1.words(), caption2.words());
}

Made makeDialogNew(const ref_t& from) {
  const SKIA_Text title = soundText(from.text);
  Made made = make<DialogNew>(title.text, title.align, static_cast<int>(title.color));
  if (made != nullptr && from.desc != nullptr) describe(*made, from.desc);
  return made;
}

Made makeButton(const ref_t& from) {
  const SKIA_Text caption = soundText(from.text);
  return make<Button>(&from.rect, &caption);
}

template <int position>
Made makeButton3(const ref_t& from) {
  const SKIA_Text caption = soundText(from.text);
  return make<Button3>(position, &caption, from.rect.y);
}

template <int fromSide>
Made makeSlide(const ref_t& from) {
  constexpr std::array kFiles = {"/vendor/data/640_slidebtn.png",
                                 "/vendor/data/640_slidebtn_reverse.png"};  // not read
  const SKIA_Text caption = soundText(from.text);
  return make<SlideE>(fromSide, &from.rect, &caption, kFiles.at(fromSide));
}

Made makeToastbox(const ref_t& from) {
  const SKIA_Text line = soundText(from.text);
  const SKIA_Text* const desc = from.desc;
  if (desc == nullptr || desc->string_len == 0) return make<Toastbox>(&from.rect, &line);
  const SKIA_Text message = soundText(*desc);
  return make<Toastbox>(&from.rect, &line, &message);
}

Made makeFullScreen(const ref_t&) { return make<FullScreen>(0); }

Made makeProgressbar(const ref_t& from) {
  const SKIA_Text caption = soundText(from.text);
  return make<Progressbar>(0, &from.rect, &caption);
}

Made makeKey(const ref_t&) { return make<Key>(); }

struct InterfaceKind {
  int kind;
  Made (*make)(const ref_t& from);
};

// Ascending by kind; the kinds between build nothing.
constexpr auto kInterfaceKinds = std::to_array<InterfaceKind>({
    {kRcuiDialog, makeDialog},
    {kRcuiDialogNew, makeDialogNew},
    {kRcuiButton, makeButton},
    {kRcuiButton3Left, makeButton3<1>},
    {kRcuiButton3Centre, makeButton3<5>},
    {kRcuiButton3Right, makeButton3<2>},
    {kRcuiSlideFromLeft, makeSlide<0>},
    {kRcuiSlideFromRight, makeSlide<1>},
    {kRcuiToastbox, makeToastbox},
    {kRcuiFullScreen, makeFullScreen},
    {kRcuiProgressbar, makeProgressbar},
    {kRcuiKey, makeKey},
});
static_assert(std::ranges::is_sorted(kInterfaceKinds, {}, &InterfaceKind::kind));
constexpr int kFirstInterface = kRcuiDialog;
constexpr int kLastInterface = 42;

enum class Caption { Unread, Read };
enum class Column { None, Continue, Begin };
struct ItemKind {
  int type;
  Caption caption;
  Column column;  // where the item stands while it is visible
};
constexpr int kPlatformsOwn = 14;  // a type of which the platform alone knows the look
constexpr int kTypeLimit = 15;

// By kind.
constexpr auto kItemKinds = std::to_array<ItemKind>({
    {SKIA_TEXTBOX, Caption::Read, Column::None},
    {kPlatformsOwn, Caption::Unread, Column::None},
    {SKIA_BOX, Caption::Unread, Column::None},
    {kPlatformsOwn, Caption::Unread, Column::None},
    {SKIA_LINE, Caption::Unread, Column::None},
    {SKIA_IMAGE, Caption::Read, Column::None},
    {kPlatformsOwn, Caption::Unread, Column::None},
    {kPlatformsOwn, Caption::Unread, Column::Continue},
    {kPlatformsOwn, Caption::Unread, Column::Begin},
    {SKIA_LABEL, Caption::Read, Column::None},
});
static_assert(kItemKinds.size() == kFirstInterface);
constexpr ItemKind kStacked = {SKIA_TEXTBOX, Caption::Read, Column::None};
constexpr ItemKind kRefused = {kTypeLimit, Caption::Unread, Column::None};

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
  } else if (ref->kind <= kLastInterface) {
    makeRcuiInterface(ref, cb, unused);
  }
}

WidgetRcui::~WidgetRcui() { leaveLayers(); }

int WidgetRcui::makeRcuiWidget(const ref_t* ref, unsigned int) {
  if (ref == nullptr) {
    complain("ref is NULL");
    return 0;
  }
  ItemKind item = itemKind(ref->kind);
  if (item.type >= kTypeLimit) {
    kLog.print(LogLevel::Debug, "makeRcuiWidget item(%d) iyys not allow", ref->kind);
    return 0;
  }
  rect = ref->rect;
  point = {rect.x, rect.y, rect.w, rect.h, rect.color, ref->lineWidth};
  if (item.column != Column::None && ref->visible != 0) {
    rect = placeInColumn(rect, item.column);
    item = kStacked;
  }
  const SKIA_Text caption = item.caption == Caption::Read ? soundText(ref->text) : ref->text;
  return MWWList_addQueue_c(item.type, &rect, &point, &caption);
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
  Made made = row->make(*ref);
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
