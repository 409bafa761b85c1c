#include "widget_classes.h"

#include <MW/MW.h>

#include <array>
#include <tuple>
#include <utility>

#include "listeners.h"

namespace brimol::test {

namespace {

using Made = std::unique_ptr<MW::Widget>;
using Operations = std::vector<Operation>;
using Area = const SKIA_Rect*;
using Text = const SKIA_Text*;
using Chars = const char*;

template <typename Callee, typename... Parameters>
void callWith(Arguments& from, const Callee& callee) {
  std::tuple<std::remove_cvref_t<Parameters>...> values{from.take<Parameters>()...};
  std::apply(callee, std::move(values));
}

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
// One of several of a name, told by its parameters.
template <typename... Parameters>
struct With {
  template <typename Class, typename Result>
  static Operation call(Result (Class::*member)(Parameters...)) {
    return operation(member);
  }
};
// A text with the number of its bytes, in which the callee trusts.
template <typename Class>
Operation counted(void (Class::*member)(Chars, int)) {
  return [member](MW::Widget& widget, Arguments& from) {
    const std::string text = from.bytes();
    (static_cast<Class&>(widget).*member)(text.c_str(), from.take<int>());
  };
}

template <typename Class, typename... Parameters>
Made construct(Arguments& from) {
  Made made;
  const auto call = [&](auto... values) { made = std::make_unique<Class>(values...); };
  callWith<decltype(call), Parameters...>(from, call);
  return made;
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

const Operations kOfStyled = {operation(&MW::ButtonNew::setBdWidth)};
const Operations kOfFramed = {
    operation(&MW::FramedDialog::onBtn1Pressed), operation(&MW::FramedDialog::onBtn2Pressed),
    operation(&MW::FramedDialog::onBtn1Released), operation(&MW::FramedDialog::onBtn2Released)};
const Operations kOfPrompt = {operation(&MW::PromptDialog::onHookKeyPressed),
                              operation(&MW::PromptDialog::updateProgress)};
const Operations kOfPage = {operation(&MW::ColorPage::setBg_title),
                            With<unsigned int, SKIA_Rect, SKIA_Text>::call(&MW::ColorPage::setText),
                            With<MW::kbd_event>::call(&MW::ColorPage::onReleaseKey),
                            operation(&MW::ColorPage::onKeyClickCount)};
const Operations kOfSlide = {With<MW::mouse_event>::call(&MW::Slide::onHover),
                             With<MW::mouse_event>::call(&MW::Slide::onTouchClickCount)};

Operations operator+(Operations left, const Operations& right) {
  left.insert(left.end(), right.begin(), right.end());
  return left;
}

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
     kOfFramed + kOfPrompt +
         Operations{With<int>::call(&MW::Dialog::setRect), operation(&MW::Dialog::setTitle),
                    With<Chars>::call(&MW::Dialog::setDesc)}},
    {"DialogList",
     construct<MW::DialogList, Chars>,
     listenToDialogList,
     Operations{operation(&MW::FramedDialog::onBtn1Pressed),
                            operation(&MW::FramedDialog::onBtn2Pressed),
                            operation(&MW::DialogList::onBtn1Released),
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
         Operations{operation(&MW::DialogNew::DialogNew_init), With<>::call(&MW::DialogNew::setRect),
                    With<Chars, Chars, Chars>::call(&MW::DialogNew::setDesc),
                    operation(&MW::DialogNew::setProgress),
                    operation(&MW::DialogNew::setBackGroundColor),
                    operation(&MW::DialogNew::setDescColor),
                    operation(&MW::DialogNew::setDescBlink)}},
    {"DialogSelect",
     construct<MW::DialogSelect, unsigned int>,
     listenToDialogSelect,
     {With<int, int>::call(&MW::DialogSelect::setRect), operation(&MW::DialogSelect::setTitle),
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
     {operation(&MW::DialogSlide::setRect_init), With<int>::call(&MW::DialogSlide::setRect),
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
     listenToIme,
     {operation(&MW::Ime::getResultString), operation(&MW::Ime::setResultString),
      operation(&MW::Ime::typing_reset), operation(&MW::Ime::presskey_set),
      operation(&MW::Ime::keyboard_change), operation(&MW::Ime::get_fold_status),
      operation(&MW::Ime::set_fold_status), operation(&MW::Ime::onPressKey_small),
      operation(&MW::Ime::onPressKey_big), operation(&MW::Ime::onPressKey_special),
      operation(&MW::Ime::onPressKey_only_num), With<MW::mouse_event>::call(&MW::Ime::onHover)}},
    {"Key", construct<MW::Key>, listenToBase, {operation(&MW::Key::onKeyClickCount)}},
    {"Label", construct<MW::Label, Area, Text>, listenToBase, {}},
    {"Line", construct<MW::Line, const SKIA_Point*>, listenToBase, {}},
    {"MainList",
     construct<MW::MainList, Chars, int>,
     listenToMainList,
     {operation(&MW::MainList::init_MainList), With<int>::call(&MW::MainList::setRect),
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
     {operation(&MW::MpdWid::init_MpdWid), With<>::call(&MW::MpdWid::setRect),
      operation(&MW::MpdWid::initIndex), counted(&MW::MpdWid::cal_line),
      operation(&MW::MpdWid::addIndex), operation(&MW::MpdWid::init_mpd_buf),
      operation(&MW::MpdWid::setBGColor), operation(&MW::MpdWid::setListType),
      operation(&MW::MpdWid::Max_height), operation(&MW::MpdWid::onHover_temp),
      operation(&MW::MpdWid::inClick), operation(&MW::MpdWid::depth_cal),
      operation(&MW::MpdWid::onMpdPress), operation(&MW::MpdWid::onMpdRelease),
      operation(&MW::MpdWid::position2index)}},
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
     {operation(&MW::SlideE::SlideE_init)}},
    {"SlideMove",
     construct<MW::SlideMove, Area, int, int, int, int>,
     listenToBase,
     {With<Area>::call(&MW::SlideMove::setRect), operation(&MW::SlideMove::setRect_Slide),
      operation(&MW::SlideMove::getValue), operation(&MW::SlideMove::setValue),
      operation(&MW::SlideMove::setMove2Value), operation(&MW::SlideMove::setValue2Move)}},
    {"SlideV", construct<MW::SlideV, int, Area, Text, Text>, listenToSlide, kOfSlide},
    {"StaticText",
     construct<MW::StaticText, Area, Text, bool, bool, bool>,
     listenToStaticText,
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

using MW::Widget;
const Operations kBase = {
    operation(&Widget::onRecvEvent),
    With<>::call(&Widget::show),
    With<unsigned int>::call(&Widget::show),
    operation(&Widget::updateTimer),
    operation(&Widget::hide),
    operation(&Widget::setActive),
    operation(&Widget::getText),
    operation(&Widget::getBgColor),
    operation(&Widget::getTextColor),
    operation(&Widget::getFontSize),
    operation(&Widget::getPositionAndSize),
    operation(&Widget::setFontSize),
    operation(&Widget::setText),
    operation(&Widget::setTextAlign),
    operation(&Widget::setTextColor),
    operation(&Widget::setBgColor),
    operation(&Widget::setBdColor),
    operation(&Widget::setLnColor),
    operation(&Widget::onShowTimer),
    operation(&Widget::add_MWWList),
    operation(&Widget::lcdOn),
    operation(&Widget::onHideTimer),
    operation(&Widget::setRect),
    operation(&Widget::setMsg),
    operation(&Widget::onTouchClickCount),
    operation(&Widget::setTimer),
    operation(&Widget::onProgressbar),
    operation(&Widget::restoreColor),
    operation(&Widget::Lock),
    operation(&Widget::unLock),
    operation(&Widget::setDesc),
    operation(&Widget::setbutton),
    operation(&Widget::setSelect),
    operation(&Widget::setType),
    operation(&Widget::setId),
    operation(&Widget::setButtonType),
    operation(&Widget::setOwnerFinger),
    operation(&Widget::setBlink),
    operation(&Widget::updateBlink),
    operation(&Widget::move_key_select),
};

}  // namespace

const std::vector<WidgetClass>& widgetClasses() { return kClasses; }
const std::vector<Operation>& baseOperations() { return kBase; }

}  // namespace brimol::test
