/// A bounded cache that forgets first what was asked for least recently.
#pragma once

#include <functional>
#include <iterator>
#include <list>
#include <set>
#include <utility>

namespace brimol::pc {

/// Values by key, each with a cost; together they cost at most `bound`. Keys are ordered by `Less`,
/// which may take what stands for a key. One thread uses it.
template <class Key, class Value, class Less = std::less<>>
class LruCache {
 public:
  explicit LruCache(std::size_t costBound) : bound(costBound) {}

  /// The value, valid until the next put() or clear(), or null.
  template <class Wanted>
  Value* find(const Wanted& key) {
    const auto found = places.find(key);
    if (found == places.end()) return nullptr;
    entries.splice(entries.begin(), entries, *found);
    return &entries.front().value;
  }

  /// Keeps `value` in place of an older one of that key. It stays until the next put() even if it
  /// alone costs more than the bound.
  Value& put(Key key, Value value, std::size_t cost) {
    if (const auto older = places.find(key); older != places.end()) remove(older);
    entries.push_front({std::move(key), std::move(value), cost});
    places.insert(entries.begin());
    total += cost;
    while (total > bound && entries.size() > 1) remove(places.find(entries.back().key));
    return entries.front().value;
  }

  void clear() {
    places.clear();
    entries.clear();
    total = 0;
  }

  std::size_t size() const { return entries.size(); }
  std::size_t cost() const { return total; }

 private:
  struct Entry {
    Key key;
    Value value;
    std::size_t cost;
  };
  using Entries = std::list<Entry>;
  using Place = typename Entries::iterator;

  // Orders the places by the keys that stand there.
  struct ByKey {
    using is_transparent = void;
    static const Key& keyAt(const Place& place) { return place->key; }
    template <class Wanted>
    static const Wanted& keyAt(const Wanted& key) {
      return key;
    }
    template <class One, class Other>
    bool operator()(const One& one, const Other& other) const {
      return Less()(keyAt(one), keyAt(other));
    }
  };
  using Places = std::set<Place, ByKey>;

  void remove(typename Places::iterator found) {
    const auto entry = *found;
    total -= entry->cost;
    places.erase(found);
    entries.erase(entry);
  }

  Entries entries;  // the most recently used first
  Places places;
  std::size_t bound;
  std::size_t total = 0;
};

}  // namespace brimol::pc
