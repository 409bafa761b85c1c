// Trace files and what they include, read, and played against a few pictures that come and go.

#include <brimol3_widget_test/records.h>

#include <algorithm>
#include <array>
#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

#include "input/trace_parser.h"
#include "input/trace_runner.h"
#include "scene/item_text.h"

namespace {

using brimol::pc::Frame;
using brimol::pc::TraceRunner;

SKIA_Item label(const char* text, SKIA_Rect area) {
  return {
      SKIA_TEXTBOX, area, {}, brimol::test::textRecord(text, 0xFFFFFFFF, SKIA_ALIGN_CENTRE, 20)};
}

const std::array<Frame, 3> kPictures = {
    Frame{},
    Frame{label("OK", {10, 10, 100, 50, 5}), label("space", {200, 10, 100, 50, 5}),
          label("a", {10, 100, 50, 50, 5}), label("a", {70, 100, 50, 50, 5})},
    Frame{label("shift", {10, 10, 100, 50, 5}), label("b*\"\\", {200, 10, 100, 50, 5})}};

// The files, of which a 0xFF begins the next: the first is the trace, the others are named 1, 2,
// ...
class Files {
 public:
  explicit Files(std::string_view bytes) {
    while (texts.size() < 4) {
      const std::size_t end = bytes.find('\xFF');
      texts.emplace_back(bytes.substr(0, end));
      if (end == std::string_view::npos) return;
      bytes.remove_prefix(end + 1);
    }
  }
  std::optional<std::string> read(const std::string& path) const {
    const std::size_t number = path.size() == 1 ? static_cast<std::size_t>(path[0] - '0') : 0;
    if (path != "t" && number - 1 >= texts.size() - 1) return std::nullopt;
    return texts.at(path == "t" ? 0 : number);
  }

 private:
  std::vector<std::string> texts;
};

void play(const brimol::pc::Trace& trace) {
  constexpr brimol::pc::Size kScreen = {480, 800};
  constexpr int kMostActs = 500;
  std::size_t written = 0;
  const auto count = [&written](std::string_view text) { written += text.size(); };
  TraceRunner runner(
      trace, {.screen = trace.screen.value_or(kScreen),
              .post = [&](const Event& record) { written += record.type; },
              .close = [] {},
              .pixel = [](brimol::pc::ScreenPoint at) -> std::optional<uint32_t> { return at.x; },
              .shoot = [&](const std::string& file) { return count(file), std::string(); },
              .changeWorld = [&](const brimol::pc::WorldChange& change) { count(change.name); },
              .begin = [&](const brimol::pc::TraceLine& line) { count(line.text); },
              .judge = [&](const brimol::pc::TraceLine&, const std::string& why) { count(why); }});
  uint64_t now = 0;
  for (int act = 0; act < kMostActs && !runner.failure(); ++act) {
    const Frame& shown = kPictures.at(static_cast<std::size_t>(act) % kPictures.size());
    if (act % 4 == 0) runner.seeFrame(now, shown, brimol::pc::textOfFrame(shown));
    if (act % 7 == 0) runner.seeLog("APP: line");
    const std::optional<uint64_t> due = runner.due(now + 1);
    if (!due) break;
    now = std::max(now, *due);
    runner.act(now);
  }
  runner.seeEnd();
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, std::size_t count) {
  const Files files({reinterpret_cast<const char*>(bytes), count});
  const auto parsed =
      brimol::pc::parseTrace("t", [&](const std::string& path) { return files.read(path); });
  if (parsed.error.empty()) {
    play(parsed.trace);
  } else if (parsed.error.find(':') == std::string::npos) {  // it lacks its place
    std::abort();
  }
  return 0;
}
