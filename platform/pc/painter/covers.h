/// What later items of a frame hide of earlier ones.
#pragma once

#include <vector>

#include "scene/rectangles.h"
#include "scene/scene.h"

namespace brimol::pc {

/// The opaque boxes of a frame, as far as they are worth asking. A pixel in such a box has the
/// box's colour whatever lay there before, so that leaving out what is drawn below it changes no
/// picture. One thread uses it.
class Covers {
 public:
  /// Looks at the frame's items within `piece`.
  void collect(const Frame& frame, const Pixels& piece);

  /// Whether one of the boxes from the item of number `first` on hides all of `area`.
  bool hide(const Pixels& area, std::size_t first) const;

  /// The parts of `area` that no box from the item of number `first` on hides: disjoint, valid
  /// until the next call.
  const Region& partsInSight(const Pixels& area, std::size_t first);

  /// Both valid until the next call; disjoint.
  struct Sight {
    const Region& parts;  // in sight
    const Region& rows;   // of which only narrow ends are
  };

  /// The same for an opaque area. Rows are written faster as a whole than at their two ends alone,
  /// if the box over them is drawn right afterwards.
  Sight sightOf(const Pixels& area, std::size_t first);

 private:
  struct Cover {
    std::size_t item;
    Pixels area;
  };
  struct Rest {
    Pixels area;
    std::size_t cover;  // the next one to be asked
  };

  enum class Ends : uint8_t { Alone, WithRow };

  void split(const Pixels& area, std::size_t first, Ends ends);
  void pushAround(const Pixels& area, const Pixels& hole, std::size_t cover, Ends ends);

  std::vector<Cover> covers;  // the last items first
  std::vector<Rest> rests;    // to be looked at
  Region parts;
  Region rows;
};

}  // namespace brimol::pc
