#include <MW/c_api.h>
#include <MW/event_service.h>
#include <MW/widget_list.h>
#include <MW/window.h>

int MWWList_addQueue_c(int kind, const SKIA_Rect* rect, const SKIA_Point* point,
                       const SKIA_Text* text) {
  return MW::WidgetList::addQueue(kind, rect, point, text);
}

int isDisplayUpdate_c(int set) { return MW::isDisplayUpdate(set); }

int isFirstFinger_c(const mw_event_data* event) { return MW::isFirstFinger(event) ? 1 : 0; }

int EventService_AppEvent_c(int) {
  MW::isDisplayUpdate(1);
  return 0;
}

int EventService_GetEvent_c(void) { return MW::isDisplayUpdate(0); }
