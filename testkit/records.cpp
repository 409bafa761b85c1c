#include <brimol3_widget_test/records.h>

#include <iterator>
#include <sstream>

namespace brimol::test {

namespace {

// By the call's number; an item's record names its kind itself.
constexpr auto kKinds = std::to_array<int32_t>({SKIA_BOX, SKIA_ROUNDBOX, SKIA_LINE, SKIA_LABEL,
                                                SKIA_TEXTBOX, SKIA_ROUNDTEXTBOX, SKIA_BUTTONBOX,
                                                SKIA_ROUNDBUTTONBOX, SKIA_STATICBOX, SKIA_ARROW});
static_assert(kKinds.size() == static_cast<std::size_t>(Call::Item));

constexpr auto kNames =
    std::to_array<const char*>({"label", "textbox", "buttonbox", "box", "roundbox", "staticbox",
                                "line", "image", "roundtextbox", "roundbuttonbox", "arrow"});

std::string nameOf(int32_t kind) {
  const auto row = static_cast<std::size_t>(kind);
  return row < kNames.size() ? kNames.at(row) : "nothing";
}

}  // namespace

SKIA_Item itemOf(const Drawing& drawing) {
  const auto row = static_cast<std::size_t>(drawing.call);
  const int32_t kind = row < kKinds.size() ? kKinds.at(row) : drawing.kind;
  const DrawnText& text = drawing.text;
  return {kind, drawing.rect, drawing.line,
          textRecord(text.text, text.color, text.align, text.size)};
}

Frame itemsOf(const std::vector<Drawing>& drawings) {
  Frame frame;
  frame.reserve(drawings.size());
  std::ranges::transform(drawings, std::back_inserter(frame), itemOf);
  return frame;
}

std::string textOf(const Frame& frame) {
  std::ostringstream out;
  for (const SKIA_Item& item : frame) {
    out << nameOf(item.kind) << ' ' << item.rect;
    if (item.kind == SKIA_LINE || item.kind == SKIA_ARROW) out << ' ' << item.point;
    if (item.text.string_len != 0) out << ' ' << item.text;
    out << '\n';
  }
  return out.str();
}

}  // namespace brimol::test
