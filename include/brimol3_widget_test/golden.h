/// Golden files: what a screen looked like when somebody last looked at it.
#pragma once

#include <brimol3_widget_test/failure.h>
#include <brimol3_widget_test/picture.h>

#include <filesystem>
#include <string>

namespace brimol::test {

class Screen;

/// What a comparison of pictures came to, where it did not fail.
enum class Compared {
  Same,
  /// Fonts and libraries of this machine paint other pixels than those of the machine that made the
  /// goldens, so pictures say nothing here.
  OtherRenderer
};

/// Compares frames with files: NAME.items.txt, the list of display items, which is the same on
/// every machine, and NAME.png. Where the environment sets BRIMOL_RENEW_GOLDENS to anything but 0,
/// the files are written instead and nothing fails: look at each of them before you commit it.
///
/// canary.png in the same folder tells whether this machine paints as the one did that made the
/// pictures. Where it does not, pictures are not compared, unless the environment sets
/// BRIMOL_REFERENCE_RENDERER: then it is a failure.
class Goldens {
 public:
  /// `goldenFolder` holds the files, and is made when they are renewed. What differs is written
  /// into `resultFolder`, which is made for it.
  explicit Goldens(std::filesystem::path goldenFolder,
                   std::filesystem::path resultFolder = "golden_results");

  /// The frame's items. Throws Failure with the first line that differs, and where the list was
  /// written (NAME.actual.items.txt); also where there is no such golden.
  void expectItems(const std::string& name, const Frame& frame, const Here& here = Here::now());
  /// A picture. Throws Failure with how many pixels differ, the first of them, and where
  /// NAME.expected.png, NAME.actual.png and NAME.difference.png were written; the last shows in red
  /// what differs.
  Compared expectPicture(const std::string& name, const Picture& actual,
                         const Here& here = Here::now());
  /// Both, of a screen's newest frame.
  Compared expect(const std::string& name, const Screen& screen, const Here& here = Here::now());

 private:
  bool isReferenceRenderer(const Here& here);
  void renewPicture(const std::string& name, const Picture& picture, const Here& here);

  std::filesystem::path folder;
  std::filesystem::path results;
};

}  // namespace brimol::test
