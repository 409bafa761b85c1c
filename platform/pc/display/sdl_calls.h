/// SDL's functions, in a library that is opened for a window alone.
#pragma once

#include <SDL.h>

#include "libraries/on_demand.h"

namespace brimol::pc {

struct SdlCalls {
  explicit SdlCalls(const char* file) : library(file) {}

  OnDemand library;

  decltype(&SDL_CreateRGBSurfaceWithFormatFrom) createRGBSurfaceWithFormatFrom =
      library.function("SDL_CreateRGBSurfaceWithFormatFrom");
  decltype(&SDL_CreateRenderer) createRenderer = library.function("SDL_CreateRenderer");
  decltype(&SDL_CreateTexture) createTexture = library.function("SDL_CreateTexture");
  decltype(&SDL_CreateWindow) createWindow = library.function("SDL_CreateWindow");
  decltype(&SDL_DestroyRenderer) destroyRenderer = library.function("SDL_DestroyRenderer");
  decltype(&SDL_DestroyTexture) destroyTexture = library.function("SDL_DestroyTexture");
  decltype(&SDL_DestroyWindow) destroyWindow = library.function("SDL_DestroyWindow");
  decltype(&SDL_FreeSurface) freeSurface = library.function("SDL_FreeSurface");
  decltype(&SDL_GetCurrentVideoDriver) getCurrentVideoDriver =
      library.function("SDL_GetCurrentVideoDriver");
  decltype(&SDL_GetDisplayUsableBounds) getDisplayUsableBounds =
      library.function("SDL_GetDisplayUsableBounds");
  decltype(&SDL_GetError) getError = library.function("SDL_GetError");
  decltype(&SDL_GetRendererOutputSize) getRendererOutputSize =
      library.function("SDL_GetRendererOutputSize");
  decltype(&SDL_GetWindowBordersSize) getWindowBordersSize =
      library.function("SDL_GetWindowBordersSize");
  decltype(&SDL_GetWindowDisplayIndex) getWindowDisplayIndex =
      library.function("SDL_GetWindowDisplayIndex");
  decltype(&SDL_GetWindowFlags) getWindowFlags = library.function("SDL_GetWindowFlags");
  decltype(&SDL_GetWindowSize) getWindowSize = library.function("SDL_GetWindowSize");
  decltype(&SDL_GetWindowSurface) getWindowSurface = library.function("SDL_GetWindowSurface");
  decltype(&SDL_Init) init = library.function("SDL_Init");
  decltype(&SDL_PollEvent) pollEvent = library.function("SDL_PollEvent");
  decltype(&SDL_PushEvent) pushEvent = library.function("SDL_PushEvent");
  decltype(&SDL_Quit) quit = library.function("SDL_Quit");
  decltype(&SDL_RenderCopy) renderCopy = library.function("SDL_RenderCopy");
  decltype(&SDL_RenderPresent) renderPresent = library.function("SDL_RenderPresent");
  decltype(&SDL_SetHint) setHint = library.function("SDL_SetHint");
  decltype(&SDL_SetHintWithPriority) setHintWithPriority =
      library.function("SDL_SetHintWithPriority");
  decltype(&SDL_SetWindowFullscreen) setWindowFullscreen =
      library.function("SDL_SetWindowFullscreen");
  decltype(&SDL_SetWindowSize) setWindowSize = library.function("SDL_SetWindowSize");
  decltype(&SDL_StopTextInput) stopTextInput = library.function("SDL_StopTextInput");
  decltype(&SDL_UpdateTexture) updateTexture = library.function("SDL_UpdateTexture");
  decltype(&SDL_UpdateWindowSurfaceRects) updateWindowSurfaceRects =
      library.function("SDL_UpdateWindowSurfaceRects");
  decltype(&SDL_UpperBlit) upperBlit = library.function("SDL_UpperBlit");
  decltype(&SDL_WaitEvent) waitEvent = library.function("SDL_WaitEvent");
  decltype(&SDL_WaitEventTimeout) waitEventTimeout = library.function("SDL_WaitEventTimeout");
};

/// Opens the library when it is first called. Where that has an error, nothing of it may be used.
const SdlCalls& sdl();

}  // namespace brimol::pc
