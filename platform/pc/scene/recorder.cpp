#include "scene/recorder.h"

#include "scene/frame_sink.h"

namespace brimol::pc {

namespace {

struct Recording {
  Frame items;
  bool started = false;
};

constinit thread_local Recording recording;

}  // namespace

void beginRecording() {
  recording.items.clear();
  recording.started = true;
}

void endRecording() {
  if (!recording.started) return;
  recording.started = false;
  submitFrame(recording.items);
}

int record(const SKIA_Item& item) {
  Frame& items = recording.items;
  if (!recording.started || items.size() >= kMostItems) return kNotTaken;
  items.push_back(item);
  return static_cast<int>(items.size()) - 1;
}

}  // namespace brimol::pc
