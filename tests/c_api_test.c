/* Every header for C, as C sees it. */
#include "c_api_test.h"

#include <MW/c_api.h>
#include <brimol/display.h>
#include <brimol/frame.h>
#include <brimol/host.h>
#include <brimol/input.h>
#include <brimol/properties.h>
#include <brimol/scene.h>

int addBoxFromC(int width) {
  const SKIA_Rect rect = {1, 2, width, 4, 0xFF00FF00U};
  return MWWList_addQueue_c(SKIA_BOX, &rect, 0, 0);
}

int raiseFlagFromC(void) { return EventService_AppEvent_c(0) + isDisplayUpdate_c(0); }

int takeFlagFromC(void) { return isDisplayUpdate_c(1) + EventService_GetEvent_c(); }

int isFirstFingerFromC(int type, unsigned int finger) {
  mw_event_data event = {.type = type};
  event.mouse.finger = finger;
  return isFirstFinger_c(&event);
}
