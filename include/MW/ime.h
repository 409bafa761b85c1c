/// The on-screen keyboard.
#pragma once

#include <MW/text_panel.h>

#include <array>
#include <string_view>

namespace MW {

struct ImeKey;

/// A bar with what was typed and five rows of keys below it, in one of four layouts. See TextPanel
/// for its life and its callbacks, which are functions of an int and the keyboard.
///
/// A press types at once and calls nothing. `press_cb` and `double_tap_cb` need onPress(), which no
/// event reaches: they are called only if the application calls onPress() itself. A press on the
/// border of a key hits no key. `release_cb` is called when a finger lifts inside the keyboard, on
/// a key or not, and is the place to read what enter left in getResultString(): it runs on the
/// thread that types. It is not called for a finger that lifts outside, nor once onShowTimer() was
/// called.
///
/// The "fold" key clears the typed text and sets the fold status, which the application asks for;
/// the keyboard itself stays. In the layout of digits alone, "fold" first sets the property
/// "brimol.info_1.ime_flag" to "true".
class MW_API Ime : public TextPanel {
 public:
  /// The layouts, for presskey_set() and keyboard_change(). "shift" leads from each of the first
  /// three to the next.
  enum KeyType { kSmall = 0, kCapitals = 1, kSpecial = 2, kOnlyDigits = 3 };

  /// Copies the records; null ones are all zero. The keys stand where `area` says now, a tenth of
  /// its width and a sixth of its height each, and take the colour and size of `looks`, whose text
  /// is not shown.
  Ime(const SKIA_Rect* area, const SKIA_Text* looks);
  ~Ime() override;

  using TextPanel::show;
  using Widget::onHover;
  /// The background, and then 42 button boxes. Returns 1.
  int show(unsigned int ticks) override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  void onPressLong(event_data* event) override;
  void onTouchClickCount() override;
  /// Moves and resizes the background; the keys, the colour and the first argument stay. Null: no
  /// change.
  void setRect(int variant, const SKIA_Rect* newRect) override;

  /// The text of the last enter, of at most 99 bytes; the keyboard's own buffer. An enter
  /// overwrites its beginning only: the tail of a longer text stays until setResultString or
  /// typing_reset.
  char* getResultString();
  /// Cut to 99 bytes at a whole character. Null is the empty text.
  void setResultString(const char* result);
  /// Clears the typed text, the result and the bar's bytes, but not the bar's length.
  void typing_reset();

  /// The layout, a KeyType, that presses are read by. It relabels nothing. Another number: nothing.
  void presskey_set(unsigned int type);
  /// Relabels the keys, or with kOnlyDigits greys all but the digits and "back", "fold" and
  /// "enter". Only kSmall takes the grey away. Another number: nothing. Presses are read as before:
  /// a keyboard of digits alone needs presskey_set(kOnlyDigits), too.
  void keyboard_change(unsigned int type);
  /// Whether "fold" was typed since this was last set to false.
  bool get_fold_status();
  void set_fold_status(bool folded);

  // A press, read by the layout that the name says. Null: nothing. Up to 15 bytes are typed; "back"
  // takes one away.

  void onPressKey_small(event_data* event);
  void onPressKey_big(event_data* event);
  void onPressKey_special(event_data* event);
  void onPressKey_only_num(event_data* event);
  /// Writes a log line.
  void onHover(mouse_event mouse);

  // TextPanel and the class comment say when they are called.

  void (*press_cb)(int zero, Ime* keyboard) = nullptr;
  void (*release_cb)(int zero, Ime* keyboard) = nullptr;
  void (*long_press_cb)(int zero, Ime* keyboard) = nullptr;
  void (*double_tap_cb)(int zero, Ime* keyboard) = nullptr;

 protected:
  static constexpr std::size_t kKeys = 42;  // with the bar

  // All guarded by stateLock. Index 0 is the bar. The fold key's rectangle stands apart, so that
  // from there on a label's index is one ahead of its rectangle's.
  std::array<SKIA_Rect, kKeys - 1> key_rect = {};
  std::array<SKIA_Text, kKeys> key_text = {};
  SKIA_Rect fold_rect = {};
  ShortText temp_searched = {};  // the typed text
  ShortText result_string = {};
  int key_type = kSmall;
  bool fold_status = false;

 private:
  void tell(TextTouch what);
  SKIA_Rect& rectOf(std::size_t key);
  void layOutKeys();
  void pressKey(int layout, const event_data* event);
  int measureTyped();
  int showTyped();
  std::size_t keyAt(const mouse_event& mouse);
  void act(const ImeKey& key, int layout);
  std::size_t typedLength() const;
  void append(std::string_view typed);
  void eraseLast();
  void fold(int layout);
  void enter();
  void shift(int layout);
};

}  // namespace MW
