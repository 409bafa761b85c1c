#include "host/world.h"

namespace brimol::pc {

void World::change(const WorldChange& wanted, uint64_t now) {
  switch (wanted.kind) {
    case WorldChange::Kind::Time: utcAtStart = wanted.number - now; return;
    case WorldChange::Kind::Random: randomState = wanted.number; return;
    case WorldChange::Kind::Figure: figures[wanted.name] = {wanted.value, now}; return;
  }
}

// SplitMix64: small, and the same everywhere.
uint32_t World::random() {
  constexpr uint64_t kStep = 0x9e3779b97f4a7c15;
  constexpr uint64_t kFirst = 0xbf58476d1ce4e5b9;
  constexpr uint64_t kSecond = 0x94d049bb133111eb;
  uint64_t mixed = randomState += kStep;
  mixed = (mixed ^ (mixed >> 30)) * kFirst;
  mixed = (mixed ^ (mixed >> 27)) * kSecond;
  return static_cast<uint32_t>((mixed ^ (mixed >> 31)) >> 32);
}

std::string World::figure(const std::string& name) const {
  const auto found = figures.find(name);
  return found == figures.end() ? "" : found->second.value;
}

std::string World::record(const std::string& name, const std::string& real, uint64_t now,
                          bool& isNew) {
  const auto [place, isFirst] = figures.try_emplace(name, Figure{real, now});
  Figure& known = place->second;
  isNew = isFirst || (known.asked != now && known.value != real);
  if (isNew) known.value = real;
  known.asked = now;
  return known.value;
}

}  // namespace brimol::pc
