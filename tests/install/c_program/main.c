/* The entry points for C: what is raised is seen once, and a first finger is told from a second. */
#include <MW/c_api.h>
#include <brimol/host.h>
#include <brimol/scene.h>

int main(void) {
  mw_event_data event = {.type = kEventPress};
  const int first = isFirstFinger_c(&event);
  event.mouse.finger = 1;
  const int second = isFirstFinger_c(&event);
  EventService_AppEvent_c(0);
  const int raised = EventService_GetEvent_c();
  const int again = EventService_GetEvent_c();
  const SKIA_Rect box = {1, 2, 30, 4, 0xFF00FF00U};
  const int queued = MWWList_addQueue_c(SKIA_BOX, &box, 0, 0);
  int width = 0;
  int height = 0;
  if (brimol_host_open() != 1) return 1;
  brimol_host_screen_size(&width, &height);
  return first == 1 && second == 0 && raised == 1 && again == 0 && queued < 0 && width == 400 ? 0
                                                                                              : 2;
}
