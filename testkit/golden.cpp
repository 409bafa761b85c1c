#include <brimol3_widget_test/golden.h>
#include <brimol3_widget_test/screen.h>

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <sstream>
#include <string_view>
#include <utility>

namespace brimol::test {

namespace fs = std::filesystem;

namespace {

constexpr uint32_t kDiffers = 0xFF0000;

bool isAskedFor(const char* name) {
  const char* const value = std::getenv(name);
  return value != nullptr && std::string_view(value) != "0" && *value != '\0';
}

bool isRenewing() { return isAskedFor("BRIMOL_RENEW_GOLDENS"); }

// What renderers paint differently: round corners, what shines through, a slope, texts.
Picture paintCanary() {
  constexpr ScreenSize kSize = {160, 96};
  constexpr uint32_t kWhite = 0xFFFFFFFF;
  constexpr int kSmall = 20;
  constexpr int kLarge = 22;
  const Frame frame = {
      {SKIA_BOX, {0, 0, kSize.width, kSize.height, 0xFF405060}, {}, {}},
      {SKIA_ROUNDBOX, {6, 6, 60, 40, 0xFFFF0000}, {}, {}},
      {SKIA_ROUNDBOX, {40, 20, 51, 33, 0x8000FF00}, {}, {}},
      {SKIA_LINE, {}, {70, 50, 150, 22, 0xFF0000FF, 5}, {}},
      {SKIA_LABEL, {4, 54, 90, 40, 0}, {}, textRecord("Rag 47%", kWhite, SKIA_ALIGN_LEFT, kLarge)},
      {SKIA_LABEL, {94, 54, 64, 40, 0}, {}, textRecord("한국어", kWhite, SKIA_ALIGN_LEFT, kSmall)},
  };
  return paint(frame, kSize);
}

std::string readText(const fs::path& file) {
  std::ifstream in(file, std::ios::binary);
  return {std::istreambuf_iterator<char>(in), {}};
}

void write(const fs::path& file, const std::string& text, const Here& here) {
  fs::create_directories(file.parent_path());
  if (std::ofstream(file, std::ios::binary) << text << std::flush) return;
  throw Failure(here, file.native() + ": cannot be written");
}

void write(const fs::path& file, const Picture& picture, const Here& here) {
  fs::create_directories(file.parent_path());
  if (!writePicture(picture, file)) throw Failure(here, file.native() + ": cannot be written");
}

std::string missing(const fs::path& file) {
  return "no golden " + file.native() + ": BRIMOL_RENEW_GOLDENS=1 in the environment makes it";
}

std::vector<std::string> linesOf(const std::string& text) {
  std::istringstream in(text);
  std::vector<std::string> lines;
  for (std::string line; std::getline(in, line);) lines.push_back(line);
  return lines;
}

// The first line in which they differ. There is one.
std::string firstDifference(const std::string& expected, const std::string& actual) {
  const auto wanted = linesOf(expected);
  const auto found = linesOf(actual);
  const auto [one, other] = std::ranges::mismatch(wanted, found);
  const auto lineAt = [](const auto& lines, auto at) {
    return at == lines.end() ? std::string("no more items") : *at;
  };
  return "item " + std::to_string(one - wanted.begin() + 1) + " of " +
         std::to_string(wanted.size()) + " differs\n  expected " + lineAt(wanted, one) +
         "\n  actual   " + lineAt(found, other);
}

// Red where two pixels differ, and faint where they do not.
Picture differenceOf(const Picture& expected, const Picture& actual) {
  Picture marks = expected;
  std::ranges::transform(
      expected.pixels, actual.pixels, marks.pixels.begin(),
      [](uint32_t one, uint32_t other) { return one == other ? one >> 2 & 0x3F3F3F : kDiffers; });
  return marks;
}

std::string sizeText(ScreenSize size) {
  return std::to_string(size.width) + " x " + std::to_string(size.height);
}

std::string pixelText(uint32_t rgb) {
  std::ostringstream text;
  text << '#' << std::hex << std::setfill('0') << std::setw(6) << rgb;
  return text.str();
}

std::string whatDiffers(const Picture& expected, const Picture& actual, const Picture& marks) {
  const auto first = std::ranges::find(marks.pixels, kDiffers) - marks.pixels.begin();
  const auto [y, x] = std::div(static_cast<int>(first), expected.size.width);
  return std::to_string(std::ranges::count(marks.pixels, kDiffers)) + " pixels differ, first " +
         std::to_string(x) + "," + std::to_string(y) + ": expected " +
         pixelText(expected.at(x, y)) + ", got " + pixelText(actual.at(x, y));
}

}  // namespace

Goldens::Goldens(fs::path goldenFolder, fs::path resultFolder)
    : folder(std::move(goldenFolder)), results(std::move(resultFolder)) {}

void Goldens::expectItems(const std::string& name, const Frame& frame, const Here& here) {
  const fs::path file = folder / (name + ".items.txt");
  const std::string actual = textOf(frame);
  if (isRenewing()) return write(file, actual, here);
  if (!fs::exists(file)) throw Failure(here, missing(file));
  const std::string expected = readText(file);
  if (actual == expected) return;
  const fs::path written = results / (name + ".actual.items.txt");
  write(written, actual, here);
  throw Failure(here, name + ": " + firstDifference(expected, actual) + "\n  golden " +
                          file.native() + "\n  actual " + fs::absolute(written).native());
}

bool Goldens::isReferenceRenderer(const Here& here) {
  const fs::path file = folder / "canary.png";
  const Picture canary = readPicture(file);
  if (canary.pixels.empty()) throw Failure(here, missing(file));
  if (paintCanary() == canary) return true;
  if (!isAskedFor("BRIMOL_REFERENCE_RENDERER")) return false;
  throw Failure(here, "this machine paints other pixels than the one that made " + file.native());
}

void Goldens::renewPicture(const std::string& name, const Picture& picture, const Here& here) {
  write(folder / "canary.png", paintCanary(), here);
  write(folder / (name + ".png"), picture, here);
}

Compared Goldens::expectPicture(const std::string& name, const Picture& actual, const Here& here) {
  const fs::path file = folder / (name + ".png");
  if (isRenewing()) {
    renewPicture(name, actual, here);
    return Compared::Same;
  }
  const Picture expected = readPicture(file);
  if (expected.pixels.empty()) throw Failure(here, missing(file));
  if (!isReferenceRenderer(here)) return Compared::OtherRenderer;
  if (actual == expected) return Compared::Same;
  const fs::path stem = results / name;
  write(stem.native() + ".expected.png", expected, here);
  write(stem.native() + ".actual.png", actual, here);
  const std::string where = "; pictures in " + fs::absolute(results).native();
  if (actual.size != expected.size) {
    throw Failure(here, name + ": expected a picture of " + sizeText(expected.size) + ", got " +
                            sizeText(actual.size) + where);
  }
  const Picture marks = differenceOf(expected, actual);
  write(stem.native() + ".difference.png", marks, here);
  throw Failure(here, name + ": " + whatDiffers(expected, actual, marks) + where);
}

Compared Goldens::expect(const std::string& name, const Screen& screen, const Here& here) {
  expectItems(name, screen.frame(), here);
  return expectPicture(name, screen.picture(), here);
}

}  // namespace brimol::test
