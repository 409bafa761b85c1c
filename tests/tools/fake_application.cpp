// Stands in for an application: plays a session as its argument says, without a toolkit.
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <map>
#include <nlohmann/json.hpp>
#include <string>

#include "picture.h"

namespace {

using brimol::replay::Surface;
using nlohmann::json;

std::string setting(const char* name) {
  const char* const value = std::getenv(name);
  return value == nullptr ? "" : value;
}

const std::filesystem::path kFolder = setting("BRIMOL_REPORT_DIR");
constexpr int kWidth = 480;
constexpr int kHeight = 800;

/// The session's file, a line at once.
void say(const json& line) {
  static std::ofstream file(kFolder / "session.jsonl");
  file << line.dump() << std::endl;
}

void start() {
  json environment = json::object();
  for (const char* const name :
       {"BRIMOL_DISPLAY", "BRIMOL_CLOCK", "BRIMOL_CLOCK_STEP", "BRIMOL_SCREEN"}) {
    if (!setting(name).empty()) environment[name] = setting(name);
  }
  say({{"kind", "start"},
       {"time", 0},
       {"format", 1},
       {"program", "fake_application"},
       {"version", "1.2.3"},
       {"screen", {{"width", kWidth}, {"height", kHeight}}},
       {"display", setting("BRIMOL_DISPLAY")},
       {"clock", setting("BRIMOL_CLOCK")},
       {"utc", "2026-01-01T00:00:00Z"},
       {"environment", environment}});
}

// A screen of one colour with a bar across it.
void paint(const std::filesystem::path& file, int bar) {
  const Surface picture(cairo_image_surface_create(CAIRO_FORMAT_RGB24, kWidth, kHeight));
  cairo_t* const context = cairo_create(picture.get());
  cairo_set_source_rgb(context, 0.8, 0.85, 0.9);
  cairo_paint(context);
  cairo_set_source_rgb(context, 0.2, 0.3, 0.5);
  cairo_rectangle(context, 40, bar, kWidth - 80, 90);
  cairo_fill(context);
  cairo_destroy(context);
  std::ofstream(file) << brimol::replay::encodePng(picture);
}

void frame(int number, int time, int bar, const std::string& title) {
  const std::string name = "frame-" + std::to_string(bar) + ".png";
  if (!std::filesystem::exists(kFolder / name)) paint(kFolder / name, bar);
  say({{"kind", "frame"},
       {"time", time},
       {"number", number},
       {"hash", "00000000000000" + std::to_string(bar)},
       {"items", 3},
       {"texts", {{{"text", title}, {"x", 40}, {"y", bar}, {"w", 400}, {"h", 90}}}},
       {"picture", name},
       {"paint_us", 1250}});
}

const std::string kTrace = std::filesystem::path(setting("BRIMOL_TRACE")).filename();

void tap(int time, int line, int y, const std::string& text) {
  const auto at = [&](json more) {
    more.update({{"time", time}, {"file", kTrace}, {"line", line}});
    say(more);
  };
  at({{"kind", "step"}, {"text", text}});
  at({{"kind", "event"}, {"input", "down"}, {"finger", 0}, {"x", kWidth / 2}, {"y", y}});
  at({{"kind", "event"}, {"input", "up"}, {"finger", 0}, {"x", kWidth / 2}, {"y", y}});
}

void expect(int time, int line, const std::string& text, const std::string& why) {
  say({{"kind", "expectation"},
       {"time", time},
       {"file", kTrace},
       {"line", line},
       {"text", text},
       {"passed", why.empty()},
       {"why", why}});
}

void end(int exit, const std::string& reason) {
  say({{"kind", "end"}, {"time", 2400}, {"exit", exit}, {"reason", reason}});
}

// What all sessions have in common.
void begin(int lastBar) {
  start();
  frame(1, 0, 100, "Welcome");
  tap(500, 2, 145, "tap \"Welcome\"");
  say({{"kind", "log"},
       {"time", 510},
       {"priority", 5},
       {"tag", "fake"},
       {"message", "</script><script>document.title='broken'</script><!--"}});
  frame(2, 520, 300, "Moving");
  frame(3, 540, lastBar, "Done & <b>done</b>");
  expect(700, 3, "expect text \"Done*\"", "");
}

int pass(int bar) {
  begin(bar);
  end(0, "closed");
  return 0;
}

int fail() {
  begin(400);
  expect(2400, 4, "expect text \"Passed\"", "no item shows it; there are:\n  Done & <b>done</b>");
  end(1, "failed");
  return 1;
}

int crash() {
  begin(400);
  tap(900, 5, 440, "tap \"Done*\"");
  std::abort();
}

// Leaves a process behind that would go on by itself, and writes its number.
int hang() {
  begin(400);
  const pid_t child = ::fork();
  if (child == 0) {
    for (;;) ::pause();
  }
  std::cout << child << std::endl;
  for (;;) ::pause();
}

int leaveChild() {
  const pid_t child = ::fork();
  if (child == 0) {
    for (;;) ::pause();
  }
  std::cout << child << std::endl;
  return pass(400);
}

int refuse() {
  start();
  const std::string message = "unknown step 'tapp'";
  say({{"kind", "error"}, {"time", 0}, {"message", message}, {"file", kTrace}, {"line", 7}});
  end(2, "error");
  std::cerr << kTrace << ":7: " << message << '\n';
  return 2;
}

// Frames without end, as an animation has them.
int animate(int frames) {
  start();
  for (int number = 1; number <= frames; ++number) {
    frame(number, number * 16, number % 50 * 10, "Frame " + std::to_string(number));
  }
  end(0, "closed");
  return 0;
}

int run(int count, char** arguments) {
  const std::string what = count > 1 ? arguments[1] : "";
  if (what == "pass") return pass(400);
  if (what == "pass-otherwise") return pass(420);
  if (what == "fail") return fail();
  if (what == "crash") return crash();
  if (what == "hang") return hang();
  if (what == "leave-child") return leaveChild();
  if (what == "refuse") return refuse();
  if (what == "silent") return 0;
  if (what == "animate") return animate(std::stoi(arguments[2]));
  if (what == "exit") return pass(400) + std::stoi(arguments[2]);
  std::cerr << "fake_application: does not know '" << what << "'\n";
  return 2;
}

}  // namespace

int main(int count, char** arguments) try {
  return run(count, arguments);
} catch (const std::exception& error) {
  std::cerr << "fake_application: " << error.what() << '\n';
  return 2;
}
