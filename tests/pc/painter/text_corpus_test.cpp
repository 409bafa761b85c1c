// Texts of many scripts, pixel by pixel as Pango itself draws them.
#include <gtest/gtest.h>
#include <pango/pangocairo.h>

#include <array>
#include <memory>
#include <random>
#include <string>

#include "painter/canvas.h"
#include "painter/fonts.h"
#include "pc/support/painting.h"

namespace brimol::pc {
namespace {

constexpr Size kScreen = {700, 140};
constexpr SKIA_Rect kRect = {12, 0, 680, 140, 0};
constexpr auto kTexts = std::to_array<const char*>(
    {"AVAToLTyWaY. \"r.\" P, office fluffy ffi fj ft tt rt", "Level -12.5 dB, 100% (3/4) a_b~c|d^e",
     "Straße Ångström naïve œuvre İstanbul ıI Łódź ŉ ĳ", "Ελληνικά: Ώρα ΑΥΤΌΣ φύλλο ᾳῷΐ",
     "Русский ГАУТ ёлка Љубљана Ґанок", "שלום עולם שָׁלוֹם (12) abc",
     "العربية لا إله الرّحمٰن ١٢٣ abc ﷺ", "हिन्दी क्षत्रिय र्क्य किं श्री १२३", "ภาษาไทย น้ำ ที่นี่ ปู่ ฎฏ",
     "中文字體 骨直令 日本語 ひらがな 한국어 각",
     "😀 👍🏽 ☺ ❤️ 🇩🇪 ✓ → ∑ █▓",
     "e\u0301 a\u0308\u0323 Z\u0351\u036B\u0343 n\u0303 \u0301x o\u20DD",
     "a\u200Bb\u200Dc \u202Eright\u202C \u00ADsoft \u2066x\u2069", "\x01\x02 tab\there \x7F\x1B[0m",
     "one\ntwo\r\nthree\u2028four", "bad \xFF\xC3 \xE4\xB8 \xF0\x9F z \xED\xA0\x80",
     "  two  blanks ", "\U000F0000 no glyph \uE000 ÿ", "mixed عربي and עברית, 中文; हिन्दी ไทย Ж"});

using Random = std::mt19937;

// Letters of a few scripts, or any bytes.
std::string anyText(Random& random) {
  struct Range {
    uint32_t first, count;
  };
  constexpr auto kRanges = std::to_array<Range>({
      // clang-format off
      {0x20, 95}, {0x20, 95}, {0xA0, 0x170}, {0x300, 0x60}, {0x370, 0x150}, {0x591, 0x60},
      {0x610, 0xE0}, {0x900, 0x80}, {0xE01, 0x5A}, {0x2000, 0x70}, {0x4E00, 0x400},
      {0xAC00, 0x400}, {0x1F600, 0x40}, {0x00, 0x20}
      // clang-format on
  });
  std::string text;
  const bool isBytes = random() % 8 == 0;
  const Range& main = kRanges[random() % kRanges.size()];
  for (auto left = random() % 30; left > 0; --left) {
    const Range& range = random() % 4 == 0 ? kRanges[random() % kRanges.size()] : main;
    std::array<char, 6> bytes = {};
    const int count = g_unichar_to_utf8(range.first + static_cast<uint32_t>(random() % range.count),
                                        bytes.data());
    text += isBytes ? std::string(1, static_cast<char>(random()))
                    : std::string(bytes.data(), static_cast<std::size_t>(count));
  }
  return text;
}

Picture drawnByPango(const SKIA_Text& text, uint32_t ground) {
  const Canvas canvas(kScreen);
  canvas.fill({0, 0, kScreen.w, kScreen.h}, ground);
  const BorrowedFonts fonts = borrowFonts();  // all of them, whatever the text needs
  const TextLayout layout(pango_layout_new(fonts->contextFor("中")));
  pango_layout_set_font_description(layout.get(), projectFonts(text.size).get());
  const std::unique_ptr<char, decltype(&g_free)> valid(g_utf8_make_valid(text.text, -1), g_free);
  pango_layout_set_text(layout.get(), valid.get(), -1);
  int height = 0;
  pango_layout_get_size(layout.get(), nullptr, &height);
  const int top = (kScreen.h - PANGO_PIXELS(height)) / 2;
  const LayoutIterator line(pango_layout_get_iter(layout.get()));
  const auto part = [&text](int shift) { return (text.color >> shift & 0xFF) / 255.0; };
  cairo_set_source_rgba(canvas.context(), part(16), part(8), part(0), part(24));
  cairo_rectangle(canvas.context(), kRect.x, kRect.y, kRect.w, kRect.h);
  cairo_clip(canvas.context());
  do {
    PangoRectangle extents = {};
    pango_layout_iter_get_line_extents(line.get(), nullptr, &extents);
    const int middle = top + PANGO_PIXELS(extents.y + extents.height / 2);
    if (middle < 0 || middle > kScreen.h) continue;  // a line too many for the rectangle
    cairo_move_to(canvas.context(), kRect.x,
                  top + PANGO_PIXELS(pango_layout_iter_get_baseline(line.get())));
    pango_cairo_show_layout_line(canvas.context(), pango_layout_iter_get_line_readonly(line.get()));
  } while (pango_layout_iter_next_line(line.get()) != FALSE);
  return pictureOf(canvas.surface());
}

// A painter draws a text otherwise once it knows its letters, and over a colour that came before.
void expectAsByPango(Painter& painter, const std::string& words, int32_t size, uint32_t color) {
  const SKIA_Text text = textOf(words, size, color);
  for (const uint32_t ground : {kWhite, kWhite, 0xFF305080, kWhite}) {
    painter.paint({});
    painter.paint(
        {boxItem({0, 0, kScreen.w, kScreen.h, ground}), textItem(SKIA_LABEL, kRect, text)});
    ASSERT_EQ(pictureOf(painter.picture()), drawnByPango(text, ground)) << words << ", " << size;
  }
}

TEST(TextCorpus, LooksAsPangoDrawsIt) {
  Painter painter(kScreen);
  for (const int32_t size : {9, 13, 26}) {
    for (const char* const words : kTexts) {
      expectAsByPango(painter, words, size, size == 13 ? 0x9020C010 : kBlack);
      if (HasFatalFailure()) return;
    }
  }
}

TEST(TextCorpus, OfAnyLettersAndBytesLooksAsPangoDrawsIt) {
  Painter painter(kScreen);
  Random random(9);
  for (int round = 0; round < 150; ++round) {
    const auto size = static_cast<int32_t>(8 + random() % 3 * 11);
    expectAsByPango(painter, anyText(random), size, random() % 2 == 0 ? kBlack : 0xC0F02010);
    if (HasFatalFailure()) return;
  }
}

}  // namespace
}  // namespace brimol::pc
