#include "remote/web_server.h"

#include <netinet/in.h>
#include <netinet/tcp.h>
#include <sys/socket.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <chrono>
#include <cstdlib>
#include <optional>
#include <utility>

#include "remote/hosts.h"
#include "remote/signals.h"
#include "remote/web_answers.h"
#include "remote/web_replies.h"

namespace brimol::pc {
namespace {

constexpr std::size_t kMaxViewers = 16;
constexpr int kSecondsToRead = 20;  // something of what waits
// Of time after a wrong password in which no viewer is asked for one.
constexpr std::chrono::milliseconds kPause{250};
constexpr std::size_t kChunk = std::size_t{1} << 16;
constexpr std::size_t kEnoughForServer = std::size_t{1} << 16;
constexpr const char* kProtocol = "screen";

constexpr lws_retry_bo_t kNoProbes = {};

struct SocketOption {
  int level;
  int name;
  int value;
};
// Small messages go at once, and a viewer whose machine is gone is noticed within a minute.
constexpr auto kSocketOptions = std::to_array<SocketOption>({
    {IPPROTO_TCP, TCP_NODELAY, 1},
    {SOL_SOCKET, SO_KEEPALIVE, 1},
    {IPPROTO_TCP, TCP_KEEPIDLE, 30},
    {IPPROTO_TCP, TCP_KEEPINTVL, 10},
    {IPPROTO_TCP, TCP_KEEPCNT, 3},
});

void setUp(int connection) {
  for (const auto& [level, name, value] : kSocketOptions) {
    setsockopt(connection, level, name, &value, sizeof value);
  }
}

bool isOutOfResources(int error) { return error != EAGAIN && error != ECONNABORTED; }

std::string_view bytesAt(const void* in, std::size_t length) {
  return in == nullptr ? std::string_view()
                       : std::string_view(static_cast<const char*>(in), length);
}

}  // namespace

WebServer::WebServer(Listeners listeners, std::size_t queueBytes, ViewerService target)
    : maxQueued(queueBytes),
      service(std::move(target)),
      ownName(ownHostName()),
      buffer(LWS_PRE + kChunk) {
  createContext();
  listen(std::move(listeners.web), Door::Web);
  listen(std::move(listeners.vnc), Door::Vnc);
  thread = std::thread([this] { run(); });
}

WebServer::~WebServer() {
  isOver = true;
  websockets().cancelService(context.get());
  thread.join();
}

const lws_protocols* WebServer::protocols() {
  static const std::array<lws_protocols, 2> kTable = {
      {{kProtocol, callback, 0, 0, 0, nullptr, 0}, {nullptr, nullptr, 0, 0, 0, nullptr, 0}}};
  return kTable.data();
}

void WebServer::createContext() {
  websockets().setLogLevel(0, nullptr);
  lws_context_creation_info info = {};
  info.options = LWS_SERVER_OPTION_EXPLICIT_VHOSTS |
                 LWS_SERVER_OPTION_HTTP_HEADERS_SECURITY_BEST_PRACTICES_ENFORCE;
  info.port = CONTEXT_PORT_NO_LISTEN_SERVER;
  info.protocols = protocols();
  info.user = this;
  constexpr unsigned int kOwn = 32;  // libwebsockets', and of connections that are about to end
  info.fd_limit_per_thread = 2 * Connections::kMost + kOwn;
  info.timeout_secs = Connections::kToIntroduce.count();
  info.keepalive_timeout = Connections::kToIntroduce.count();
  info.retry_and_idle_policy = &kNoProbes;
  info.vhost_name = "brimol";
  const BrokenPipeKeeper keeper;  // libwebsockets has it ignored in the whole process
  context.reset(websockets().createContext(&info));
  if (context) host = websockets().createVhost(context.get(), &info);
  if (host == nullptr) std::abort();  // no memory or no descriptor is left
}

void WebServer::listen(Listener listener, Door door) {
  lws_sock_file_fd_type descriptor = {};
  descriptor.filefd = listener.socket.release();
  lws* const wsi = websockets().adoptDescriptorVhost(host, LWS_ADOPT_RAW_FILE_DESC, descriptor,
                                                     kProtocol, nullptr);
  if (wsi == nullptr) std::abort();  // no memory is left
  doors[wsi] = door;
}

void WebServer::run() {
  blockBrokenPipes();
  while (!isOver) websockets().service(context.get(), 0);
}

int WebServer::callback(lws* wsi, lws_callback_reasons reason, void* user, void* in,
                        std::size_t length) {
  auto* const server =
      static_cast<WebServer*>(websockets().contextUser(websockets().getContext(wsi)));
  int result = 0;
  if (server->isHandled(wsi, reason, bytesAt(in, length), result)) {
    return result == 0 ? 0 : -1;  // plain connections end for negative numbers alone
  }
  return websockets().callbackHttpDummy(wsi, reason, user, in, length);
}

bool WebServer::isHandled(lws* wsi, lws_callback_reasons reason, std::string_view in, int& result) {
  switch (reason) {
    case LWS_CALLBACK_RAW_RX_FILE: accept(wsi); return true;
    case LWS_CALLBACK_HTTP: result = answer(wsi, in); return true;
    case LWS_CALLBACK_FILTER_PROTOCOL_CONNECTION:
      result = isOfOwnPage(wsi) && hasRoom() ? 0 : 1;
      return true;
    case LWS_CALLBACK_ESTABLISHED: begin(wsi, Door::Web); return true;
    case LWS_CALLBACK_RECEIVE:
    case LWS_CALLBACK_RAW_RX: result = hear(wsi, in); return true;
    case LWS_CALLBACK_SERVER_WRITEABLE:
    case LWS_CALLBACK_RAW_WRITEABLE: result = send(wsi); return true;
    case LWS_CALLBACK_CLOSED:
    case LWS_CALLBACK_RAW_CLOSE: end(wsi); return true;
    case LWS_CALLBACK_WSI_DESTROY: connections.remove(wsi); return true;
    case LWS_CALLBACK_TIMER: result = look(wsi); return true;
    case LWS_CALLBACK_HTTP_FILE_COMPLETION:
      connections.endFile(wsi);
      setTimer(wsi);
      return false;
    default: return false;
  }
}

// One at a time: the others are told of again, and those that were dropped for this one are gone
// then.
void WebServer::accept(lws* wsi) {
  Socket connection(
      ::accept4(websockets().getSocketFd(wsi), nullptr, nullptr, SOCK_NONBLOCK | SOCK_CLOEXEC));
  if (connection.get() >= 0) {
    receive(std::move(connection), doors.at(wsi));
  } else if (isOutOfResources(errno)) {
    // Without descriptors the listener stays ready: trying at once would only heat the processor.
    std::this_thread::sleep_for(std::chrono::milliseconds(100));
  }
}

void WebServer::receive(Socket connection, Door door) {
  if ((door == Door::Vnc && !hasRoom()) || !makeRoom()) return;
  setUp(connection.get());
  lws_sock_file_fd_type descriptor = {};
  descriptor.sockfd = connection.release();
  const auto kind = static_cast<lws_adoption_type>(
      door == Door::Web ? LWS_ADOPT_SOCKET | LWS_ADOPT_HTTP : LWS_ADOPT_SOCKET);
  lws* const wsi = websockets().adoptDescriptorVhost(
      host, kind, descriptor, door == Door::Web ? nullptr : kProtocol, nullptr);
  if (wsi == nullptr) return;
  connections.add(wsi, Clock::now());
  setTimer(wsi);
  if (door == Door::Vnc) begin(wsi, door);
}

// Whoever has not proved the password may have to go for a newcomer, the oldest first.
bool WebServer::makeRoom() {
  if (!connections.isFull()) return true;
  lws* const oldest = connections.oldest([this](lws* each) { return isAdmitted(each); });
  if (oldest == nullptr) return false;
  connections.remove(oldest);
  shutdown(websockets().getSocketFd(oldest), SHUT_RDWR);
  return true;
}

// libwebsockets has time limits of its own, which each request begins anew.
void WebServer::setTimer(lws* wsi) const {
  const auto found = lines.find(wsi);
  const bool waits = found != lines.end() && found->second->waitsForServer();
  const Connections::Time end = connections.endOf(wsi);
  const auto left = (waits ? std::min(end, pauseEnd) : end) - Clock::now();
  const auto us = std::chrono::duration_cast<std::chrono::microseconds>(left).count();
  websockets().setTimerUsecs(wsi, std::max<lws_usec_t>(us, 1));
}

int WebServer::look(lws* wsi) {
  if (!connections.contains(wsi) || isAdmitted(wsi)) return 0;
  if (Clock::now() >= connections.endOf(wsi)) return 1;
  const auto found = lines.find(wsi);
  if (found != lines.end() && !mayConnectToServer(found->second)) return 1;
  setTimer(wsi);
  return 0;
}

bool WebServer::isAdmitted(lws* wsi) const {
  const auto found = lines.find(wsi);
  return found != lines.end() && found->second->caller.shared()->isAdmitted;
}

int WebServer::answer(lws* wsi, std::string_view path) {
  const std::optional<std::string> asked = header(wsi, WSI_TOKEN_HOST);
  if (!asked || !isTrustedHost(*asked, ownName)) return refuse(wsi, HTTP_STATUS_FORBIDDEN);
  const std::optional<WebAnswer> found = webAnswer(path);
  if (!found) return refuse(wsi, HTTP_STATUS_NOT_FOUND);
  if (found->file.empty()) return sendText(wsi, *found);
  connections.beginFile(wsi);
  setTimer(wsi);
  return sendFile(wsi, *found);
}

bool WebServer::isOfOwnPage(lws* wsi) const {
  const std::optional<std::string> asked = header(wsi, WSI_TOKEN_HOST);
  const std::optional<std::string> origin = header(wsi, WSI_TOKEN_ORIGIN);
  return asked && origin && isTrustedHost(*asked, ownName) && isSameOrigin(*origin, *asked);
}

bool WebServer::hasRoom() const {
  const auto isViewer = [](const auto& line) {
    return line.first == line.second->outer && line.second->caller.shared()->isAdmitted;
  };
  return static_cast<std::size_t>(std::ranges::count_if(lines, isViewer)) < kMaxViewers;
}

void WebServer::begin(lws* wsi, Door door) {
  lines[wsi] = std::make_shared<Line>(Line{{}, door, wsi});
  websockets().callbackOnWritable(wsi);
}

int WebServer::hear(lws* wsi, std::string_view bytes) {
  const auto found = lines.find(wsi);
  if (found == lines.end()) return 1;
  const LinePointer line = found->second;  // held: `lines` may change
  if (line->outer == nullptr) return 1;
  if (wsi == line->inner) return hearServer(*line, bytes);
  const int result = hearViewer(*line, bytes);
  return result == 0 && !mayConnectToServer(line) ? 1 : result;
}

// False: it has to be connected, and cannot be.
bool WebServer::mayConnectToServer(const LinePointer& line) {
  if (!line->waitsForServer()) return true;
  if (Clock::now() >= pauseEnd) return connectToServer(line);
  setTimer(line->outer);
  return true;
}

int WebServer::hearViewer(Line& line, std::string_view bytes) {
  if (line.isEnding) return 0;
  if (!line.caller.hear(bytes)) return 1;
  if (line.caller.forServer().size() > kEnoughForServer) websockets().rxFlowControl(line.outer, 0);
  if (line.inner != nullptr) websockets().callbackOnWritable(line.inner);
  return 0;
}

int WebServer::hearServer(Line& line, std::string_view bytes) const {
  const bool wasEmpty = line.caller.forViewer().isEmpty();
  line.caller.answer(bytes);
  if (line.caller.forViewer().size() > maxQueued) {
    shutdown(websockets().getSocketFd(line.inner), SHUT_RDWR);  // the server must not wait for it
    return 1;
  }
  if (wasEmpty) watch(line);
  websockets().callbackOnWritable(line.outer);
  return 0;
}

bool WebServer::connectToServer(const LinePointer& line) {
  std::array<int, 2> ends = {-1, -1};
  if (socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0, ends.data()) != 0) {
    return false;
  }
  Socket other(ends[1]);
  // What has arrived must be there when the server looks: it would wait for it.
  const std::string_view first = line->caller.forServer().front(kEnoughForServer);
  const ssize_t sent = ::send(ends[0], first.data(), first.size(), MSG_NOSIGNAL);
  lws_sock_file_fd_type descriptor = {};
  descriptor.sockfd = ends[0];
  line->inner =
      websockets().adoptDescriptorVhost(host, LWS_ADOPT_SOCKET, descriptor, kProtocol, nullptr);
  if (line->inner == nullptr || sent < 0) return false;
  line->caller.forServer().drop(static_cast<std::size_t>(sent));
  lines[line->inner] = line;
  websockets().callbackOnWritable(line->inner);
  service.attach(std::move(other), line->caller.shared());
  return true;
}

int WebServer::send(lws* wsi) {
  const auto found = lines.find(wsi);
  if (found == lines.end()) return 0;
  const LinePointer line = found->second;
  return wsi == line->inner ? sendToServer(*line) : sendToViewer(*line);
}

int WebServer::sendToViewer(Line& line) {
  const std::string_view chunk = line.caller.forViewer().front(kChunk);
  if (chunk.empty()) return line.isEnding ? 1 : 0;
  std::ranges::copy(chunk, buffer.begin() + LWS_PRE);
  const auto kind = line.door == Door::Web ? LWS_WRITE_BINARY : LWS_WRITE_RAW;
  if (websockets().write(line.outer, buffer.data() + LWS_PRE, chunk.size(), kind) < 0) return 1;
  line.caller.drop(chunk.size());
  if (!isServed(line)) return 1;
  watch(line);
  service.lookAgain();
  if (!line.caller.forViewer().isEmpty() || line.isEnding)
    websockets().callbackOnWritable(line.outer);
  return 0;
}

// More may have proved the password at once than there is room for.
bool WebServer::isServed(Line& line) const {
  if (line.isCounted || !line.caller.shared()->isAdmitted) return true;
  const auto isOther = [](const auto& each) {
    return each.first == each.second->outer && each.second->isCounted;
  };
  line.isCounted = static_cast<std::size_t>(std::ranges::count_if(lines, isOther)) < kMaxViewers;
  return line.isCounted;
}

// Not by libwebsockets, which reads nothing more from a connection while some of what it sends
// there waits: the server, which takes nothing while it sends, and it would wait for each other.
int WebServer::sendToServer(Line& line) {
  ByteQueue& queue = line.caller.forServer();
  const std::string_view chunk = queue.front(kChunk);
  const ssize_t sent =
      ::send(websockets().getSocketFd(line.inner), chunk.data(), chunk.size(), MSG_NOSIGNAL);
  if (sent < 0 && errno != EAGAIN) return 1;
  if (sent > 0) queue.drop(static_cast<std::size_t>(sent));
  if (!queue.isEmpty()) {
    websockets().callbackOnWritable(line.inner);
  } else if (line.outer != nullptr) {
    websockets().rxFlowControl(line.outer, 1);
  }
  return 0;
}

// Who is not admitted yet keeps the time limit of the beginning.
void WebServer::watch(const Line& line) {
  if (!line.caller.shared()->isAdmitted) return;
  if (line.caller.forViewer().isEmpty()) {
    websockets().setTimeout(line.outer, NO_PENDING_TIMEOUT, 0);
  } else {
    websockets().setTimeout(line.outer, PENDING_TIMEOUT_USER_OK, kSecondsToRead);
  }
}

void WebServer::end(lws* wsi) {
  const auto found = lines.find(wsi);
  if (found == lines.end()) return;
  const LinePointer line = found->second;
  lines.erase(found);
  if (wsi == line->inner) {
    line->inner = nullptr;
    line->isEnding = true;
    if (!line->caller.shared()->isAdmitted) pauseEnd = Clock::now() + kPause;
    if (line->outer != nullptr) websockets().callbackOnWritable(line->outer);
    return;
  }
  line->outer = nullptr;
  line->caller.shared()->queuedBytes = 0;
  // Both sides of the pair see its end.
  if (line->inner != nullptr) shutdown(websockets().getSocketFd(line->inner), SHUT_RDWR);
}

}  // namespace brimol::pc
