// Every header for C, as C sees it.
#include <MW/c_api.h>
#include <brimol/display.h>
#include <brimol/frame.h>
#include <brimol/host.h>
#include <brimol/input.h>
#include <brimol/properties.h>
#include <brimol/scene.h>

void callFromC(int results[5]);

// What the entry points answer.
void callFromC(int results[5]) {
  const SKIA_Rect rect = {1, 2, 33, 4, 0xFF00FF00U};
  mw_event_data event = {.type = 2};
  results[0] = MWWList_addQueue_c(SKIA_BOX, &rect, 0, 0);
  results[1] = EventService_AppEvent_c(0) + isDisplayUpdate_c(0);  // raised, and taken
  results[2] = isDisplayUpdate_c(1) + EventService_GetEvent_c();
  results[3] = isFirstFinger_c(&event);
  event.mouse.finger = 1;
  results[4] = isFirstFinger_c(&event) + isFirstFinger_c(0);
}
