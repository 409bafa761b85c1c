/// libwebsockets, on a thread of its own: the page, and the connections of all viewers.
#pragma once

#include <atomic>
#include <chrono>
#include <cstddef>
#include <functional>
#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <thread>
#include <vector>

#include "remote/caller.h"
#include "remote/connections.h"
#include "remote/listener.h"
#include "remote/web_calls.h"

namespace brimol::pc {

/// What the web server asks of who serves the viewers, on its own thread.
struct ViewerService {
  /// Serve the viewer at the other end of `end`.
  std::function<void(Socket end, std::shared_ptr<Viewer> viewer)> attach;
  /// A viewer has read what waited for it.
  std::function<void()> lookAgain;
};

struct WebContextDeleter {
  void operator()(lws_context* context) const { websockets().contextDestroy(context); }
};

/// Answers browsers with the page, and stands between viewers and the VNC server: it takes whatever
/// they send at whatever pace, and keeps what waits for them. It limits how many they are, how long
/// they take to say who they are, and how long they may read nothing.
class WebServer {
 public:
  /// `queueBytes` is what may wait for one viewer: more ends its connection.
  WebServer(Listeners listeners, std::size_t queueBytes, ViewerService target);
  ~WebServer();
  WebServer(const WebServer&) = delete;
  WebServer& operator=(const WebServer&) = delete;

 private:
  enum class Door { Web, Vnc };
  // A viewer's two lines: `outer` to it, `inner` to the VNC server.
  struct Line {
    Caller caller;
    Door door;
    lws* outer;  // null once it is closed
    lws* inner = nullptr;
    bool isCounted = false;  // among the viewers
    bool isEnding = false;   // once the viewer has what waits for it

    bool waitsForServer() const {
      return inner == nullptr && !isEnding && caller.isReadyForServer();
    }
  };
  using LinePointer = std::shared_ptr<Line>;
  using Clock = std::chrono::steady_clock;

  // libwebsockets' own signature, which is why there are two void*.
  static int callback(lws* wsi, lws_callback_reasons reason, void* user, void* in,
                      std::size_t length);
  static const lws_protocols* protocols();
  void createContext();
  void listen(Listener listener, Door door);
  void run();

  bool isHandled(lws* wsi, lws_callback_reasons reason, std::string_view in, int& result);
  void accept(lws* wsi);
  void receive(Socket connection, Door door);
  bool makeRoom();
  void setTimer(lws* wsi) const;
  int look(lws* wsi);
  bool isAdmitted(lws* wsi) const;
  int answer(lws* wsi, std::string_view path);
  bool isOfOwnPage(lws* wsi) const;

  bool hasRoom() const;
  void begin(lws* wsi, Door door);
  int hear(lws* wsi, std::string_view bytes);
  static int hearViewer(Line& line, std::string_view bytes);
  int hearServer(Line& line, std::string_view bytes) const;
  bool mayConnectToServer(const LinePointer& line);
  bool connectToServer(const LinePointer& line);
  int send(lws* wsi);
  int sendToViewer(Line& line);
  bool isServed(Line& line) const;
  static int sendToServer(Line& line);
  static void watch(const Line& line);
  void end(lws* wsi);

  const std::size_t maxQueued;
  const ViewerService service;
  const std::string ownName;
  std::map<lws*, Door> doors;         // the listeners
  Connections connections;            // of browsers and viewers
  std::map<lws*, LinePointer> lines;  // by both of their ends
  std::vector<unsigned char> buffer;  // what is sent, behind room for libwebsockets
  std::unique_ptr<lws_context, WebContextDeleter> context;
  lws_vhost* host = nullptr;   // the context's
  Connections::Time pauseEnd;  // of the pause after a wrong password
  std::atomic<bool> isOver = false;
  std::thread thread;
};

}  // namespace brimol::pc
