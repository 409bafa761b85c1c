#include "scene/recorder.h"

#include <utility>

#include "scene/frame_sink.h"

namespace brimol::pc {

namespace {

struct Recording {
  Frame items;
  std::size_t lastCount = 0;  // items of the frame before: what the next one is likely to need
  bool started = false;
};

constinit thread_local Recording recording;

}  // namespace

void beginRecording() {
  recording.items.clear();
  recording.items.reserve(recording.lastCount);
  recording.started = true;
}

void endRecording() {
  if (!recording.started) return;
  recording.started = false;
  recording.lastCount = recording.items.size();
  submitFrame(std::move(recording.items));
}

int record(const SKIA_Item& item) {
  Frame& items = recording.items;
  if (!recording.started || items.size() >= kMostItems) return kNotTaken;
  items.push_back(item);
  return static_cast<int>(items.size()) - 1;
}

}  // namespace brimol::pc
