// Which of the fonts lay out a text.
#include "painter/fonts.h"

#include <gtest/gtest.h>
#include <pango/pangofc-font.h>

#include <array>
#include <span>
#include <string>
#include <vector>

namespace brimol::pc {
namespace {

// A run of glyphs: the file that they come from, their numbers and where they stand.
struct Run {
  std::string file;
  std::vector<std::array<int, 4>> glyphs;
  bool operator==(const Run&) const = default;
};

Run runOf(const PangoLayoutRun& run) {
  FcChar8* file = nullptr;
  FcPatternGetString(pango_fc_font_get_pattern(PANGO_FC_FONT(run.item->analysis.font)), FC_FILE, 0,
                     &file);
  Run result = {reinterpret_cast<const char*>(file), {}};
  for (const PangoGlyphInfo& info :
       std::span(run.glyphs->glyphs, static_cast<std::size_t>(run.glyphs->num_glyphs))) {
    const PangoGlyphGeometry& at = info.geometry;
    result.glyphs.push_back({static_cast<int>(info.glyph), at.width, at.x_offset, at.y_offset});
  }
  return result;
}

std::vector<Run> runsOf(PangoContext* context, const std::string& words) {
  const TextLayout layout(pango_layout_new(context));
  const FontDescription font = projectFonts(40);
  pango_layout_set_font_description(layout.get(), font.get());
  pango_layout_set_text(layout.get(), words.data(), static_cast<int>(words.size()));
  std::vector<Run> runs;
  const LayoutIterator iter(pango_layout_get_iter(layout.get()));
  do {
    const PangoLayoutRun* const run = pango_layout_iter_get_run_readonly(iter.get());
    if (run != nullptr) runs.push_back(runOf(*run));
  } while (pango_layout_iter_next_run(iter.get()) != FALSE);
  return runs;
}

std::string utf8(gunichar letter) {
  std::array<char, 6> bytes = {};
  return {bytes.data(), static_cast<std::size_t>(g_unichar_to_utf8(letter, bytes.data()))};
}

// The letter alone, among others, and joined with itself.
std::vector<std::string> textsWith(const std::string& letter) {
  std::vector<std::string> texts = {letter};
  texts.emplace_back("a").append(letter).append("1");
  texts.emplace_back("\u05d0").append(letter).append("\u0301\u0915");
  texts.emplace_back(letter).append("\u200d").append(letter);
  return texts;
}

// Each letter below the ideographs.
TEST(Fonts, LayOutWithAFewAsWithAll) {
  constexpr gunichar kEnd = 0x3000;
  const BorrowedFonts fonts = borrowFonts();
  PangoContext* const all = fonts->contextFor("中");
  int byFew = 0;
  for (gunichar letter = 1; letter < kEnd; ++letter) {
    for (const std::string& words : textsWith(utf8(letter))) {
      PangoContext* const chosen = fonts->contextFor(words);
      if (chosen == all) continue;
      ++byFew;
      ASSERT_EQ(runsOf(chosen, words), runsOf(all, words)) << std::hex << letter;
    }
  }
  EXPECT_GT(byFew, 3 * 3000);
}

TEST(Fonts, TakeAllForWhatAFewDoNotDraw) {
  const BorrowedFonts fonts = borrowFonts();
  PangoContext* const few = fonts->contextFor("Äpfel שלום عربي ไทย हिन्दी \xFF \xE4\xB8\n");
  for (const char* const words : {"中", "Level: 한국어", "\u2603", "1\uFE0F\u20E3"}) {
    EXPECT_NE(fonts->contextFor(words), few) << words;
  }
  EXPECT_EQ(fonts->contextFor("Äpfel"), few) << "also after others";
}

}  // namespace
}  // namespace brimol::pc
