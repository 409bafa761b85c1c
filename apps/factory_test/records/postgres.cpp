#include "records/postgres.h"

#include <poll.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <string_view>
#include <utility>

namespace factory_test {

namespace {

constexpr const char* kName = "the line's database: ";

// The server's words, which may have several lines, as one.
std::string oneLine(std::string text) {
  while (!text.empty() && text.back() == '\n') text.pop_back();
  for (auto at = text.find('\n'); at != std::string::npos; at = text.find('\n', at)) {
    text.replace(at, 1, "; ");
  }
  return text;
}

// What says which database is meant.
constexpr auto kPlaceNames =
    std::to_array<std::string_view>({"service", "host", "hostaddr", "port", "dbname"});

struct SettingsFreer {
  void operator()(PQconninfoOption* settings) const { PQconninfoFree(settings); }
};
using Settings = std::unique_ptr<PQconninfoOption, SettingsFreer>;

// Null, with the reason: `url` cannot be read.
Settings parsed(const std::string& url, std::string& error) {
  char* message = nullptr;
  Settings settings(PQconninfoParse(url.c_str(), &message));
  if (message != nullptr) error = oneLine(message);
  PQfreemem(message);
  return settings;
}

bool isGood(const PGresult* result) {
  const ExecStatusType status = PQresultStatus(result);
  return status == PGRES_COMMAND_OK || status == PGRES_TUPLES_OK;
}

Cells rowOf(const PGresult* result, int row) {
  Cells cells;
  for (int column = 0; column < PQnfields(result); ++column) {
    if (PQgetisnull(result, row, column) != 0) {
      cells.emplace_back();
    } else {
      cells.emplace_back(PQgetvalue(result, row, column));
    }
  }
  return cells;
}

}  // namespace

std::string wrongPostgresUrl(const std::string& text) {
  if (!text.starts_with("postgresql://") && !text.starts_with("postgres://")) {
    return "needs an address like postgresql://host/database";
  }
  std::string error;
  return parsed(text, error) ? "" : "is no address: " + error;
}

std::string postgresPlace(const std::string& url) {
  std::string unused;
  const auto settings = parsed(url, unused);
  std::string place;
  for (const auto* each = settings.get(); each != nullptr && each->keyword != nullptr; ++each) {
    if (each->val == nullptr || std::ranges::count(kPlaceNames, each->keyword) == 0) continue;
    place.append(each->keyword).append("=").append(each->val).append(" ");
  }
  return place;
}

Postgres::Postgres(const std::string& url, int stopDescriptor)
    : handle(PQconnectStart(url.c_str())), stop(stopDescriptor) {
  connect();
  check(PQsetnonblocking(handle.get(), 1) == 0);
  // Notices would go to stderr.
  PQsetNoticeReceiver(
      handle.get(), [](auto*, const PGresult*) {}, nullptr);
  runAll("set search_path to factory_test; set time zone 'UTC'");
}

void Postgres::connect() {
  check(handle != nullptr && PQstatus(handle.get()) != CONNECTION_BAD);
  PostgresPollingStatusType state = PGRES_POLLING_WRITING;
  while (state != PGRES_POLLING_OK) {
    wait(state == PGRES_POLLING_READING ? POLLIN : POLLOUT);
    state = PQconnectPoll(handle.get());
    check(state != PGRES_POLLING_FAILED);
  }
}

void Postgres::check(bool isDone) const {
  if (isDone) return;
  throw StoreError(kName + oneLine(handle == nullptr ? "no memory" : PQerrorMessage(handle.get())));
}

void Postgres::wait(short events) {
  std::array<pollfd, 2> ready = {{{PQsocket(handle.get()), events, 0}, {stop, POLLIN, 0}}};
  constexpr std::chrono::milliseconds kMost = kAnswerTime;
  int count = -1;
  do count = ::poll(ready.data(), ready.size(), static_cast<int>(kMost.count()));
  while (count < 0 && errno == EINTR);
  if (ready[1].revents != 0) throw StoreError(std::string(kName) + "called off");
  if (count == 0) throw StoreError(std::string(kName) + "does not answer");
}

void Postgres::flush() {
  for (;;) {
    const int left = PQflush(handle.get());
    check(left >= 0);
    if (left == 0) return;
    wait(POLLIN | POLLOUT);
    check(PQconsumeInput(handle.get()) == 1);  // a server that talks first waits for a reader
  }
}

Postgres::Result Postgres::answer() {
  while (PQisBusy(handle.get()) != 0) {
    wait(POLLIN);
    check(PQconsumeInput(handle.get()) == 1);
  }
  return Result(PQgetResult(handle.get()));
}

void Postgres::run(const std::string& sql, const std::vector<std::string>& parameters,
                   const RowReader& reader) {
  std::vector<const char*> values(parameters.size());
  std::ranges::transform(parameters, values.begin(), &std::string::c_str);
  check(PQsendQueryParams(handle.get(), sql.c_str(), static_cast<int>(values.size()), nullptr,
                          values.data(), nullptr, nullptr, 0) == 1);
  flush();
  while (const Result result = answer()) {
    check(isGood(result.get()));
    for (int row = 0; reader && row < PQntuples(result.get()); ++row) {
      reader(rowOf(result.get(), row));
    }
  }
}

void Postgres::runAll(const char* sql) {
  check(PQsendQuery(handle.get(), sql) == 1);
  flush();
  while (const Result result = answer()) check(isGood(result.get()));
}

std::string Postgres::cell(const std::string& sql) {
  std::string first;
  run(sql, {}, [&first](const Cells& row) { first = row.front().value_or(""); });
  return first;
}

Query queryOf(Postgres& server) {
  return [&server](const std::string& sql, const std::vector<std::string>& parameters,
                   const RowReader& reader) { server.run(sql, parameters, reader); };
}

}  // namespace factory_test
