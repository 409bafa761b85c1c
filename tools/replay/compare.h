/// Two runs, frame by frame and picture by picture.
#pragma once

#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

#include "session.h"

namespace brimol::replay {

/// A frame of this run and the one of the other run that it corresponds to.
struct FramePair {
  enum class Kind {
    Same,
    Moved,     // the same at another time
    Differs,   // other items or another picture
    OnlyHere,  // no frame of the other run corresponds
    OnlyThere,
  };
  static constexpr std::size_t kNone = SIZE_MAX;

  Kind kind = Kind::Same;
  std::size_t here = kNone;  // an index of the session's frames
  std::size_t there = kNone;
  int64_t pixels = 0;        // that differ
  std::string picture = {};  // PNG: what differs; empty without pixels

  bool isDifferent() const { return kind != Kind::Same; }
};

struct PlayedRun {
  std::filesystem::path folder;
  Session session;
};

struct Comparison {
  std::vector<FramePair> pairs;  // in the order of the frames
  std::size_t differences = 0;   // pairs that are not the same
};

/// Frames correspond if their items are the same; what stands between such frames on both sides
/// corresponds in its order. Frames without pictures are compared by their items alone. Pictures of
/// what differs are made for the first `mostPictures`.
Comparison compare(const PlayedRun& here, const PlayedRun& there, std::size_t mostPictures);

}  // namespace brimol::replay
