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

/// What a text record with a size of 0 is.
enum class Unsized : uint8_t { Nothing, PictureName };

struct ItemKind {
  Ground ground;
  Figure figure;
  Unsized unsizedText;
};

/// By SKIA_ItemKind. Any other kind shows nothing.
inline constexpr auto kItemKinds = std::to_array<ItemKind>({
    {Ground::None, Figure::Text, Unsized::PictureName},  // SKIA_LABEL
    {Ground::Square, Figure::Text, Unsized::Nothing},    // SKIA_TEXTBOX
    {Ground::Square, Figure::Text, Unsized::Nothing},    // SKIA_BUTTONBOX
    {Ground::Square, Figure::None, Unsized::Nothing},    // SKIA_BOX
    {Ground::Round, Figure::None, Unsized::Nothing},     // SKIA_ROUNDBOX
    {Ground::Square, Figure::Text, Unsized::Nothing},    // SKIA_STATICBOX
    {Ground::None, Figure::Line, Unsized::Nothing},      // SKIA_LINE
    {Ground::None, Figure::Picture, Unsized::Nothing},   // SKIA_IMAGE
    {Ground::Round, Figure::Text, Unsized::Nothing},     // SKIA_ROUNDTEXTBOX
    {Ground::Round, Figure::Text, Unsized::Nothing},     // SKIA_ROUNDBUTTONBOX
    {Ground::None, Figure::Arrow, Unsized::Nothing},     // SKIA_ARROW
});
static_assert(kItemKinds.size() == SKIA_ARROW + 1);
static_assert(kItemKinds[SKIA_LINE].figure == Figure::Line);

constexpr bool isKnownKind(int32_t kind) {
  return kind >= 0 && static_cast<std::size_t>(kind) < kItemKinds.size();
}

/// The item's row in the table, or a row that shows nothing.
ItemKind kindOf(const SKIA_Item& item);

/// What the item draws, once the oddity of unsized labels is settled.
Figure figureOf(const SKIA_Item& item);

/// A colour's alpha byte.
constexpr uint32_t alphaOf(uint32_t color) { return color >> 24; }
inline constexpr uint32_t kOpaque = 0xFF;

/// The bytes of the record that are drawn: up to the NUL, and never past the record.
std::string_view shownText(const SKIA_Text& text);

/// Whether both draw the same, as far as their words tell.
bool drawTheSame(const SKIA_Item& one, const SKIA_Item& other);

/// Every pixel in `limits` that the item can touch.
Pixels boundsOf(const SKIA_Item& item, const Pixels& limits);

}  // namespace brimol::pc
