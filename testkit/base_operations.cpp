#include "widget_operations.h"

namespace brimol::test {

namespace {

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
    operation(&Widget::onHover),
    operation(&Widget::onPress),
    operation(&Widget::onRelease),
    operation(&Widget::onPressLong),
    operation(&Widget::onPressKey),
    operation(&Widget::onReleaseKey),
    operation(&Widget::onPlugKey),
    operation(&Widget::onPressTouch),
    operation(&Widget::onReleaseTouch),
};

}  // namespace

const std::vector<Operation>& baseOperations() { return kBase; }

}  // namespace brimol::test
