#include "remote/vnc_server.h"

#include <poll.h>
#include <sys/eventfd.h>
#include <sys/select.h>

#include <algorithm>
#include <array>
#include <cstdlib>
#include <utility>

#include "remote/message_gate.h"
#include "remote/signals.h"

namespace brimol::pc {
namespace {

// A viewer for whom more waits is asked for nothing and sent nothing more. So at most one update
// comes on top of it, since every update answers a request.
constexpr std::size_t kEnoughQueued = std::size_t{1} << 16;
// The web server is never away for long; this is for its end.
constexpr int kPatienceMs = 2000;

constexpr int kColourBits = 8;
constexpr int kColours = 3;
constexpr int kPixelBytes = 4;
constexpr int kRedShift = 16;  // of CAIRO_FORMAT_RGB24
constexpr int kGreenShift = 8;
constexpr int kBlueShift = 0;

constexpr int kArrowWidth = 8;
constexpr int kArrowHeight = 12;
constexpr const char* kArrow =
    "x       "
    "xx      "
    "x.x     "
    "x..x    "
    "x...x   "
    "x....x  "
    "x.....x "
    "x....xxx"
    "x.xx.x  "
    "xx x..x "
    "x  x..x "
    "    xx  ";

bool isBehind(const Viewer& viewer) { return viewer.queuedBytes > kEnoughQueued; }

// The outline is black and the inside white: the mask has both.
rfbCursor* makeArrow() {
  std::string outline = kArrow;
  std::string mask = kArrow;
  std::ranges::replace(outline, '.', ' ');
  std::ranges::replace(mask, '.', 'x');
  rfbCursor* const arrow =
      rfb().makeXCursor(kArrowWidth, kArrowHeight, outline.data(), mask.data());
  arrow->foreRed = arrow->foreGreen = arrow->foreBlue = 0;
  arrow->backRed = arrow->backGreen = arrow->backBlue = 0xFFFF;
  return arrow;
}

// Fingers are messages that the protocol does not have. LibVNCServer's list of such extensions is
// the process's, and so is this one.
rfbProtocolExtension fingers = {};

// LibVNCServer does not.
void freeExtensions(rfbClientPtr client) {
  rfbExtensionData* each = std::exchange(client->extensions, nullptr);
  while (each != nullptr) std::free(std::exchange(each, each->next));
}

rfbBool welcome(rfbClientPtr, void**) { return TRUE; }

}  // namespace

VncServer::VncServer(Size size, std::string secret, ActionQueue& target)
    : password(std::move(secret)),
      passwords({password.data(), nullptr}),
      actions(target),
      handover(size),
      shown(size),
      arrow(makeArrow()),
      bell(eventfd(0, EFD_CLOEXEC | EFD_NONBLOCK)) {
  setUpServer(size);
  thread = std::thread([this] { run(); });
}

void VncServer::stop() {
  if (!thread.joinable()) return;
  isOver = true;
  lookAgain();
  thread.join();
}

void VncServer::setUpServer(Size size) {
  fingers.newClient = welcome;
  fingers.handleMessage = takeFinger;
  rfb().logEnable(0);
  rfb().registerProtocolExtension(&fingers);
  server.reset(
      rfb().getScreen(nullptr, nullptr, size.w, size.h, kColourBits, kColours, kPixelBytes));
  if (!server || bell.get() < 0) std::abort();  // no memory or no descriptor is left
  server->serverFormat.redShift = kRedShift;
  server->serverFormat.greenShift = kGreenShift;
  server->serverFormat.blueShift = kBlueShift;
  server->frameBuffer = reinterpret_cast<char*>(shown.row(0, 0));
  server->desktopName = "brimol";
  server->authPasswdData = static_cast<void*>(passwords.data());
  server->passwordCheck = rfb().checkPasswordByList;
  server->ptrAddEvent = takePointer;
  server->kbdAddEvent = takeKey;
  server->alwaysShared = TRUE;
  server->permitFileTransfer = FALSE;
  server->ignoreSIGPIPE = FALSE;  // signals are the application's
  server->deferUpdateTime = 0;
  server->deferPtrUpdateTime = 0;
  server->maxClientWait = kPatienceMs;
  // Sent to viewers that draw a pointer themselves, and never painted into the picture.
  server->cursor = nullptr;
  server->getCursorPtr = [](rfbClientPtr client) { return serverOf(client).arrow.get(); };
  server->screenData = this;
}

void VncServer::present(cairo_surface_t* picture, const Region& changed) {
  handover.give(picture, changed);
  lookAgain();
}

void VncServer::attach(Socket end, std::shared_ptr<Viewer> viewer) {
  // LibVNCServer waits in select(), which knows no higher number.
  if (end.get() >= FD_SETSIZE) return;
  {
    const std::lock_guard lock(mutex);
    newcomers.push_back({std::move(end), std::move(viewer)});
  }
  lookAgain();
}

void VncServer::lookAgain() const { eventfd_write(bell.get(), 1); }

void VncServer::run() {
  blockBrokenPipes();
  while (!isOver) {
    for (Guest* const guest : waitForInput()) rfb().processClientMessage(guest->client);
    takeNewcomers();
    takePicture();
    sendChanges();
    removeGone();
  }
  for (const Guest& guest : guests) rfb().closeClient(guest.client);
  removeGone();
}

std::vector<VncServer::Guest*> VncServer::waitForInput() {
  std::vector<pollfd> waits = {{bell.get(), POLLIN, 0}};
  const bool hasRoom = !actions.isFull();
  for (const Guest& guest : guests) {
    const bool isHeard = hasRoom && !isBehind(*guest.viewer);
    waits.push_back({guest.client->sock, static_cast<short>(isHeard ? POLLIN : 0), 0});
  }
  poll(waits.data(), waits.size(), -1);
  eventfd_t reasons = 0;
  eventfd_read(bell.get(), &reasons);
  std::vector<Guest*> heard;
  auto wait = waits.begin();
  for (Guest& guest : guests) {
    if ((++wait)->revents != 0) heard.push_back(&guest);
  }
  return heard;
}

void VncServer::takeNewcomers() {
  std::vector<Newcomer> taken;
  {
    const std::lock_guard lock(mutex);
    taken.swap(newcomers);
  }
  for (auto& [end, viewer] : taken) {
    rfbClientRec* const client = rfb().newClient(server.get(), end.release());
    if (client == nullptr) continue;
    guests.push_back({client, std::move(viewer), ViewerHands(++guestsSoFar, actions)});
    client->clientData = &guests.back();
  }
}

void VncServer::takePicture() {
  for (const cairo_rectangle_int_t& part : handover.take(shown)) {
    rfb().markRectAsModified(server.get(), part.x, part.y, part.x + part.width,
                             part.y + part.height);
  }
}

void VncServer::sendChanges() {
  for (const Guest& guest : guests) {
    if (guest.client->state == rfbClientRec::RFB_NORMAL) guest.viewer->isAdmitted = true;
    if (!isBehind(*guest.viewer)) rfb().updateClient(guest.client);
  }
}

void VncServer::removeGone() {
  for (auto guest = guests.begin(); guest != guests.end();) {
    if (guest->client->sock >= 0) {
      ++guest;
      continue;
    }
    guest->hands.letGo();
    freeExtensions(guest->client);
    rfb().clientConnectionGone(guest->client);
    guest = guests.erase(guest);
  }
}

VncServer& VncServer::serverOf(rfbClientPtr client) {
  return *static_cast<VncServer*>(client->screen->screenData);
}

ViewerHands& VncServer::handsOf(rfbClientPtr client) {
  return static_cast<Guest*>(client->clientData)->hands;
}

void VncServer::takePointer(int buttons, int x, int y, rfbClientPtr client) {
  handsOf(client).mouse(buttons, {x, y});
}

void VncServer::takeKey(rfbBool isDown, rfbKeySym symbol, rfbClientPtr client) {
  handsOf(client).key(symbol, isDown != FALSE);
}

rfbBool VncServer::takeFinger(rfbClientPtr client, void*, const rfbClientToServerMsg* message) {
  if (message->type != MessageGate::kFingerMessage) return FALSE;
  std::array<unsigned char, MessageGate::kFingerBytes - 1> rest = {};  // the number is taken
  if (rfb().readExact(client, reinterpret_cast<char*>(rest.data()), rest.size()) <= 0) {
    rfb().closeClient(client);
    return TRUE;
  }
  const auto word = [&rest](std::size_t at) { return rest[at] << kColourBits | rest[at + 1]; };
  handsOf(client).finger(static_cast<FingerAction>(rest[0]), rest[5], {word(1), word(3)});
  return TRUE;
}

}  // namespace brimol::pc
