/// Every public header of the toolkit.
#pragma once

#include <MW/button.h>
#include <MW/button3.h>
#include <MW/c_api.h>
#include <MW/callback.h>
#include <MW/dialog.h>
#include <MW/event_service.h>
#include <MW/ime.h>
#include <MW/key.h>
#include <MW/main_list.h>
#include <MW/primitives.h>
#include <MW/push_button.h>
#include <MW/records.h>
#include <MW/screen.h>
#include <MW/slide.h>
#include <MW/static_text.h>
#include <MW/text_panel.h>
#include <MW/timed.h>
#include <MW/widget.h>
#include <MW/widget_list.h>
#include <MW/window.h>
