#include "compare.h"

#include <algorithm>
#include <utility>

#include "album.h"
#include "picture.h"

namespace brimol::replay {

namespace {

using Frames = std::vector<Frame>;
using Kind = FramePair::Kind;
using Match = std::pair<std::size_t, std::size_t>;

constexpr std::size_t kMostCells = std::size_t{1} << 24;  // of the table below

/// A part of both runs.
struct Span {
  std::size_t here, hereEnd, there, thereEnd;
};

// The longest row of frames whose items are the same on both sides, in the order of both.
std::vector<Match> longestMatches(const Frames& here, const Frames& there, const Span& span) {
  const std::size_t rows = span.hereEnd - span.here;
  const std::size_t columns = span.thereEnd - span.there;
  if (rows == 0 || columns == 0 || rows > kMostCells / columns) return {};
  const std::size_t width = columns + 1;
  std::vector<uint32_t> lengths((rows + 1) * width);  // from each pair of frames to the end
  const auto isSame = [&](std::size_t row, std::size_t column) {
    return here[span.here + row].hash == there[span.there + column].hash;
  };
  for (std::size_t row = rows; row-- > 0;) {
    for (std::size_t column = columns; column-- > 0;) {
      uint32_t* const cell = &lengths[row * width + column];
      *cell = isSame(row, column) ? cell[width + 1] + 1 : std::max(cell[1], cell[width]);
    }
  }
  std::vector<Match> matches;
  for (std::size_t row = 0, column = 0; row < rows && column < columns;) {
    const uint32_t* const cell = &lengths[row * width + column];
    if (isSame(row, column)) {
      matches.emplace_back(span.here + row++, span.there + column++);
    } else {
      (cell[width] >= cell[1] ? row : column) += 1;
    }
  }
  return matches;
}

// What begins and ends alike needs no table.
std::vector<Match> matchesOf(const Frames& here, const Frames& there) {
  Span span = {0, here.size(), 0, there.size()};
  std::vector<Match> matches;
  while (span.here < span.hereEnd && span.there < span.thereEnd &&
         here[span.here].hash == there[span.there].hash) {
    matches.emplace_back(span.here++, span.there++);
  }
  std::vector<Match> tail;
  while (span.here < span.hereEnd && span.there < span.thereEnd &&
         here[span.hereEnd - 1].hash == there[span.thereEnd - 1].hash) {
    tail.emplace_back(--span.hereEnd, --span.thereEnd);
  }
  const std::vector<Match> middle = longestMatches(here, there, span);
  matches.insert(matches.end(), middle.begin(), middle.end());
  matches.insert(matches.end(), tail.rbegin(), tail.rend());
  return matches;
}

// The frames before `end` on both sides, in pairs as far as they go.
void addUnlike(Match& at, const Match& end, std::vector<FramePair>& pairs) {
  auto& [here, there] = at;
  while (here < end.first && there < end.second) pairs.push_back({Kind::Differs, here++, there++});
  while (here < end.first) pairs.push_back({Kind::OnlyHere, here++});
  while (there < end.second) pairs.push_back({Kind::OnlyThere, FramePair::kNone, there++});
}

std::vector<FramePair> pairsOf(const Frames& here, const Frames& there) {
  std::vector<FramePair> pairs;
  Match at = {0, 0};
  for (const Match& match : matchesOf(here, there)) {
    addUnlike(at, match, pairs);
    const bool isInTime = here[match.first].time == there[match.second].time;
    pairs.push_back({isInTime ? Kind::Same : Kind::Moved, match.first, match.second});
    at = {match.first + 1, match.second + 1};
  }
  addUnlike(at, {here.size(), there.size()}, pairs);
  return pairs;
}

void comparePictures(const PlayedRun& here, const PlayedRun& there, bool isShown, FramePair& pair) {
  const auto bytes = [](const PlayedRun& run, std::size_t frame) {
    const auto file = fileOf(run.folder, run.session.frames[frame].picture);
    return file ? bytesOf(*file) : std::string();
  };
  const std::string mine = bytes(here, pair.here);
  const std::string theirs = bytes(there, pair.there);
  if (mine == theirs) return;
  const Surface one = decodePng(mine);
  const Surface other = decodePng(theirs);
  if (!one || !other) return;
  Difference difference = differenceOf(one, other);
  pair.pixels = difference.pixels;
  if (difference.pixels == 0) return;
  pair.kind = Kind::Differs;
  if (isShown) pair.picture = encodePng(difference.picture);
}

}  // namespace

Comparison compare(const PlayedRun& here, const PlayedRun& there, std::size_t mostPictures) {
  Comparison comparison{pairsOf(here.session.frames, there.session.frames)};
  for (FramePair& pair : comparison.pairs) {
    const bool isPair = pair.here != FramePair::kNone && pair.there != FramePair::kNone;
    if (isPair) comparePictures(here, there, comparison.differences < mostPictures, pair);
    if (pair.isDifferent()) ++comparison.differences;
  }
  return comparison;
}

}  // namespace brimol::replay
