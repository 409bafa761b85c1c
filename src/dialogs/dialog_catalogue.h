/// The built-in dialogs as data.
#pragma once

namespace MW {

enum class Backdrop { Shadow, Alarm };
enum class Buttons { None, One, Two, Progress };
enum class SecondLine { Hidden, Drawn };

/// What dialogs of a class share.
struct DialogClass {
  int rows;  // of the frame
  Buttons buttons;
  SecondLine secondLine;
  Backdrop backdrop;
  int align;  // of title and message
};

enum DialogClassNumber {
  kStandard,
  kTwoLine,
  kHook,
  kEarjack,
  kOkOnly,
  kTouchWarning,
  kTouchCaution,
  kWait
};

/// One kind. Null texts leave what stands in the dialog.
struct DialogKind {
  int kind;
  DialogClassNumber layout;
  const char* title;
  const char* message;
  const char* second;
  const char* button1;
  const char* button2;
  int enabled1;
  int enabled2;
  int messageSize;  // pixels; 0: as the class says
  int secondSize;
};

/// The row of a kind; one without texts for a kind that is not in the table.
const DialogKind& dialogKind(int kind);
const DialogClass& dialogClass(int number);

}  // namespace MW
