/// Gives the callbacks of each class of widgets a function that calls whenTold().
#pragma once

#include "widget_classes.h"

namespace brimol::test {

/// The function.
template <typename... Told>
void told(Told...) {
  if (whenTold) whenTold();
}

void listenToBase(MW::Widget& widget);
void listenToButton(MW::Widget& widget);
void listenToSlide(MW::Widget& widget);
void listenToDialogList(MW::Widget& widget);
void listenToDialogSlide(MW::Widget& widget);
void listenToDialogSelect(MW::Widget& widget);
void listenToColorPage(MW::Widget& widget);
void listenToMainList(MW::Widget& widget);
void listenToMpdWid(MW::Widget& widget);
void listenToIme(MW::Widget& widget);
void listenToStaticText(MW::Widget& widget);

}  // namespace brimol::test
