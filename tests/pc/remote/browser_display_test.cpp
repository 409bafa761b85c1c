// The screen as VNC viewers and browsers meet it, those that mean harm among them.
#include "remote/browser_display.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <array>
#include <cstring>
#include <iostream>
#include <list>
#include <random>
#include <sstream>
#include <string>
#include <vector>

#include "pc/remote/vnc_viewer.h"
#include "pc/support/record_text.h"
#include "scene/cairo_handles.h"
#include "support/allocated_bytes.h"

namespace brimol::pc {
namespace {

using test::allocatedBytes;
using test::rawConnection;
using test::readLine;
using test::VncViewer;
using testing::ElementsAre;
using namespace std::string_literals;

constexpr Size kScreen = {400, 400};
constexpr uint32_t kBlue = 0x0000FF;
constexpr uint32_t kOrange = 0xFF8000;

class ServedScreen : public testing::Test {
 protected:
  ServedScreen() {
    service.open();
    std::ostringstream told;
    std::streambuf* const usual = std::cerr.rdbuf(told.rdbuf());
    display = BrowserDisplay::open(kScreen, ListenAddress{"127.0.0.1", 0}, input, service).display;
    std::cerr.rdbuf(usual);
    const std::string text = told.str();
    const auto after = [&text](const char* mark) {
      return text.substr(text.find(mark) + std::strlen(mark));
    };
    webPort = std::stoi(after("127.0.0.1:"));
    vncPort = std::stoi(after("127.0.0.1::"));
    password = after("/#").substr(0, 8);
    show(kBlue, {0, 0, kScreen.w, kScreen.h});
  }

  /// What no encoding makes small.
  void showNoise(const Pixels& part) {
    std::minstd_rand random;
    for (int y = part.y; y < part.y + part.height; ++y) {
      unsigned char* const row = cairo_image_surface_get_data(picture.get()) +
                                 std::ptrdiff_t{y} * cairo_image_surface_get_stride(picture.get());
      std::generate_n(row + std::ptrdiff_t{4} * part.x, 4 * part.width,
                      [&random] { return static_cast<unsigned char>(random()); });
    }
    cairo_surface_mark_dirty(picture.get());
    display->present(picture.get(), {part});
  }

  void show(uint32_t colour, const Pixels& part) {
    const CairoContext context(cairo_create(picture.get()));
    cairo_set_source_rgb(context.get(), (colour >> 16) / 255.0, (colour >> 8 & 0xFF) / 255.0,
                         (colour & 0xFF) / 255.0);
    cairo_rectangle(context.get(), part.x, part.y, part.width, part.height);
    cairo_fill(context.get());
    cairo_surface_flush(picture.get());
    display->present(picture.get(), {part});
  }

  std::vector<std::string> records(std::size_t count) {
    std::vector<std::string> texts;
    while (texts.size() < count) {
      display->wait(std::nullopt);
      for (const std::string& text : takeTexts(service)) texts.push_back(text);
    }
    return texts;
  }

  InputService service;
  InputTranslator input{kScreen, service};
  CairoSurface picture{cairo_image_surface_create(CAIRO_FORMAT_RGB24, kScreen.w, kScreen.h)};
  std::unique_ptr<Display> display;
  int webPort = 0;
  int vncPort = 0;
  std::string password;
};

TEST_F(ServedScreen, SendsWhatChangedToAllViewers) {
  VncViewer first(vncPort, password);
  VncViewer second(vncPort, password);
  ASSERT_TRUE(first.isConnected() && second.isConnected());
  for (VncViewer* const viewer : {&first, &second}) {
    EXPECT_TRUE(viewer->waitForPixel(399, 399, kBlue));
    viewer->takeParts();
  }
  show(kOrange, {10, 20, 30, 40});
  for (VncViewer* const viewer : {&first, &second}) {
    EXPECT_TRUE(viewer->waitForPixel(10, 20, kOrange));
    int pixels = 0;
    for (const Pixels& part : viewer->takeParts()) pixels += part.width * part.height;
    EXPECT_EQ(pixels, 30 * 40);
  }
  first.close();
  show(kBlue, {10, 20, 30, 40});
  EXPECT_TRUE(second.waitForPixel(10, 20, kBlue)) << "another viewer left";
  VncViewer again(vncPort, password);
  ASSERT_TRUE(again.isConnected());
  EXPECT_TRUE(again.waitForPixel(399, 0, kBlue));
}

TEST_F(ServedScreen, PlaysWhatAViewerDoesUntilItGoes) {
  VncViewer viewer(vncPort, password);
  ASSERT_TRUE(viewer.isConnected());
  viewer.mouse(1, 5, 6);
  viewer.mouse(0, 5, 6);
  viewer.key('h', true);
  viewer.sendRaw("\310\1\0\7\0\10\0\0"s);
  viewer.sendRaw("\310\1\0\11\1\12\1\0"s);
  EXPECT_THAT(records(5), ElementsAre("down 0 at 5,6", "up 0 at 5,6", "key down 323",
                                      "down 0 at 7,8", "down 1 at 9,266"));
  viewer.close();
  EXPECT_THAT(records(3), ElementsAre("key up 323", "up 0 at 7,8", "up 1 at 9,266"));
}

TEST_F(ServedScreen, WantsThePassword) {
  for (const char* const wrong : {"12345678", "a"}) {
    EXPECT_FALSE(VncViewer(vncPort, wrong).isConnected()) << wrong;
  }
  EXPECT_TRUE(VncViewer(vncPort, password).isConnected());
}

TEST_F(ServedScreen, RefusesPagesOfOtherOrigins) {
  const std::string port = std::to_string(webPort);
  const std::string own = "Host: localhost:" + port + "\r\n";
  const std::string evil = "Host: evil.example:" + port + "\r\n";
  const std::string ownOrigin = "Origin: http://localhost:" + port + "\r\n";
  const std::string evilOrigin = "Origin: http://evil.example:" + port + "\r\n";
  const std::string upgrade =
      "Upgrade: websocket\r\nConnection: Upgrade\r\nSec-WebSocket-Version: 13\r\n"
      "Sec-WebSocket-Key: dGhlIHNhbXBsZSBub25jZQ==\r\n";
  const auto ask = [this](const std::string& headers) {
    return readLine(rawConnection(webPort, "GET / HTTP/1.1\r\n" + headers + "\r\n"));
  };
  EXPECT_EQ(ask(own), "HTTP/1.1 200 OK\r\n");
  EXPECT_EQ(ask(evil), "HTTP/1.1 403 Forbidden\r\n");
  EXPECT_EQ(ask(own + ownOrigin + upgrade), "HTTP/1.1 101 Switching Protocols\r\n");
  for (const std::string& headers : {own, own + evilOrigin, evil + evilOrigin, evil + ownOrigin}) {
    EXPECT_EQ(ask(headers + upgrade).find(" 101 "), std::string::npos) << headers;
  }
}

TEST_F(ServedScreen, BearsBrokenViewers) {
  VncViewer good(vncPort, password);
  VncViewer stopped(vncPort, password);
  ASSERT_TRUE(good.isConnected() && stopped.isConnected());
  showNoise({200, 0, 200, 400});
  EXPECT_TRUE(good.waitForPixel(0, 0, kBlue));
  const std::size_t before = allocatedBytes();

  // Each asks for the whole picture.
  for (int count = 0; count < 2000; ++count) stopped.sendRaw("\3\0\0\0\0\0\1\220\1\220"s);
  std::list<Socket> broken;
  for (int count = 0; count < 200; ++count) {
    const int port = count % 2 == 0 ? webPort : vncPort;
    static constexpr auto kBeginnings = std::to_array(
        {"", "\x80\xFF garbage \n\n", "RFB 003.008\n\2half", "GET / HTTP/1.1\r\nHost: local"});
    broken.push_back(rawConnection(port, kBeginnings.at(static_cast<std::size_t>(count / 2 % 4))));
  }
  for (int count = 0; count < 50; ++count) {
    const uint32_t colour = count % 2 == 0 ? kOrange : kBlue;
    show(colour, {0, 0, 200, 400});
    ASSERT_TRUE(good.waitForPixel(100, 100, colour));
  }
  EXPECT_LT(allocatedBytes(), before + (std::size_t{16} << 20));
  broken.clear();
  while (readLine(rawConnection(vncPort, "")) != "RFB 003.008\n") {  // until there is room again
  }
}

// A connection has five seconds to make its request and to prove the password, whatever it has sent
// of them. Each is ended, and this test with them.
TEST_F(ServedScreen, DropsWhoIsSlow) {
  VncViewer good(vncPort, password);
  ASSERT_TRUE(good.isConnected());
  const Socket silent = rawConnection(vncPort, "");
  const Socket half = rawConnection(vncPort, "RFB 003.008\n\2");
  const Socket asking = rawConnection(webPort, "GET / HTTP/1.1\r\nHost: localhost\r\nA: ");
  for (const Socket* const slow : {&silent, &half, &asking}) EXPECT_TRUE(test::waitForEnd(*slow));
  show(kOrange, {0, 0, 10, 10});
  EXPECT_TRUE(good.waitForPixel(5, 5, kOrange)) << "another one was dropped";
}

}  // namespace
}  // namespace brimol::pc
