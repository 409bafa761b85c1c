#include "painter/fonts.h"

#include <pango/pangocairo.h>
#include <pango/pangofc-fontmap.h>

#include <array>
#include <cstdio>
#include <mutex>
#include <vector>

#include "scene/cairo_handles.h"

namespace brimol::pc {

namespace {

// In the order of kFamilies.
constexpr auto kFontFiles = std::to_array<const char*>({
    "/usr/share/fonts/truetype/roboto/unhinted/RobotoTTF/Roboto-Regular.ttf",
    "/usr/share/fonts/truetype/noto/NotoSans-Regular.ttf",
    "/usr/share/fonts/truetype/noto/NotoSansArabic-Regular.ttf",
    "/usr/share/fonts/truetype/noto/NotoSansHebrew-Regular.ttf",
    "/usr/share/fonts/truetype/noto/NotoSansThai-Regular.ttf",
    "/usr/share/fonts/truetype/noto/NotoSansDevanagari-Regular.ttf",
    "/usr/share/fonts/opentype/noto/NotoSansCJK-Regular.ttc",
});

// All but the last one, which has ten fonts of 65,000 characters and takes twenty times as long to
// read as the others together.
constexpr std::span<const char* const> kCommonFiles(kFontFiles.data(), kFontFiles.size() - 1);

// The order in which a character's font is looked for. One of the CJK fonts draws the Hangul, the
// Chinese and the Japanese characters; the ideographs have their Chinese forms.
constexpr const char* kFamilies =
    "Roboto,Noto Sans,Noto Sans Arabic,Noto Sans Hebrew,Noto Sans Thai,Noto Sans Devanagari,"
    "Noto Sans CJK SC";

// "Undetermined": no script is outside it, so that Pango never asks the environment for the
// language of a run, and no font has other forms for it.
constexpr const char* kLanguage = "und";

constexpr double kDotsPerInch = 96;  // sizes are absolute, so that nothing depends on it

const FcChar8* fileName(const char* file) { return reinterpret_cast<const FcChar8*>(file); }

FontConfig makeConfig(std::span<const char* const> files) {
  FontConfig config(FcConfigCreate());
  FcConfigSetSysRoot(config.get(), nullptr);
  for (const char* const file : files) {
    if (FcConfigAppFontAddFile(config.get(), fileName(file)) == FcTrue) continue;
    std::fprintf(stderr, "brimol: cannot use the font file %s; texts may look different\n", file);
  }
  return config;
}

FontMap mapOf(FcConfig* config) {
  FontMap map(pango_cairo_font_map_new_for_font_type(CAIRO_FONT_TYPE_FT));
  pango_fc_font_map_set_config(PANGO_FC_FONT_MAP(map.get()), config);
  pango_cairo_font_map_set_resolution(PANGO_CAIRO_FONT_MAP(map.get()), kDotsPerInch);
  return map;
}

// That any of the fonts draws.
CharacterSet charactersOf(FcConfig* config) {
  CharacterSet found(FcCharSetCreate());
  const FcFontSet* const fonts = FcConfigGetFonts(config, FcSetApplication);
  if (fonts == nullptr) return found;
  for (const FcPattern* const font :
       std::span(fonts->fonts, static_cast<std::size_t>(fonts->nfont))) {
    FcCharSet* characters = nullptr;
    if (FcPatternGetCharSet(font, FC_CHARSET, 0, &characters) != FcResultMatch) continue;
    FcCharSetMerge(found.get(), characters, nullptr);
  }
  return found;
}

struct OptionsDeleter {
  void operator()(cairo_font_options_t* options) const { cairo_font_options_destroy(options); }
};

TextContext contextOf(PangoFontMap* map) {
  TextContext context(pango_font_map_create_context(map));
  const std::unique_ptr<cairo_font_options_t, OptionsDeleter> options(cairo_font_options_create());
  cairo_font_options_set_antialias(options.get(), CAIRO_ANTIALIAS_GRAY);
  cairo_font_options_set_hint_style(options.get(), CAIRO_HINT_STYLE_NONE);
  cairo_font_options_set_hint_metrics(options.get(), CAIRO_HINT_METRICS_OFF);
  pango_cairo_context_set_font_options(context.get(), options.get());
  pango_context_set_round_glyph_positions(context.get(), FALSE);
  pango_context_set_language(context.get(), pango_language_from_string(kLanguage));
  pango_context_set_base_dir(context.get(), PANGO_DIRECTION_LTR);
  return context;
}

// What nobody has borrowed. Fonts are never destroyed: Pango matches them on a thread of its own,
// which may still put its last match away, and would then find no map to put it into.
struct Shelf {
  std::mutex mutex;
  std::vector<Fonts*> fonts;  // guarded by mutex
};
Shelf& gShelf = *new Shelf;

}  // namespace

FontDescription projectFonts(int size) {
  FontDescription font(pango_font_description_new());
  pango_font_description_set_family_static(font.get(), kFamilies);
  pango_font_description_set_absolute_size(font.get(), static_cast<double>(size) * PANGO_SCALE);
  return font;
}

// The configuration becomes the process's own before Pango first looks for one: the machine's is
// then never read, which saves its time and its complaints.
Fonts::Context::Context(std::span<const char* const> files) : config(makeConfig(files)) {
  FcConfigSetCurrent(config.get());
  map = mapOf(config.get());
  placing = contextOf(map.get());
}

Fonts::Fonts() : common(kCommonFiles), commonCharacters(charactersOf(common.config.get())) {}

PangoContext* Fonts::contextFor(std::string_view words) {
  if (isDrawnByCommon(words)) return common.placing.get();
  if (!all) all.emplace(kFontFiles);
  return all->placing.get();
}

// Control characters only lay out what stands around them.
bool Fonts::isDrawnByCommon(gunichar letter) const {
  return g_unichar_iscntrl(letter) != FALSE ||
         FcCharSetHasChar(commonCharacters.get(), letter) != FcFalse;
}

// Bytes that are no UTF-8 draw the replacement character, each of them.
bool Fonts::isDrawnByCommon(std::string_view words) const {
  constexpr gunichar kReplacement = 0xFFFD;
  constexpr auto kError = static_cast<gunichar>(-2);  // and above
  while (!words.empty()) {
    const gunichar found =
        g_utf8_get_char_validated(words.data(), static_cast<gssize>(words.size()));
    const bool isError = found >= kError;
    const gunichar letter = isError ? kReplacement : found;
    if (!isDrawnByCommon(letter)) return false;
    words.remove_prefix(isError ? 1 : static_cast<std::size_t>(g_unichar_to_utf8(letter, nullptr)));
  }
  return true;
}

void FontsReturner::operator()(Fonts* fonts) const {
  const std::lock_guard lock(gShelf.mutex);
  gShelf.fonts.push_back(fonts);
}

BorrowedFonts borrowFonts() {
  const std::lock_guard lock(gShelf.mutex);
  if (gShelf.fonts.empty()) return BorrowedFonts(new Fonts);
  Fonts* const fonts = gShelf.fonts.back();
  gShelf.fonts.pop_back();
  return BorrowedFonts(fonts);
}

}  // namespace brimol::pc
