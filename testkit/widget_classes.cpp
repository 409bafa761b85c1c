#include "widget_classes.h"

#include <MW/MW.h>

#include <array>
#include <utility>

#include "widget_operations.h"

namespace brimol::test {

std::function<void()> whenTold;

namespace {

using Made = std::unique_ptr<MW::Widget>;
using Area = const SKIA_Rect*;
using Text = const SKIA_Text*;
using Chars = const char*;

template <typename Class, typename... Parameters>
Made construct(Arguments& from) {
  Made made;
  const auto call = [&](auto... values) { made = std::make_unique<Class>(values...); };
  callWith<decltype(call), Parameters...>(from, call);
  return made;
}

// Callbacks.

template <typename... Told>
void told(Told...) {
  if (whenTold) whenTold();
}
// Becomes a function of whatever type a callback has.
struct Teller {
  template <typename... Told>
  using Function = void (*)(Told...);
  template <typename... Told>
  operator Function<Told...>() const {  // NOLINT(google-explicit-constructor): assigned
    return told<Told...>;
  }
};
constexpr Teller kTeller;

// The words that do not mean the same in all classes.
template <typename Touched>
void listenToTouches(MW::Widget& widget) {
  widget.pressCallback = widget.clickCallback = widget.longPressCallback = told<Touched>;
}

void listenToBase(MW::Widget& widget) {
  listenToTouches<MW::mouse_event*>(widget);
  widget.hoverCallback = widget.touchPressCallback = widget.touchReleaseCallback =
      told<MW::mouse_event*>;
  widget.doubleClickCallback = widget.button1Callback = widget.button2Callback =
      widget.hookKeyCallback = widget.leftCallback = widget.rightCallback = widget.exitCallback =
          told<int>;
  widget.keyPressCallback = widget.keyReleaseCallback = widget.plugCallback =
      widget.doubleKeyCallback = widget.tripleKeyCallback = told<MW::kbd_event*>;
  widget.rowPressCallback = told<int*>;
}

void listenToButton(MW::Widget& widget) {
  listenToBase(widget);
  listenToTouches<int>(widget);
}
void listenToSlide(MW::Widget& widget) {
  listenToBase(widget);
  widget.doubleClickCallback = told<MW::mouse_event*>;
}
void listenToDialogList(MW::Widget& widget) {
  listenToBase(widget);
  widget.button1Callback = widget.button2Callback = told<int*>;
}
void listenToDialogSlide(MW::Widget& widget) {
  auto& own = static_cast<MW::DialogSlide&>(widget);
  own.leftCallback = own.rightCallback = kTeller;
  own.keyPressCallback = own.keyReleaseCallback = kTeller;
  own.touchPressCallback = own.touchReleaseCallback = own.hoverCallback = kTeller;
}
void listenToDialogSelect(MW::Widget& widget) {
  listenToBase(widget);
  auto& own = static_cast<MW::DialogSelect&>(widget);
  own.choiceCallback = own.touchPressCallback = own.touchReleaseCallback = kTeller;
  own.keyPressCallback = own.keyReleaseCallback = kTeller;
}
void listenToColorPage(MW::Widget& widget) {
  auto& own = static_cast<MW::ColorPage&>(widget);
  own.touchPressCallback = own.touchReleaseCallback = kTeller;
  own.keyPressCallback = own.keyReleaseCallback = kTeller;
  own.doubleKeyCallback = own.tripleKeyCallback = kTeller;
}
void listenToMainList(MW::Widget& widget) {
  auto& own = static_cast<MW::MainList&>(widget);
  own.clickCallback = own.pressCallback = own.releaseCallback = own.scrollCallback = kTeller;
  own.keyPressCallback = own.keyReleaseCallback = kTeller;
}
void listenToMpdWid(MW::Widget& widget) {
  auto& own = static_cast<MW::MpdWid&>(widget);
  own.click_cb = own.press_cb = own.release_cb = own.hover_cb = kTeller;
  own.key_press_cb = own.key_release_cb = kTeller;
}
template <typename Panel>
void listenToPanel(MW::Widget& widget) {
  auto& own = static_cast<Panel&>(widget);
  own.press_cb = own.release_cb = own.long_press_cb = own.double_tap_cb = kTeller;
}

// A descriptor and what it makes, which has its callbacks from it.
class Described : public MW::WidgetRcui {
 public:
  explicit Described(Arguments& from) : Described(Parts(from)) {}

 private:
  struct Parts {
    explicit Parts(Arguments& from) {
      for (SKIA_Text& each : texts) each = from.take<SKIA_Text>();
      ref.kind = from.take<int>();
      ref.dialogKind = from.take<int>();
      ref.visible = from.byte();
      ref.cbIndex = from.byte();
      ref.rect = from.take<SKIA_Rect>();
      ref.lineWidth = from.take<int>();
      ref.text = from.take<SKIA_Text>();
      ref.desc = from.take<bool>() ? texts.data() : nullptr;
      const bool isButton = ref.kind >= MW::kRcuiButton && ref.kind <= MW::kRcuiButton3Right;
      callbacks.cbPress = callbacks.cbClick = callbacks.cbLongPress =
          isButton ? MW::Callback(told<int>) : MW::Callback(told<MW::mouse_event*>);
      callbacks.cbTouchRelease =
          ref.kind == MW::kRcuiKey ? MW::Callback(told<MW::mouse_event*>) : MW::Callback(told<int>);
      callbacks.cbTouchPress = callbacks.cbHover = told<MW::mouse_event*>;
      callbacks.cbDoubleClick = callbacks.cbRight = callbacks.cbExtra = told<int>;
      callbacks.cbKeyPress = callbacks.cbKeyRelease = callbacks.cbDoubleKey =
          callbacks.cbTripleKey = callbacks.cbPlug = told<MW::kbd_event*>;
    }
    std::array<SKIA_Text, 5> texts = {};
    MW::ref_t ref;
    MW::ref_cb_t callbacks;
  };
  explicit Described(Parts&& parts) : WidgetRcui(&parts.ref, &parts.callbacks, 0) {}
};

// What a class has of its own beside the base's handlers.
template <typename Class>
Operations keysOf() {
  return {With<MW::kbd_event>::call(&Class::onPressKey),
          With<MW::kbd_event>::call(&Class::onReleaseKey)};
}
template <typename Class>
Operations touchesOf() {
  return {With<MW::mouse_event>::call(&Class::onPress),
          With<MW::mouse_event>::call(&Class::onRelease),
          With<MW::mouse_event>::call(&Class::onHover)};
}

Operations operator+(Operations left, const Operations& right) {
  left.insert(left.end(), right.begin(), right.end());
  return left;
}

const Operations kOfStyled = {operation(&MW::ButtonNew::setBdWidth)};
const Operations kOfButtons = {operation(&MW::FramedDialog::onBtn1Pressed),
                               operation(&MW::FramedDialog::onBtn2Pressed)};
const Operations kOfFramed = kOfButtons + keysOf<MW::FramedDialog>() +
                             Operations{operation(&MW::FramedDialog::onBtn1Released),
                                        operation(&MW::FramedDialog::onBtn2Released)};
const Operations kOfPrompt = {operation(&MW::PromptDialog::onHookKeyPressed),
                              operation(&MW::PromptDialog::updateProgress)};
const Operations kOfPage =
    Operations{operation(&MW::ColorPage::setBg_title),
               With<unsigned int, SKIA_Rect, SKIA_Text>::call(&MW::ColorPage::setText),
               With<int, int>::call(&MW::ColorPage::setRect),
               operation(&MW::ColorPage::onKeyClickCount)} +
    keysOf<MW::ColorPage>();
const Operations kOfSlide = {With<MW::mouse_event>::call(&MW::Slide::onHover),
                             With<MW::mouse_event>::call(&MW::Slide::onTouchClickCount)};

const std::vector<WidgetClass> kClasses = {
    {"AutoCapScreen",
     construct<MW::AutoCapScreen, unsigned int>,
     listenToColorPage,
     kOfPage + Operations{operation(&MW::AutoCapScreen::setText_str),
                          With<unsigned int>::call(&MW::AutoCapScreen::getText),
                          With<unsigned int>::call(&MW::AutoCapScreen::getTextColor),
                          With<unsigned int, unsigned int>::call(&MW::AutoCapScreen::setTextColor)}},
    {"Box", construct<MW::Box, Area>, listenToBase, {}},
    {"Button", construct<MW::Button, Area, Text>, listenToButton, {}},
    {"Button3",
     construct<MW::Button3, int, Text, Text, int>,
     listenToButton,
     {operation(&MW::Button3::init)}},
    {"Button8",
     construct<MW::Button8, int, Area, Text>,
     listenToBase,
     {operation(&MW::Button8::setBdWidth), operation(&MW::Button8::getRowCol),
      operation(&MW::Button8::getButtonSelect)}},
    {"ButtonNew", construct<MW::ButtonNew, int, Area, Text>, listenToButton, kOfStyled},
    {"ButtonS", construct<MW::ButtonS, int, Area, Text>, listenToButton,
     Operations{operation(&MW::ButtonS::onGetOutOfArea)}},
    {"Dialog",
     construct<MW::Dialog, int>,
     listenToBase,
     kOfFramed + kOfPrompt + keysOf<MW::Dialog>() +
         Operations{operation(&MW::Dialog::onKeyClickCount), With<int>::call(&MW::Dialog::setRect), operation(&MW::Dialog::setTitle),
                    With<Chars>::call(&MW::Dialog::setDesc)}},
    {"DialogList",
     construct<MW::DialogList, Chars>,
     listenToDialogList,
     kOfButtons + keysOf<MW::FramedDialog>() +
         Operations{operation(&MW::DialogList::onBtn1Released),
                            operation(&MW::DialogList::onBtn2Released),
                            operation(&MW::DialogList::init_DialogList),
                            operation(&MW::DialogList::initIndex),
                            operation(&MW::DialogList::addIndex),
                            With<int, Chars>::call(&MW::DialogList::setText),
                            operation(&MW::DialogList::initFinish),
                            operation(&MW::DialogList::setRect_static),
                            operation(&MW::DialogList::position2index),
                            operation(&MW::DialogList::onListPress)}},
    {"DialogNew",
     construct<MW::DialogNew, Chars, int, int, int>,
     listenToBase,
     kOfFramed + kOfPrompt +
         Operations{operation(&MW::DialogNew::DialogNew_init),
                    With<MW::kbd_event>::call(&MW::DialogNew::onPressKey), With<>::call(&MW::DialogNew::setRect),
                    With<Chars, Chars, Chars>::call(&MW::DialogNew::setDesc),
                    operation(&MW::DialogNew::setProgress),
                    operation(&MW::DialogNew::setBackGroundColor),
                    operation(&MW::DialogNew::setDescColor),
                    operation(&MW::DialogNew::setDescBlink)}},
    {"DialogSelect",
     construct<MW::DialogSelect, unsigned int>,
     listenToDialogSelect,
     keysOf<MW::DialogSelect>() + Operations{With<int, int>::call(&MW::DialogSelect::setRect), operation(&MW::DialogSelect::setTitle),
      operation(&MW::DialogSelect::setText_str), operation(&MW::DialogSelect::onBtnPressed),
      operation(&MW::DialogSelect::onBtnReleased), operation(&MW::DialogSelect::onHookKeyPressed)}},
    {"DialogShell",
     construct<MW::DialogShell, Chars, int>,
     listenToBase,
     kOfFramed + Operations{operation(&MW::DialogShell::init_DialogShell),
                            operation(&MW::DialogShell::initShell),
                            operation(&MW::DialogShell::addShell),
                            operation(&MW::DialogShell::setRect_static)}},
    {"DialogSlide",
     construct<MW::DialogSlide, int>,
     listenToDialogSlide,
     keysOf<MW::DialogSlide>() + Operations{operation(&MW::DialogSlide::setRect_init), With<int>::call(&MW::DialogSlide::setRect),
      operation(&MW::DialogSlide::setTitle), With<Chars>::call(&MW::DialogSlide::setDesc),
      operation(&MW::DialogSlide::setDesc2), operation(&MW::DialogSlide::setLeft),
      operation(&MW::DialogSlide::setRight), operation(&MW::DialogSlide::setSlide),
      operation(&MW::DialogSlide::onSlidePressed), operation(&MW::DialogSlide::onSlideHover),
      operation(&MW::DialogSlide::onSlideReleased)}},
    {"DialogWarn", construct<MW::DialogWarn, unsigned int>, listenToColorPage,
     kOfPage + Operations{operation(&MW::DialogWarn::setText_str)}},
    {"FullScreen",
     construct<MW::FullScreen, int>,
     listenToBase,
     {With<int>::call(&MW::FullScreen::setRect)}},
    {"Image", construct<MW::Image, Area, Text>, listenToBase, {}},
    {"Ime",
     construct<MW::Ime, Area, Text>,
     listenToPanel<MW::Ime>,
     {operation(&MW::Ime::getResultString), operation(&MW::Ime::setResultString),
      operation(&MW::Ime::typing_reset), operation(&MW::Ime::presskey_set),
      operation(&MW::Ime::keyboard_change), operation(&MW::Ime::get_fold_status),
      operation(&MW::Ime::set_fold_status), operation(&MW::Ime::onPressKey_small),
      operation(&MW::Ime::onPressKey_big), operation(&MW::Ime::onPressKey_special),
      operation(&MW::Ime::onPressKey_only_num), With<MW::mouse_event>::call(&MW::Ime::onHover)}},
    {"Key", construct<MW::Key>, listenToBase, keysOf<MW::Key>() + Operations{operation(&MW::Key::onKeyClickCount), With<MW::mouse_event>::call(&MW::Key::onPressLong)}},
    {"Label", construct<MW::Label, Area, Text>, listenToBase, {}},
    {"Line", construct<MW::Line, const SKIA_Point*>, listenToBase, {}},
    {"MainList",
     construct<MW::MainList, Chars, int>,
     listenToMainList,
     keysOf<MW::MainList>() + touchesOf<MW::MainList>() + Operations{operation(&MW::MainList::init_MainList), With<int>::call(&MW::MainList::setRect),
      operation(&MW::MainList::initIndex), operation(&MW::MainList::addIndex),
      operation(&MW::MainList::initFinish), operation(&MW::MainList::Max_height),
      With<int, Chars, unsigned int>::call(&MW::MainList::setText),
      With<int, int>::call(&MW::MainList::setFontSize),
      With<int, unsigned int>::call(&MW::MainList::setTextColor),
      operation(&MW::MainList::setBGColor), operation(&MW::MainList::setListType),
      operation(&MW::MainList::setTextOption), counted(&MW::MainList::setTextBattery),
      counted(&MW::MainList::setTextTa), counted(&MW::MainList::setTextBrightness),
      operation(&MW::MainList::setTitleBGColor), operation(&MW::MainList::inClick),
      operation(&MW::MainList::position2index), operation(&MW::MainList::move_key_down),
      operation(&MW::MainList::move_key_up)}},
    {"MpdWid",
     construct<MW::MpdWid, Chars>,
     listenToMpdWid,
     keysOf<MW::MpdWid>() + touchesOf<MW::MpdWid>() + Operations{operation(&MW::MpdWid::init_MpdWid), With<>::call(&MW::MpdWid::setRect),
      operation(&MW::MpdWid::initIndex), counted(&MW::MpdWid::cal_line),
      operation(&MW::MpdWid::addIndex), operation(&MW::MpdWid::init_mpd_buf),
      operation(&MW::MpdWid::setBGColor), operation(&MW::MpdWid::setListType),
      operation(&MW::MpdWid::Max_height), operation(&MW::MpdWid::onHover_temp),
      operation(&MW::MpdWid::inClick), operation(&MW::MpdWid::depth_cal),
      operation(&MW::MpdWid::onMpdPress), operation(&MW::MpdWid::onMpdRelease),
      operation(&MW::MpdWid::position2index),
      With<MW::event_data*>::call(&MW::MpdWid::onTouchClickCount),
      operation(&MW::MpdWid::control_context),
      With<int, Chars, unsigned int>::call(&MW::MpdWid::setText),
      With<int, int>::call(&MW::MpdWid::setFontSize),
      With<int, int>::call(&MW::MpdWid::setTextColor)}},
    {"Progressbar", construct<MW::Progressbar, int, Area, Text>, listenToBase, {}},
    {"Screen", construct<MW::Screen>, listenToBase, {}},
    {"Slide", construct<MW::Slide, int, Area, Text, Text>, listenToSlide, kOfSlide},
    {"SlideE",
     [](Arguments& from) -> Made {
       const int state = from.take<int>();
       const Area area = from.take<Area>();
       return std::make_unique<MW::SlideE>(state, area, from.take<Text>(), nullptr);
     },
     listenToBase,
     touchesOf<MW::SlideE>() + Operations{operation(&MW::SlideE::SlideE_init)}},
    {"SlideMove",
     construct<MW::SlideMove, Area, int, int, int, int>,
     listenToBase,
     {With<MW::mouse_event>::call(&MW::SlideMove::onHover), With<Area>::call(&MW::SlideMove::setRect), operation(&MW::SlideMove::setRect_Slide),
      operation(&MW::SlideMove::getValue), operation(&MW::SlideMove::setValue),
      operation(&MW::SlideMove::setMove2Value), operation(&MW::SlideMove::setValue2Move)}},
    {"SlideV", construct<MW::SlideV, int, Area, Text, Text>, listenToSlide, kOfSlide},
    {"StaticText",
     construct<MW::StaticText, Area, Text, bool, bool, bool>,
     listenToPanel<MW::StaticText>,
     {operation(&MW::StaticText::init), operation(&MW::StaticText::get_ime_result),
      operation(&MW::StaticText::line_search), operation(&MW::StaticText::line_search_point),
      operation(&MW::StaticText::find_real_num),
      With<MW::mouse_event>::call(&MW::StaticText::onHover)}},
    {"Textbox", construct<MW::Textbox, Area, Text>, listenToBase, {}},
    {"Toastbox",
     construct<MW::Toastbox, Area, Text, Text>,
     listenToBase,
     {operation(&MW::Toastbox::init)}},
    {"WidgetRcui",
     [](Arguments& from) -> Made { return std::make_unique<Described>(from); },
     listenToBase,
     {operation(&MW::WidgetRcui::getPointer)}},
};

}  // namespace

const std::vector<WidgetClass>& widgetClasses() { return kClasses; }

}  // namespace brimol::test
