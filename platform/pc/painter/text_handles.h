/// Owners of Pango's and Fontconfig's reference-counted objects.
#pragma once

#include <fontconfig/fontconfig.h>
#include <pango/pango.h>

#include <memory>

namespace brimol::pc {

struct TextDeleter {
  void operator()(FcConfig* config) const { FcConfigDestroy(config); }
  void operator()(FcCharSet* characters) const { FcCharSetDestroy(characters); }
  void operator()(PangoFontMap* map) const { g_object_unref(map); }
  void operator()(PangoContext* context) const { g_object_unref(context); }
  void operator()(PangoLayout* layout) const { g_object_unref(layout); }
  void operator()(PangoLayoutIter* iter) const { pango_layout_iter_free(iter); }
  void operator()(PangoAttrList* list) const { pango_attr_list_unref(list); }
  void operator()(PangoFontDescription* font) const { pango_font_description_free(font); }
};

using FontConfig = std::unique_ptr<FcConfig, TextDeleter>;
using CharacterSet = std::unique_ptr<FcCharSet, TextDeleter>;
using FontMap = std::unique_ptr<PangoFontMap, TextDeleter>;
using TextContext = std::unique_ptr<PangoContext, TextDeleter>;
using TextLayout = std::unique_ptr<PangoLayout, TextDeleter>;
using LayoutIterator = std::unique_ptr<PangoLayoutIter, TextDeleter>;
using AttributeList = std::unique_ptr<PangoAttrList, TextDeleter>;
using FontDescription = std::unique_ptr<PangoFontDescription, TextDeleter>;

}  // namespace brimol::pc
