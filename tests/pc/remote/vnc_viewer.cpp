#include "pc/remote/vnc_viewer.h"

#include <arpa/inet.h>
#include <poll.h>
#include <sys/socket.h>
#include <stdexcept>

#include <cstdlib>
#include <cstring>
#include <utility>

namespace brimol::test {
namespace {

constexpr unsigned kPatienceUs = 30'000'000;
constexpr int kEndPatienceMs = 60'000;
char tag = 0;  // its address finds the viewer in LibVNCClient's record

}  // namespace

VncViewer::VncViewer(int port, std::string password)
    : client(rfbGetClient(8, 3, 4)), secret(std::move(password)) {
  rfbEnableClientLogging = FALSE;
  rfbClientSetClientData(client, &tag, this);
  std::free(client->serverHost);
  client->serverHost = strdup("127.0.0.1");
  client->serverPort = port;
  client->GetPassword = [](rfbClient* asking) {
    return strdup(static_cast<VncViewer*>(rfbClientGetClientData(asking, &tag))->secret.c_str());
  };
  client->GotFrameBufferUpdate = [](rfbClient* told, int x, int y, int w, int h) {
    static_cast<VncViewer*>(rfbClientGetClientData(told, &tag))->parts.push_back({x, y, w, h});
  };
  if (rfbInitClient(client, nullptr, nullptr) == FALSE) client = nullptr;  // it is freed
}

void VncViewer::close() {
  if (client == nullptr) return;
  std::free(client->frameBuffer);
  rfbClientCleanup(std::exchange(client, nullptr));
}

bool VncViewer::waitForPixel(int x, int y, uint32_t colour) {
  const std::size_t place = static_cast<std::size_t>(y) * static_cast<std::size_t>(client->width) +
                            static_cast<std::size_t>(x);
  while (true) {
    uint32_t pixel = 0;  // red in the lowest byte
    std::memcpy(&pixel, client->frameBuffer + place * sizeof pixel, sizeof pixel);
    const uint32_t seen = (pixel & 0xFF) << 16 | (pixel & 0xFF00) | (pixel >> 16 & 0xFF);
    if (seen == colour) return true;
    const bool isComing = client->buffered > 0 || WaitForMessage(client, kPatienceUs) > 0;
    if (!isComing || HandleRFBServerMessage(client) == FALSE) return false;
  }
}

std::vector<pc::Pixels> VncViewer::takeParts() { return std::exchange(parts, {}); }

void VncViewer::sendRaw(std::string_view bytes) {
  WriteToRFBServer(client, bytes.data(), static_cast<unsigned>(bytes.size()));
}

pc::Socket rawConnection(int port, std::string_view bytes) {
  pc::Socket connection(socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0));
  sockaddr_in server = {};
  server.sin_family = AF_INET;
  server.sin_port = htons(static_cast<uint16_t>(port));
  server.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
  if (connect(connection.get(), reinterpret_cast<sockaddr*>(&server), sizeof server) != 0) {
    throw std::runtime_error("nobody listens there");
  }
  send(connection.get(), bytes.data(), bytes.size(), MSG_NOSIGNAL);
  return connection;
}

std::string readLine(const pc::Socket& connection) {
  std::string line;
  char next = 0;
  while (line.find('\n') == std::string::npos && recv(connection.get(), &next, 1, 0) == 1)
    line += next;
  return line;
}

bool waitForEnd(const pc::Socket& connection) {
  pollfd end = {connection.get(), POLLRDHUP, 0};
  return poll(&end, 1, kEndPatienceMs) == 1;
}

}  // namespace brimol::test
