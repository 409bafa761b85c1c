#include "input/trace_parser.h"

#include <algorithm>
#include <charconv>
#include <filesystem>
#include <fstream>
#include <limits>
#include <new>
#include <numeric>
#include <string_view>
#include <system_error>
#include <utility>

#include "input/inside.h"
#include "input/trace_steps.h"
#include "input/trace_words.h"
#include "scene/item_text.h"
#include "scene/quoted_text.h"

namespace brimol::pc {

namespace {

constexpr std::string_view kMark = "brimol-trace";          // what the first line begins with
constexpr std::size_t kMostBytes = std::size_t{256} << 20;  // of all files of a trace
constexpr std::size_t kMostIncludes = 16;                   // one in the other
constexpr int kMostFiles = 10'000;
constexpr std::size_t kMostChanges = 8'000'000;  // lines of items
constexpr uint32_t kMostClockStep = 1000;
constexpr uint64_t kMostTime = uint64_t{1} << 40;
constexpr uint64_t kMostItems = 65536;
constexpr std::size_t kHashDigits = 16;
constexpr uint64_t kMostSide = 16384;

// Each frame's items are hashed, though its line may say but a few words. What is hashed in all is
// bounded by what the lines say. A frame of 1,000 items in which one blinks stays below.
constexpr uint64_t kFreeWork = uint64_t{256} << 20;  // bytes
constexpr uint64_t kWorkForByte = 1024;
constexpr uint64_t kWorkForItem = 8;

std::string_view trimmed(std::string_view line) {
  constexpr std::string_view kBlanks = " \t\r";
  const std::size_t first = line.find_first_not_of(kBlanks);
  if (first == std::string_view::npos) return {};
  return line.substr(first, line.find_last_not_of(kBlanks) + 1 - first);
}

bool isDigit(char letter) { return letter >= '0' && letter <= '9'; }

// "720x1280".
Size readScreen(TraceWords& words) {
  std::string size = words.word("a size as 720x1280");
  const std::size_t by = size.find('x');
  if (by != std::string::npos) size[by] = ' ';
  TraceWords sides(size);
  const auto side = [&] {
    const uint64_t pixels = sides.number("a side in pixels", kMostSide);
    if (pixels == 0) throw BadLine{"a screen without pixels"};
    return static_cast<int>(pixels);
  };
  const int width = side();
  const int height = side();
  sides.expectEnd();
  return {width, height};
}

float readDensity(std::string_view word) {
  constexpr float kMost = 10000;
  float density = 0;
  const char* const end = word.data() + word.size();
  const auto [stop, problem] = std::from_chars(word.data(), end, density);
  const bool isNumber = problem == std::errc() && stop == end;
  if (!isNumber || !(density > 0 && density <= kMost)) throw BadLine{"no number of dots per inch"};
  return density;
}

/// Reads files into one trace.
class TraceParser {
 public:
  TraceParser(ParsedTrace& target, const TraceFiles& source, std::size_t most)
      : parsed(target), trace(target.trace), files(source), mostSteps(most) {}

  void read(const std::string& path);

 private:
  // A file that is being read. What is left of it are the bytes from `place` on.
  struct OpenFile {
    const TraceFile* file;
    std::size_t place = 0;
    int lines = 0;
  };

  const TraceFile* keep(TraceFile file);
  bool begin(const std::string& path);
  bool takeLine(TraceLine& line);
  void readOne(const TraceLine& line);
  void finish();
  void readLine(const TraceLine& line);
  void readHeader(const TraceLine& line);
  void readItem(const TraceLine& line);
  void readFrame(const TraceLine& line, TraceWords& words, uint64_t time);
  bool readSetting(const TraceLine& line, TraceWords& words);
  void readClock(TraceWords& words);
  void mustComeFirst() const;
  void readTimed(const TraceLine& line, TraceWords& words);
  void include(const TraceLine& line, const std::string& file);
  void endFrame();
  void boundWork();

  ParsedTrace& parsed;
  Trace& trace;
  const TraceFiles& files;
  const std::size_t mostSteps;
  std::vector<OpenFile> open;  // each is included by the one before
  int filesRead = 0;
  std::vector<std::string> items;  // of the newest frame
  std::size_t changes = 0;
  uint64_t bytesRead = 0;
  uint64_t work = 0;      // bytes that were hashed
  bool hasBegun = false;  // with a step that is not of the world
  bool hasEnd = false;
  TraceLine lastLine;
};

void TraceParser::read(const std::string& path) {
  if (!begin(path)) return parsed.refuse({keep({path, {}}), 1}, "cannot be read");
  while (!open.empty() && parsed.error.empty()) {
    TraceLine line;
    takeLine(line) ? readOne(line) : open.pop_back();
  }
  if (parsed.error.empty()) finish();
}

const TraceFile* TraceParser::keep(TraceFile file) {
  return trace.files.emplace_back(std::make_shared<const TraceFile>(std::move(file))).get();
}

bool TraceParser::begin(const std::string& path) {
  std::optional<std::string> text = files(path);
  if (text) open.push_back({keep({path, std::move(*text)})});
  ++filesRead;
  return text.has_value();
}

// The next line of the innermost file; an empty file has one. False at its end.
bool TraceParser::takeLine(TraceLine& line) {
  auto& [file, place, lines] = open.back();
  const std::string_view text = file->text;
  if (place >= text.size() && lines > 0) return false;
  const std::size_t end = text.find('\n', place);
  const bool isCut = end == std::string_view::npos;
  // The crash came while the line was written.
  if (isCut && trace.isRecording && lines > 0) return false;
  const std::string_view written = text.substr(place, isCut ? end : end - place);
  line = {file, ++lines, trimmed(written)};
  bytesRead += written.size();
  place = isCut ? text.size() : end + 1;
  return true;
}

void TraceParser::readOne(const TraceLine& line) {
  try {
    line.number == 1 ? readHeader(line) : readLine(line);
    lastLine = line;
  } catch (const BadLine& bad) {
    parsed.refuse(line, bad.why);
  }
}

void TraceParser::readHeader(const TraceLine& line) {
  TraceWords words(line.text);
  if (!words.takes(kMark)) throw BadLine{"not a trace: its first line is 'brimol-trace 1'"};
  if (words.peek() != "1") throw BadLine{"this version of the format is not known; 1 is"};
  (void)words.word("a version");
  const bool isRecording = words.takes("recording");
  words.expectEnd();
  if (isRecording && open.size() > 1) throw BadLine{"a recording cannot be included"};
  if (open.size() == 1) trace.isRecording = isRecording;
}

void TraceParser::readLine(const TraceLine& line) {
  if (line.text.empty() || line.text.front() == '#') return;
  if (line.text.front() == '|') return readItem(line);
  endFrame();
  TraceWords words(line.text);
  if (words.isAtEnd()) return;
  if (!readSetting(line, words)) readTimed(line, words);
}

// `| NUMBER ITEM`, of the frame above.
void TraceParser::readItem(const TraceLine& line) {
  const std::string_view rest = trimmed(line.text.substr(1));
  if (trace.frames.empty()) throw BadLine{"an item without a frame above"};
  TraceWords number(rest.substr(0, rest.find(' ')));
  const uint64_t place = number.number("an item's number", kMostItems);
  if (place >= items.size()) throw BadLine{"the frame above has not so many items"};
  if (++changes > kMostChanges) throw BadLine{"too many lines of items"};
  const std::string_view item = trimmed(rest.substr(std::min(rest.find(' '), rest.size())));
  items[place] = item;
  trace.frames.back().changes.push_back({place, item});
}

// Settled with the first line behind its items. A damaged recording shows here.
void TraceParser::endFrame() {
  if (trace.frames.empty()) return;
  RecordedFrame& frame = trace.frames.back();
  boundWork();
  const bool isWhole = hashOf(items) == frame.hash;
  if (!isWhole && trace.isRecording) {
    throw BadLine{"the frame at line " + std::to_string(frame.line.number) +
                  " does not have the items that its hash says"};
  }
  frame.isForgotten = !isWhole && frame.changes.empty();
  if (frame.isForgotten) std::ranges::fill(items, std::string());
}

void TraceParser::boundWork() {
  work = std::accumulate(
      items.begin(), items.end(), work,
      [](uint64_t sum, const std::string& item) { return sum + item.size() + kWorkForItem; });
  if (work <= kFreeWork + kWorkForByte * bytesRead) return;
  throw BadLine{"the frames up to here have too many items for what their lines say"};
}

void TraceParser::readFrame(const TraceLine& line, TraceWords& words, uint64_t time) {
  RecordedFrame frame = {.line = line, .time = time};
  frame.hash = words.hexadecimal("a hash of 16 digits", kHashDigits);
  frame.count = words.number("a number of items", kMostItems);
  words.expectEnd();
  if (!trace.frames.empty() && time < trace.frames.back().time) {
    throw BadLine{"a frame before the one above"};
  }
  items.resize(frame.count);
  trace.frames.push_back(std::move(frame));
}

void TraceParser::mustComeFirst() const {
  if (hasBegun) throw BadLine{"this must stand before the first step"};
}

void TraceParser::readClock(TraceWords& words) {
  mustComeFirst();
  if (words.takes("step")) {
    trace.clockStep =
        static_cast<uint32_t>(words.number("a number of milliseconds", kMostClockStep));
    if (trace.clockStep == 0U) throw BadLine{"a clock that stands still"};
    return;
  }
  words.expect("start");
  trace.clockStart = static_cast<uint32_t>(
      words.number("a number of milliseconds", std::numeric_limits<uint32_t>::max()));
}

// What is about the trace, and no step.
bool TraceParser::readSetting(const TraceLine& line, TraceWords& words) {
  if (words.takes("screen")) {
    mustComeFirst();
    trace.screen = readScreen(words);
    trace.screenLine = line;
  } else if (words.takes("density")) {
    mustComeFirst();
    trace.density = readDensity(words.word("dots per inch"));
    trace.densityLine = line;
  } else if (words.takes("clock")) {
    readClock(words);
  } else if (words.takes("include")) {
    const std::string file = words.isTextNext() ? words.text("a file") : words.word("a file");
    words.expectEnd();
    include(line, file);
  } else if (words.takes("leave")) {
    words.expect("running");
    trace.leavesRunning = true;
  } else if (words.takes("linger")) {
    trace.lingerMs = words.number("a number of milliseconds", kMostTime);
  } else {
    return false;
  }
  words.expectEnd();
  return true;
}

void TraceParser::include(const TraceLine& line, const std::string& file) {
  const std::string path = (std::filesystem::path(line.file->path).parent_path() / file).native();
  const auto isPath = [&path](const OpenFile& each) { return each.file->path == path; };
  if (std::ranges::any_of(open, isPath)) throw BadLine{"'" + file + "' includes itself"};
  if (open.size() >= kMostIncludes || filesRead >= kMostFiles) {
    throw BadLine{"too many files are included"};
  }
  if (!begin(path)) throw BadLine{"'" + path + "' cannot be read as a file of this trace"};
}

void TraceParser::readTimed(const TraceLine& line, TraceWords& words) {
  if (trace.steps.size() + trace.frames.size() >= mostSteps) {
    throw BadLine{"more than " + std::to_string(mostSteps) + " steps and frames"};
  }
  TraceStep step = {line, TraceStep::Timing::AsSoonAsPossible, 0, {}};
  if (words.peek().starts_with('+')) {
    TraceWords digits(words.word("a time").substr(1));
    step.timing = TraceStep::Timing::After;
    step.time = digits.number("a time", kMostTime);
  } else if (isDigit(words.peek().front())) {
    step.timing = TraceStep::Timing::At;
    step.time = words.number("a time", kMostTime);
  }
  if (words.takes("frame")) {
    if (step.timing != TraceStep::Timing::At) throw BadLine{"a frame needs its time"};
    return readFrame(line, words, step.time);
  }
  if (trace.isRecording && step.timing != TraceStep::Timing::At && words.peek() != "world") {
    throw BadLine{"a step of a recording needs its time"};
  }
  if (hasEnd) throw BadLine{"a step behind the end"};
  step.action = readStep(words);
  hasEnd = std::holds_alternative<SessionEnd>(step.action);
  hasBegun = hasBegun || !std::holds_alternative<WorldChange>(step.action);
  trace.steps.push_back(std::move(step));
}

void TraceParser::finish() {
  try {
    endFrame();
  } catch (const BadLine& bad) {
    // The crash came between the last frame and its items.
    if (hasEnd || !trace.isRecording) return parsed.refuse(lastLine, bad.why);
    trace.frames.pop_back();
  }
  if (trace.isRecording && !hasEnd) {
    constexpr uint64_t kAftermathMs = 5000;  // the crash came after the last line
    trace.cutAt = printable(lastLine.place());
    trace.lingerMs = kAftermathMs;
  }
}

// At most `left` bytes, which become fewer. Of a file that is no trace only the beginning, which
// says so.
std::optional<std::string> bytesOf(const std::string& file, std::size_t& left) {
  constexpr std::size_t kChunk = std::size_t{1} << 16;
  std::error_code isNoFile;
  const uintmax_t size = std::filesystem::file_size(file, isNoFile);
  if (!isNoFile && size > left) return std::nullopt;
  std::ifstream in(file, std::ios::binary);
  std::string bytes;
  std::string chunk(kChunk, '\0');
  while (in.read(chunk.data(), kChunk) || in.gcount() > 0) {
    bytes.append(chunk, 0, static_cast<std::size_t>(in.gcount()));
    if (bytes.size() > left) return std::nullopt;
    if (!trimmed(bytes).starts_with(kMark)) break;
  }
  if (!in.is_open() || in.bad()) return std::nullopt;
  left -= bytes.size();
  return bytes;
}

}  // namespace

std::vector<std::string> itemsOf(const Trace& trace, std::size_t frame) {
  std::vector<std::string> items;
  for (std::size_t i = 0; i <= frame; ++i) {
    const RecordedFrame& each = trace.frames.at(i);
    items.resize(each.count);
    for (const ItemChange& change : each.changes) items.at(change.number) = change.item;
    if (each.isForgotten) std::ranges::fill(items, std::string());
  }
  return items;
}

void ParsedTrace::refuse(const TraceLine& line, const std::string& why) {
  if (!error.empty()) return;
  wrong = line;
  error = printable(line.place() + ": " + why);
}

ParsedTrace parseTrace(const std::string& path, const TraceFiles& files, std::size_t mostSteps) {
  ParsedTrace parsed;
  try {
    TraceParser(parsed, files, mostSteps).read(path);
  } catch (const std::bad_alloc&) {
    parsed = {};
    parsed.error = printable(path + ": there is not enough memory for it");
  }
  return parsed;
}

ParsedTrace parseTrace(const std::string& path, const std::string& root) {
  namespace fs = std::filesystem;
  const fs::path folder = root.empty() ? fs::path(path).parent_path() : fs::path(root);
  std::size_t left = kMostBytes;
  return parseTrace(path, [&](const std::string& file) -> std::optional<std::string> {
    std::error_code failure;
    if (fs::is_directory(file, failure)) return std::nullopt;
    // A device or a pipe may hang: the user can name one, a trace cannot.
    const bool isFit = fs::is_regular_file(file, failure) && isInside(folder, file);
    return file == path || isFit ? bytesOf(file, left) : std::nullopt;
  });
}

}  // namespace brimol::pc
