#include "remote/connections.h"

namespace brimol::pc {

void Connections::add(lws* connection, Time now) {
  known[connection] = {++soFar, now, kToIntroduce};
}

void Connections::setLimit(lws* connection, std::chrono::seconds limit) {
  if (const auto found = known.find(connection); found != known.end()) found->second.limit = limit;
}

Connections::Time Connections::endOf(lws* connection) const {
  const auto found = known.find(connection);
  return found == known.end() ? Time() : found->second.begin + found->second.limit;
}

lws* Connections::oldest(const std::function<bool(lws*)>& isAdmitted) const {
  auto found = known.end();
  for (auto each = known.begin(); each != known.end(); ++each) {
    const bool isOlder = found == known.end() || each->second.number < found->second.number;
    if (isOlder && !isAdmitted(each->first)) found = each;
  }
  return found == known.end() ? nullptr : found->first;
}

}  // namespace brimol::pc
