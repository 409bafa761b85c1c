/// What applications show on a screen of 1440 x 2560 pixels, frame by frame. What differs between
/// the frames of two numbers that follow each other is what is painted.
#pragma once

#include "scene/scene.h"

namespace scenes {

using brimol::pc::Frame;

inline constexpr brimol::pc::Size kScreen = {1440, 2560};

/// The whole screen in one colour, and in another one.
Frame fill(int number);

/// Fourteen rows of text; the ground changes, so that all of it is painted.
Frame menu(int number);
Frame menuWithNewTexts(int number);
Frame menuWithOneNewText(int number);
Frame menuScrolled(int number);
/// The face of one button.
Frame menuWithPress(int number);
/// A veil that becomes darker.
Frame menuUnderVeil(int number);

/// Rows of text, each as wide as the screen.
Frame list(int number);
/// By ten pixels a frame.
Frame listScrolled(int number);

/// Keys of one character.
Frame keyboard(int number);

/// A ground, a veil, and a dialog with a title, three lines and two buttons.
Frame veilWithDialog(int number);

/// Sixty lines of eighty characters; the ground changes.
Frame log(int number);
Frame logMovedByALine(int number);
Frame logWithNewLines(int number);

/// The list, always the same.
Frame nothingChanged(int number);

}  // namespace scenes
