/// The frame that the calling thread records.
#pragma once

#include <brimol/scene.h>

namespace brimol::pc {

/// Returned for an item that is not taken. Those that are taken are numbered from 0 in each frame.
inline constexpr int kNotTaken = -1;

/// Most items that a frame takes.
inline constexpr int kMostItems = 65536;

/// Starts an empty frame in place of one that was not ended.
void beginRecording();

/// Hands the frame over. Without a started frame: nothing.
void endRecording();

/// Adds a copy of the item to the started frame and returns its number, or kNotTaken when no frame
/// was started or the frame is full.
int record(const SKIA_Item& item);

}  // namespace brimol::pc
