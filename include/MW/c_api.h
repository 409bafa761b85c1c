/// The toolkit's entry points for C. Any thread, but for MWWList_addQueue_c: as WidgetList.
#pragma once

#include <MW/api.h>
#include <MW/records.h>

#ifdef __cplusplus
extern "C" {
typedef MW::event_data mw_event_data;  // NOLINT(modernize-use-using): read by C as well
#else
typedef struct event_data mw_event_data;
#endif

/// MW::WidgetList::addQueue.
MW_API int MWWList_addQueue_c(int kind, const SKIA_Rect* rect, const SKIA_Point* point,
                              const SKIA_Text* text);
/// MW::isDisplayUpdate.
MW_API int isDisplayUpdate_c(int set);
/// MW::isFirstFinger, as 1 or 0.
MW_API int isFirstFinger_c(const mw_event_data* event);
/// Raises the redraw flag, whatever `value`, and returns 0. No event is queued.
MW_API int EventService_AppEvent_c(int value);
/// Tests and clears the redraw flag: 1 when it was raised, else 0. No event is taken.
MW_API int EventService_GetEvent_c(void);

#ifdef __cplusplus
}
#endif
