/// The display-item table: still pictures that are drawn without a widget.
#pragma once

#include <MW/api.h>
#include <brimol/scene.h>

#include <array>

namespace MW {

/// Up to 128 display items, addressed by the index that addQueue handed out. Static members only;
/// one thread uses them. Before init(), addQueue() and getSlot() return kNotInitialised; the
/// operations that draw or change items return 0 and do nothing.
class MW_API WidgetList {
 public:
  static constexpr int kSlots = 128;  ///< of the table
  /// Result codes.
  static constexpr int kFull = -100;
  static constexpr int kIndexesUsedUp = -101;
  static constexpr int kNoMemory = -103;
  static constexpr int kNotFound = -104;
  static constexpr int kNotInitialised = -1024;

  /// A place in the table.
  struct Slot {
    int index;        ///< 0: free
    int shown;        ///< 1: drawn by show()
    SKIA_Item* item;  ///< owned by the table, null while free
  };

  /// Empties the table and opens it. Returns 1.
  static int init();
  /// Frees every item and closes the table. Returns 0.
  static int destroy();

  /// The slot of an index, or kNotFound.
  static int index2slot(int index);
  /// The first free slot, or kFull.
  static int findEmpty();
  /// Takes a free slot with a zeroed item and a new index, and returns its number; in a full table
  /// 100, the slot whose item the caller is to replace. Otherwise a negative code.
  static int getSlot();
  /// Copies the records that are not null to a new item and returns its index, or a negative code.
  /// In a full table the item of slot 100 is replaced, and its index returned. A text record's
  /// length is cut to what the record holds.
  static int addQueue(int kind, const SKIA_Rect* rect, const SKIA_Point* point,
                      const SKIA_Text* text);
  /// Does nothing: items stay until destroy(). hide(index) keeps one from being drawn. Returns
  /// is_init.
  static int remove(int index);

  /// Draws the shown items in slot order. Returns 1.
  static int show();
  /// Lets show() draw the item, or not. 1, or kNotFound.
  static int show(int index);
  static int hide(int index);
  /// Draws the shown items and a veil of 539 x 939 pixels over them, whatever the screen.
  /// Returns 1.
  static int hideShadow();

  // Changes of an item. 1, or kNotFound, which is logged; index 0 is never found.

  /// The first `len` bytes of `s`, NULs among them, cut to 127 bytes at a whole character. Null `s`
  /// is the empty text; `len` 0 changes nothing.
  static int setText(int index, const char* s, unsigned int len);
  /// Of its text, its box and its line, 0xAARRGGBB.
  static int setColor(int index, unsigned int textColor, unsigned int fillColor,
                      unsigned int lineColor);
  /// Its place and colour; the size of its text in pixels.
  static int setRect(int index, SKIA_Rect newRect);
  static int setFontSize(int index, int pixels);

  static std::array<Slot, kSlots> save;
  static int index_num;  ///< last index handed out; never reused
  static int is_init;    ///< 1 between init() and destroy()
};

}  // namespace MW
