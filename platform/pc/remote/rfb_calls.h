/// LibVNCServer's functions, in a library that is opened for browsers alone.
#pragma once

#include <rfb/rfb.h>

#include "libraries/on_demand.h"

namespace brimol::pc {

struct RfbCalls {
  explicit RfbCalls(const char* file) : library(file) {}

  OnDemand library;

  decltype(&rfbCheckPasswordByList) checkPasswordByList =
      library.function("rfbCheckPasswordByList");
  decltype(&rfbClientConnectionGone) clientConnectionGone =
      library.function("rfbClientConnectionGone");
  decltype(&rfbCloseClient) closeClient = library.function("rfbCloseClient");
  decltype(&rfbFreeCursor) freeCursor = library.function("rfbFreeCursor");
  decltype(&rfbGetScreen) getScreen = library.function("rfbGetScreen");
  decltype(&rfbLogEnable) logEnable = library.function("rfbLogEnable");
  decltype(&rfbMakeXCursor) makeXCursor = library.function("rfbMakeXCursor");
  decltype(&rfbMarkRectAsModified) markRectAsModified = library.function("rfbMarkRectAsModified");
  decltype(&rfbNewClient) newClient = library.function("rfbNewClient");
  decltype(&rfbProcessClientMessage) processClientMessage =
      library.function("rfbProcessClientMessage");
  decltype(&rfbReadExact) readExact = library.function("rfbReadExact");
  decltype(&rfbRegisterProtocolExtension) registerProtocolExtension =
      library.function("rfbRegisterProtocolExtension");
  decltype(&rfbScreenCleanup) screenCleanup = library.function("rfbScreenCleanup");
  decltype(&rfbUpdateClient) updateClient = library.function("rfbUpdateClient");
};

/// Opens the library when it is first called. Where that has an error, nothing of it may be used.
const RfbCalls& rfb();

}  // namespace brimol::pc
