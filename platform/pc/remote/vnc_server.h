/// LibVNCServer, on a thread of its own.
#pragma once

#include <atomic>
#include <list>
#include <memory>
#include <mutex>
#include <string>
#include <thread>
#include <vector>

#include "remote/action_queue.h"
#include "remote/handover.h"
#include "remote/listener.h"
#include "remote/rfb_calls.h"
#include "remote/viewer.h"
#include "remote/viewer_hands.h"

namespace brimol::pc {

struct VncScreenDeleter {
  void operator()(rfbScreenInfo* screen) const { rfb().screenCleanup(screen); }
};

struct VncCursorDeleter {
  void operator()(rfbCursor* cursor) const { rfb().freeCursor(cursor); }
};

/// Sends viewers what changes of the picture, and takes what they do. It never meets their
/// connections: the web server passes on their bytes, whole messages only, by a pair of sockets,
/// and takes all that it has for them at once. So no viewer can make it wait.
class VncServer {
 public:
  /// Viewers need `secret`, of at most eight bytes. What they do goes to `target`, which outlives
  /// this.
  VncServer(Size size, std::string secret, ActionQueue& target);
  ~VncServer() { stop(); }
  VncServer(const VncServer&) = delete;
  VncServer& operator=(const VncServer&) = delete;

  /// Ends its thread, and with it the viewers; nothing is served any more. A second call does
  /// nothing.
  void stop();

  /// Shows what changed of `picture`. One thread.
  void present(cairo_surface_t* picture, const Region& changed);
  /// Serves the viewer at the other end of `end`, whose version of the protocol has arrived there.
  /// Any thread.
  void attach(Socket end, std::shared_ptr<Viewer> viewer);
  /// Looks at the viewers' queues again. Any thread.
  void lookAgain() const;

 private:
  struct Guest {
    rfbClientPtr client;
    std::shared_ptr<Viewer> viewer;
    ViewerHands hands;
  };
  struct Newcomer {
    Socket end;
    std::shared_ptr<Viewer> viewer;
  };

  void setUpServer(Size size);
  void run();
  std::vector<Guest*> waitForInput();
  void takeNewcomers();
  void takePicture();
  void sendChanges();
  void removeGone();

  static VncServer& serverOf(rfbClientPtr client);
  static ViewerHands& handsOf(rfbClientPtr client);
  static void takePointer(int buttons, int x, int y, rfbClientPtr client);
  static void takeKey(rfbBool isDown, rfbKeySym symbol, rfbClientPtr client);
  // LibVNCServer's own signature, which is why there is a void*.
  static rfbBool takeFinger(rfbClientPtr client, void*, const rfbClientToServerMsg* message);

  std::string password;
  std::vector<char*> passwords;  // as LibVNCServer wants it: a list that ends with a null
  ActionQueue& actions;
  Handover handover;
  ServedPicture shown;
  std::unique_ptr<rfbCursor, VncCursorDeleter> arrow;
  std::unique_ptr<rfbScreenInfo, VncScreenDeleter> server;
  std::list<Guest> guests;  // the thread's own
  int64_t guestsSoFar = 0;

  Socket bell;  // counts the reasons to look again
  std::atomic<bool> isOver = false;
  std::mutex mutex;  // guards newcomers
  std::vector<Newcomer> newcomers;
  std::thread thread;
};

}  // namespace brimol::pc
