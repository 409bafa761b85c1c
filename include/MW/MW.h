/// Every public header of the toolkit.
#pragma once

#include <MW/button.h>
#include <MW/c_api.h>
#include <MW/callback.h>
#include <MW/event_service.h>
#include <MW/primitives.h>
#include <MW/records.h>
#include <MW/widget.h>
#include <MW/widget_list.h>
#include <MW/window.h>
