/// What the kinds of display items show, which of an item's words they read, and where they draw.
#pragma once

#include <brimol/scene.h>

#include <array>
#include <string_view>

#include "scene/rectangles.h"

namespace brimol::pc {

/// The box below an item's figure, in the rectangle's colour.
enum class Ground : uint8_t { None, Square, Round };

/// What an item draws besides its ground.
enum class Figure : uint8_t { None, Text, Picture, Line, Arrow };

/// What a text record with a size of 0 means.
enum class Unsized : uint8_t { Nothing, PictureName };

struct ItemKind {
  SKIA_ItemKind kind;
  Ground ground;
  Figure figure;
  Unsized unsizedText;
};

/// Whether the row of each enumerator stands where its value says.
template <class Rows, class Column>
constexpr bool isInOrder(const Rows& rows, Column column) {
  for (std::size_t i = 0; i < rows.size(); ++i) {
    if (static_cast<std::size_t>(rows[i].*column) != i) return false;
  }
  return true;
}

/// By kind. Any other kind shows nothing.
inline constexpr auto kItemKinds = std::to_array<ItemKind>({
    {SKIA_LABEL, Ground::None, Figure::Text, Unsized::PictureName},
    {SKIA_TEXTBOX, Ground::Square, Figure::Text, Unsized::Nothing},
    {SKIA_BUTTONBOX, Ground::Square, Figure::Text, Unsized::Nothing},
    {SKIA_BOX, Ground::Square, Figure::None, Unsized::Nothing},
    {SKIA_ROUNDBOX, Ground::Round, Figure::None, Unsized::Nothing},
    {SKIA_STATICBOX, Ground::Square, Figure::Text, Unsized::Nothing},
    {SKIA_LINE, Ground::None, Figure::Line, Unsized::Nothing},
    {SKIA_IMAGE, Ground::None, Figure::Picture, Unsized::Nothing},
    {SKIA_ROUNDTEXTBOX, Ground::Round, Figure::Text, Unsized::Nothing},
    {SKIA_ROUNDBUTTONBOX, Ground::Round, Figure::Text, Unsized::Nothing},
    {SKIA_ARROW, Ground::None, Figure::Arrow, Unsized::Nothing},
});
static_assert(isInOrder(kItemKinds, &ItemKind::kind));

constexpr bool isKnownKind(int32_t kind) {
  return kind >= 0 && static_cast<std::size_t>(kind) < kItemKinds.size();
}

/// The ground of the item; none where its kind is unknown.
Ground groundOf(const SKIA_Item& item);

/// What the item draws, once the oddity of unsized labels is settled; none where its kind is
/// unknown.
Figure figureOf(const SKIA_Item& item);

/// A colour's alpha byte.
constexpr uint32_t alphaOf(uint32_t color) { return color >> 24; }
inline constexpr uint32_t kOpaque = 0xFF;

/// The bytes of the record that are drawn: up to the NUL, and never past the record.
std::string_view shownText(const SKIA_Text& text);

/// Whether both draw the same, as far as their words tell.
bool drawTheSame(const SKIA_Item& one, const SKIA_Item& other);

/// Whether both draw a text, and the same besides.
bool differInTextAlone(const SKIA_Item& one, const SKIA_Item& other);

/// The pixels that the record asks the text to be high, at most kMostTextSize; 0: it is not drawn.
int textSizeOf(const SKIA_Text& text);
inline constexpr int kMostTextSize = 1024;

/// Every pixel in `limits` that the item can touch. A text reaches above and below a rectangle that
/// is lower than its lines, so that no letter is cut in height.
Pixels boundsOf(const SKIA_Item& item, const Pixels& limits);

}  // namespace brimol::pc
