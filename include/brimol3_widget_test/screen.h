/// A screen that a test drives: fingers, keys and time by hand, and what stands on it.
///
///     brimol::test::Screen screen({720, 1280});
///     MyPage page;
///     screen.tap("Start");
///     screen.advance(500);
///     screen.expectText("Running");
///     goldens.expect("running", screen);
#pragma once

#include <brimol3_widget_test/failure.h>
#include <brimol3_widget_test/input.h>
#include <brimol3_widget_test/lint.h>
#include <brimol3_widget_test/picture.h>

#include <MW/window.h>

#include <functional>
#include <string>
#include <vector>

namespace brimol::test {

/// What the application does in each round of its main loop.
struct Loop {
  /// What comes before drawing: taking up what callbacks left behind.
  std::function<void()> update = [] {};
  /// Draws a frame, with what the application draws beside its widgets.
  std::function<void()> draw = [] { MW::Window::show(); };
};

/// One at a time, made and used on one thread. It stands for the application's main loop, the
/// platform and the user: it starts the toolkit and ends it. Widgets are made after it and deleted
/// before it. Its clock, which GetTicks() says, begins at startTicks() and moves with advance() and
/// with taps and keys alone; handlers run on the toolkit's own thread while the test waits for
/// them.
///
/// Texts are looked for among those that a user can read: on the screen, and not below a box that
/// is drawn later. A `*` in a text that is looked for stands for any characters and `\*` for a
/// star; apart from that the whole text has to be the same, blanks at its ends aside.
///
/// Whatever is not as expected throws Failure.
class Screen {
 public:
  /// `dpi` dots per inch; 0: unknown.
  explicit Screen(ScreenSize size, Loop loop = {}, float dpi = 0);
  /// Ends the toolkit.
  ~Screen();
  Screen(const Screen&) = delete;
  Screen& operator=(const Screen&) = delete;

  static unsigned int startTicks() { return clockBase() + 1000; }  ///< milliseconds

  // Time.

  /// Lets so many milliseconds pass, in rounds of at most 5: in each the application's loop runs,
  /// timers are run, and a frame is drawn where one is due.
  void advance(unsigned int ms);
  /// A round without time.
  void settle() { round(0); }

  // The user. A place is in pixels; a text is tapped in its middle.

  void press(Spot spot, unsigned int finger = 0);
  void moveTo(Spot spot, unsigned int finger = 0);
  void release(unsigned int finger = 0);
  /// The record that the platform sends for a finger that is held still.
  void longPress(unsigned int finger = 0);
  /// Presses, and releases 50 ms later.
  void tap(Spot spot);
  void tap(const std::string& text, const Here& here = Here::now());
  /// Moves a finger in ten steps over 200 ms.
  void drag(Spot from, Spot to);
  /// One half of key().
  void keyDown(unsigned int code);
  void keyUp(unsigned int code);
  /// Presses a key, and releases it 50 ms later.
  void key(unsigned int code);

  // What is there.

  /// The newest frame. Widgets that were made since then show in the next one, which advance(),
  /// settle() and all input draw when one is due, and draw() at once.
  const Frame& frame() const { return newest; }
  /// Draws a frame, due or not.
  void draw();
  /// In pixels.
  ScreenSize size() const { return screen; }
  /// In the order in which they are drawn.
  std::vector<std::string> texts() const;
  /// Whether a user can read it.
  bool shows(const std::string& text) const;
  /// The one item that shows the text.
  const SKIA_Item& itemOf(const std::string& text, const Here& here = Here::now()) const;
  /// The newest frame, painted.
  Picture picture() const { return paint(newest, screen); }
  /// What was there whenever a finger or a key came down, and is there now: what lint() looks at.
  std::vector<Moment> moments() const;

  void expectText(const std::string& text, const Here& here = Here::now()) const;
  void expectNoText(const std::string& text, const Here& here = Here::now()) const;
  /// Colours are 0xAARRGGBB.
  void expectTextColor(const std::string& text, uint32_t color,
                       const Here& here = Here::now()) const;
  /// Of the box on which the item draws its text.
  void expectBoxColor(const std::string& text, uint32_t color,
                      const Here& here = Here::now()) const;
  /// 0x00RRGGBB of the picture.
  void expectPixel(Spot spot, uint32_t rgb, const Here& here = Here::now()) const;
  /// That a line `TAG: MESSAGE` with the text in it was logged since the last such line. Lines
  /// before it are forgotten.
  void expectLog(const std::string& text, const Here& here = Here::now());

 private:
  void remember(Moment::Deed deed, Spot spot) { before.push_back({newest, deed, spot.x, spot.y}); }
  void post(const Event& event);
  void pointer(BrimolEventType type, unsigned int finger, Spot to);
  void round(unsigned int ms);
  std::string listOfTexts() const;

  ScreenSize screen;
  Loop loop;
  Frame newest;
  std::vector<Moment> before;
  std::vector<LogLine> unread;  // of the log
  std::vector<Spot> fingers;
};

}  // namespace brimol::test
