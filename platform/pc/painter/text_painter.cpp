#include "painter/text_painter.h"

#include "scene/item.h"

namespace brimol::pc {

namespace {

// Whether the text is one that draws something.
bool isDrawn(const SKIA_Text& text) {
  return textSizeOf(text) != 0 && alphaOf(text.color) != 0 && !shownText(text).empty();
}

}  // namespace

void TextPainter::draw(const Canvas& canvas, const SKIA_Rect& rect, const SKIA_Text& text,
                       const Pixels& clip) {
  if (!isDrawn(text)) return;
  if (ink.color() != text.color) ink = Ink(text.color);
  laidText(text).draw(canvas, edgesOf(rect), text.align, ink, clip);
}

Pixels TextPainter::touched(const SKIA_Rect& rect, const SKIA_Text& text, const Pixels& bounds) {
  if (!isDrawn(text)) return {};
  const std::optional<Edges> area = laidText(text).drawnArea(edgesOf(rect), text.align);
  return area ? within(*area, bounds) : bounds;
}

// From Pango itself, which knows where the outlines lie.
TextInk TextPainter::inkOf(const SKIA_Rect& rect, const SKIA_Text& text) {
  if (!isDrawn(text)) return {};
  trim();
  PlainShapes none;
  const std::string_view words = shownText(text);
  const LaidText laid({fonts->contextFor(words), run, none}, words, textSizeOf(text));
  return laid.ink(edgesOf(rect), text.align);
}

const LaidText& TextPainter::laidText(const SKIA_Text& text) {
  const KeyView key = {shownText(text), textSizeOf(text)};
  if (const LaidText* const known = texts.find(key)) return *known;
  trim();
  LaidText laid({fonts->contextFor(key.text), run, shapes}, key.text, key.size);
  const std::size_t cost = key.text.size() + laid.bytes();
  return texts.put({std::string(key.text), key.size}, std::move(laid), cost);
}

// The texts go with the images, which they are made of.
void TextPainter::trim() {
  if (images.bytes() <= kMostImageBytes) return;
  texts.clear();
  images.clear();
}

}  // namespace brimol::pc
