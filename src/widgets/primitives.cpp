#include <MW/primitives.h>
#include <MW/widget_list.h>

#include <algorithm>
#include <string_view>

#include "core/bounded_text.h"
#include "core/geometry.h"

namespace MW {

namespace {

SKIA_Text imageName(const SKIA_Text* given) {
  SKIA_Text record = {};
  if (given == nullptr) return record;
  // The length is believed, NULs and all, as long as the record can hold so much.
  const bool fits = given->string_len <= kTextMax;
  const auto count = static_cast<std::size_t>(std::max(given->string_len, 0));
  putText(record, fits ? std::string_view(given->text, count) : boundedText(given->text));
  return record;
}

}  // namespace

TextPrimitive::TextPrimitive(int primitiveType, const SKIA_Rect* area, const SKIA_Text* caption) {
  type_ = primitiveType;
  rect = copyRect(area);
  text = copyText(caption);
}

char* TextPrimitive::getText() { return text.text; }
unsigned int TextPrimitive::getTextColor() { return read(text.color); }
int TextPrimitive::getFontSize() { return read(text.size); }
SKIA_Rect* TextPrimitive::getPositionAndSize() { return &rect; }
void TextPrimitive::setFontSize(int pixels) { write(text.size, pixels); }
void TextPrimitive::setTextAlign(int align) { write(text.align, align); }
void TextPrimitive::setBgColor(unsigned int color) { write(rect.color, color); }

Label::Label(const SKIA_Rect* area, const SKIA_Text* caption)
    : TextPrimitive(kTypeLabel, area, caption) {}

int Label::show() { return show(0); }

int Label::show(unsigned int) {
  const std::lock_guard guard(stateLock);
  return skia_add_label_c(rect, text);
}

void Label::setText(const char* newText) {
  const std::lock_guard guard(stateLock);
  putTextOpen(text, boundedText(newText));
}

int Label::add_MWWList() {
  const std::lock_guard guard(stateLock);
  return WidgetList::addQueue(SKIA_LABEL, &rect, nullptr, &text);
}

Textbox::Textbox(const SKIA_Rect* area, const SKIA_Text* caption)
    : TextPrimitive(kTypeTextbox, area, caption) {}

int Textbox::show() { return show(0); }

int Textbox::show(unsigned int) {
  const std::lock_guard guard(stateLock);
  return skia_add_textbox_c(rect, text);
}

void Textbox::setText(const char* newText) {
  const std::lock_guard guard(stateLock);
  putText(text, boundedText(newText));
}

int Textbox::add_MWWList() {
  const std::lock_guard guard(stateLock);
  return WidgetList::addQueue(SKIA_TEXTBOX, &rect, nullptr, &text);
}

Image::Image(const SKIA_Rect* area, const SKIA_Text* name) {
  type_ = kTypeImage;
  rect = copyRect(area);
  text = imageName(name);
}

int Image::show() { return show(0); }

int Image::show(unsigned int) {
  const std::lock_guard guard(stateLock);
  return skia_add_label_c(rect, text);
}

char* Image::getText() { return text.text; }
SKIA_Rect* Image::getPositionAndSize() { return &rect; }

void Image::setText(const char* newText) {
  const std::lock_guard guard(stateLock);
  putTextOpen(text, boundedText(newText));
}

int Image::add_MWWList() {
  const std::lock_guard guard(stateLock);
  return WidgetList::addQueue(SKIA_IMAGE, &rect, nullptr, &text);
}

Box::Box(const SKIA_Rect* area) {
  type_ = kTypeBox;
  rect = copyRect(area);
}

int Box::show() { return show(0); }
int Box::show(unsigned int) { return skia_add_box_c(read(rect)); }
SKIA_Rect* Box::getPositionAndSize() { return &rect; }
void Box::setBgColor(unsigned int color) { write(rect.color, color); }

int Box::add_MWWList() {
  const std::lock_guard guard(stateLock);
  return WidgetList::addQueue(SKIA_BOX, &rect, nullptr, nullptr);
}

Line::Line(const SKIA_Point* line) {
  type_ = kTypeLine;
  if (line != nullptr) point = *line;
}

int Line::show() { return show(0); }
int Line::show(unsigned int) { return skia_add_line_c(read(point)); }

SKIA_Rect* Line::getPositionAndSize() {
  const std::lock_guard guard(stateLock);
  // Anchored at the larger coordinates, it reaches back from there.
  rect.x = std::max(point.x1, point.x2);
  rect.y = std::max(point.y1, point.y2);
  rect.w = toPixels(int64_t{std::min(point.x1, point.x2)} - rect.x);
  rect.h = toPixels(int64_t{std::min(point.y1, point.y2)} - rect.y);
  rect.color = point.color;
  return &rect;
}

void Line::setLnColor(unsigned int color) { write(point.color, color); }

int Line::add_MWWList() {
  const std::lock_guard guard(stateLock);
  return WidgetList::addQueue(SKIA_LINE, nullptr, &point, nullptr);
}

}  // namespace MW
