/// Who is connected, and how long each may stay without the password.
#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>

struct lws;

namespace brimol::pc {

/// Times count from a connection's begin: nothing that it sends begins them anew.
class Connections {
 public:
  using Time = std::chrono::steady_clock::time_point;
  static constexpr std::size_t kMost = 64;
  /// For a request, and for a viewer's password.
  static constexpr std::chrono::seconds kToIntroduce{5};
  /// While a file is sent to it.
  static constexpr std::chrono::seconds kToFetch{20};

  void add(lws* connection, Time now);
  void remove(lws* connection) { known.erase(connection); }
  bool contains(lws* connection) const { return known.contains(connection); }
  bool isFull() const { return known.size() >= kMost; }

  void beginFile(lws* connection) { setLimit(connection, kToFetch); }
  void endFile(lws* connection) { setLimit(connection, kToIntroduce); }
  /// When it has to go; now for one that is not known.
  Time endOf(lws* connection) const;

  /// The oldest one that `isAdmitted` is false for; null where there is none.
  lws* oldest(const std::function<bool(lws*)>& isAdmitted) const;

 private:
  struct Stay {
    uint64_t number;  // ascending by age
    Time begin;
    std::chrono::seconds limit;
  };
  void setLimit(lws* connection, std::chrono::seconds limit);

  std::map<lws*, Stay> known;
  uint64_t soFar = 0;
};

}  // namespace brimol::pc
