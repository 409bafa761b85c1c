#include "remote/caller.h"

#include <algorithm>

namespace brimol::pc {
namespace {

// LibVNCServer's.
constexpr std::string_view kGreeting = "RFB 003.008\n";
// Taken bytes are freed when they are so many, and more than those that are left.
constexpr std::size_t kWorthFreeing = std::size_t{1} << 16;

}  // namespace

void ByteQueue::drop(std::size_t count) {
  taken += count;
  if (isEmpty()) {
    bytes = {};
    taken = 0;
  } else if (taken > kWorthFreeing && taken > size()) {
    bytes.erase(0, taken);
    taken = 0;
  }
}

Caller::Caller() : greetingLeft(kGreeting.size()) { toViewer.push(kGreeting); }

bool Caller::hear(std::string_view bytes) {
  std::string whole;
  const bool isViewer = gate.take(bytes, whole);
  toServer.push(whole);
  return isViewer;
}

void Caller::answer(std::string_view bytes) {
  const std::size_t known = std::min(greetingLeft, bytes.size());
  greetingLeft -= known;
  toViewer.push(bytes.substr(known));
  viewer->queuedBytes = toViewer.size();
}

void Caller::drop(std::size_t count) {
  toViewer.drop(count);
  viewer->queuedBytes = toViewer.size();
}

}  // namespace brimol::pc
