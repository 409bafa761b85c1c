/// A bounded cache that forgets first what was asked for least recently.
#pragma once

#include <functional>
#include <list>
#include <map>
#include <utility>

namespace brimol::pc {

/// Values by key, each with a cost; together they cost at most `bound`. Keys are ordered by `Less`,
/// which may take what stands for a key. One thread uses it.
template <class Key, class Value, class Less = std::less<>>
class LruCache {
 public:
  explicit LruCache(std::size_t costBound) : bound(costBound) {}

  /// The value, valid until the next put(), or null.
  template <class Wanted>
  Value* find(const Wanted& key) {
    const auto found = places.find(key);
    if (found == places.end()) return nullptr;
    entries.splice(entries.begin(), entries, found->second);
    return &found->second->value;
  }

  /// Keeps `value` in place of an older one of that key. It stays until the next put() even if it
  /// alone costs more than the bound.
  Value& put(Key key, Value value, std::size_t cost) {
    remove(key);
    entries.push_front({std::move(key), std::move(value), cost});
    places.emplace(entries.front().key, entries.begin());
    total += cost;
    while (total > bound && entries.size() > 1) remove(entries.back().key);
    return entries.front().value;
  }

  std::size_t size() const { return entries.size(); }
  std::size_t cost() const { return total; }

 private:
  struct Entry {
    Key key;
    Value value;
    std::size_t cost;
  };

  void remove(const Key& key) {
    const auto found = places.find(key);
    if (found == places.end()) return;
    const auto entry = found->second;
    total -= entry->cost;
    places.erase(found);
    entries.erase(entry);
  }

  std::list<Entry> entries;  // the most recently used first
  std::map<Key, typename std::list<Entry>::iterator, Less> places;
  std::size_t bound;
  std::size_t total = 0;
};

}  // namespace brimol::pc
