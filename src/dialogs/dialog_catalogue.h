/// The built-in dialogs as data.
#pragma once

#include <MW/dialog.h>

#include <cstdint>

namespace MW {

enum class Buttons { None, One, Two, Progress };
enum class SecondLine { Hidden, Drawn };

/// What the kinds of one layout share.
struct DialogLayout {
  Dialog::Layout number;
  int rows;  // of the frame
  Buttons buttons;
  SecondLine secondLine;
  int align;  // of title and message
  uint32_t backdrop;
};

/// What stands below the title. Null: no second line.
struct Lines {
  const char* first = nullptr;
  const char* second = nullptr;
};

/// The buttons that touches reach, drawn or not.
enum class Touches { None, Left, Both };

/// What stands on the buttons (null: nothing), and which of them answer.
struct ButtonRow {
  const char* left = nullptr;
  const char* right = nullptr;
  Touches touches = Touches::Both;
};

/// What one kind says. Null texts leave what stands in the dialog.
struct CatalogueEntry {
  int kind;
  Dialog::Layout layout;
  const char* title;
  Lines lines;
  ButtonRow buttons;
  int letterSize = 0;  // of the lines that are given, in pixels; 0: as the layout says
};

/// The entry of a kind; one without texts for a number that is not in the catalogue.
const CatalogueEntry& catalogueEntry(int kind);
/// The layout of a kind.
const DialogLayout& dialogLayout(int kind);

}  // namespace MW
