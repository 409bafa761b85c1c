/// What the gallery shows: examples of the toolkit's widgets, in families.
#pragma once

#include <MW/records.h>

#include <functional>
#include <span>
#include <string>
#include <string_view>

namespace gallery {

/// The main loop of an application. An example makes its widgets, runs the loop, and deletes them
/// when the loop returns.
class Loop {
 public:
  virtual ~Loop() = default;
  Loop() = default;
  Loop(const Loop&) = delete;
  Loop& operator=(const Loop&) = delete;

  /// In each frame it calls `draw`, and then draws the window's widgets.
  using Draw = std::function<void()>;
  virtual void operator()(const Draw& draw) = 0;
  void operator()() {
    (*this)([] {});
  }
};

/// The part of the screen that an example's picture shows: per cent of its height.
struct View {
  int top;
  int bottom;
};
inline constexpr View kStrip = {0, 15};
inline constexpr View kThird = {0, 34};
inline constexpr View kHalf = {0, 50};
inline constexpr View kMiddle = {31, 69};
inline constexpr View kWhole = {0, 100};

/// The screen in the picture, in pixels.
struct ScreenSize {
  int width;
  int height;
};
inline constexpr ScreenSize kPhone = {1440, 2560};

struct Example {
  const char* name;   ///< of its files
  const char* title;  ///< what it shows, in a few words
  const char* about;  ///< a sentence or two; may be empty
  View view;
  /// Its code, as it is shown: the text between the braces.
  void (*run)(Loop& loop);
  /// Where its widgets stand. Those of the top layer keep events from the base layer.
  MW::LayerNumber layer = MW::kBaseLayer;
  /// The picture is taken so many milliseconds after it appeared.
  unsigned int age = 0;
  ScreenSize screen = kPhone;
};

/// How the document shows examples: each by itself, or many side by side.
enum class Shelf { Single, Grid };

struct Family {
  const char* name;
  const char* about;
  std::string_view source;  ///< the file in which its examples stand
  std::span<const Example> examples;
  Shelf shelf = Shelf::Single;
  const char* shared = nullptr;  ///< how the function begins that its examples share
};

/// All families, in the order in which they are shown.
std::span<const Family> families();

/// The lines of code that make an example, as they stand in its family's source.
std::string codeOf(const Family& family, const Example& example);
/// A whole function of a source, by its first words; empty where there is none.
std::string functionIn(std::string_view source, std::string_view beginning);

}  // namespace gallery
