/// A choice of one among several.
#pragma once

#include <MW/framed_dialog.h>

#include <array>

namespace MW {

/// A modal choice: a title, two to eight rows with a check box each, and the buttons "CANCEL" and
/// "OK".
///
/// addIndex() fills it, initFinish() ends that, and setActive(1) brings it up: before initFinish()
/// it draws nothing. A press on a row marks it. The rows may be changed by any thread; that raises
/// no redraw flag (isDisplayUpdate(1) does).
///
/// The finger that presses a button or the body holds the dialog until it lifts, and reaches only
/// what it pressed. Meanwhile touches of other fingers are not taken, and no callback gets them.
/// The dialog takes the press, the motion of the finger that holds (but not after lcdOn(0)), and
/// every release, unless another finger holds it.
///
/// Callbacks as for FramedDialog, but three are of one int*, valid for the call: `rowPressCallback`
/// gets the pressed row; `button1Callback` ("CANCEL"; the dialog stays up) the row confirmed last,
/// to which the mark goes back; `button2Callback` ("OK"; the dialog has hidden itself) the marked
/// row, which becomes the confirmed one. A button whose callback is null leaves both rows as they
/// are.
class MW_API DialogList : public FramedDialog {
 public:
  static constexpr int kRows = 8;      ///< the most that a list has
  static constexpr int kNoRow = -100;  ///< in the place of a row's number

  /// At most 127 bytes of the title are taken. Null is the empty text.
  explicit DialogList(const char* title);
  ~DialogList() override;

  using Widget::show;
  /// Draws it after initFinish(), be it active or not. Returns 1.
  int show(unsigned int ticks) override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;

  using Widget::setText;
  /// What the constructor does: an empty list, inactive, without callbacks, and registered. A
  /// further call registers the dialog a second time: each drawing pass then draws it twice.
  void init_DialogList();
  /// Takes all rows away; they may be added again.
  void initIndex();
  /// Appends a row and returns its number, from 0. -1: the list is full or finished, the text is
  /// null or longer than 126 bytes. The text is copied.
  int addIndex(const char* rowText);
  /// Replaces the text of row `index`. Any other number, or a text that is null, empty or longer
  /// than 126 bytes, changes nothing that is drawn.
  void setText(int index, const char* rowText);
  /// Ends the filling and lays it out. `index`: the marked and confirmed row; with kNoRow, or any
  /// other number that is not a row's, none is marked. Returns the number of rows.
  int initFinish(int index);
  /// Lays it out on the present screen for `rowCount` rows. With fewer than 2 or more than 8 the
  /// layout stays as it was: at first everything has no size, and so nothing can be touched.
  /// `index` as for initFinish().
  void setRect_static(int rowCount, int index);
  /// The row at a touch on its check box, its text or between them; kNoRow elsewhere.
  int position2index(mouse_event mouse);
  /// Parts of onRecvEvent(); see Widget::onHover().
  void onListPress(mouse_event mouse);
  void onBtn1Released(mouse_event mouse);
  void onBtn2Released(mouse_event mouse);

 protected:
  /// A row of the list.
  struct Row {
    SKIA_Rect box = {};   // the check box
    SKIA_Rect area = {};  // of the text
    SKIA_Text text = {};  // what is chosen
  };

  // All are guarded by stateLock.
  std::array<Row, kRows> rows = {};
  int listEnabled = 1;
  int count = 0;
  int initFinished = 0;
  int selectedIndex = kNoRow;
  int committedIndex = kNoRow;

 private:
  void layOut(int rowCount, int index);
  bool pressTarget(event_data* event);
  bool releaseTarget(event_data* event);
  bool isOnRows(const event_data* event) const;
  int rowAt(const mouse_event& mouse) const;
  void enable(int first, int second, int list);
};

}  // namespace MW
