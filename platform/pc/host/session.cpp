#include "host/session.h"

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <cstring>
#include <iostream>
#include <random>
#include <utility>

#include "clock/created_threads.h"
#include "clock/inside_wait.h"
#include "clock/process_clock.h"
#include "host/log_watch.h"
#include "host/open_platform.h"
#include "host/png_file.h"
#include "input/input_service.h"
#include "input/inside.h"
#include "scene/item.h"
#include "scene/item_text.h"

namespace brimol::pc {

namespace {

constexpr std::chrono::seconds kPictureBound{60};

Session* makeSession() {
  SessionSettings wanted =
      readSessionSettings([](const char* name) -> const char* { return std::getenv(name); });
  const bool isWanted =
      wanted.clock != ClockChoice::Real || !wanted.reportFolder.empty() || !wanted.error.empty();
  return isWanted ? new Session(std::move(wanted)) : nullptr;
}

TurnClock* clockOfSession() {
  Session* const made = session();
  return made == nullptr ? nullptr : made->clock();
}

// The clock is asked for before any screen opens.
[[maybe_unused]] const bool isMakerSet = (setClockMaker(clockOfSession), true);

void hearLog(int priority, const char* tag, const char* message) {
  session()->log(priority, tag, message);
}

bool isSameFrame(const Frame& one, const Frame& other) {
  return std::equal(one.begin(), one.end(), other.begin(), other.end(), drawTheSame);
}

const char* nameOf(DisplayChoice display) {
  switch (display) {
    case DisplayChoice::Headless: return "headless";
    case DisplayChoice::Browser: return "browser";
    default: return "window";
  }
}

}  // namespace

Session* session() {
  static Session* const made = makeSession();  // threads may ask until the process ends
  return made;
}

Session::Session(SessionSettings wanted) : settings(std::move(wanted)), problem(settings.error) {
  if (isPlaying()) parsed = parseTrace(settings.trace, settings.traceRoot);
  takeScreen();
  if (!problem.empty()) return;
  const bool isBadTrace = !parsed.error.empty();
  if (settings.clock != ClockChoice::Real && !isBadTrace) startClock();
  if (!settings.reportFolder.empty()) startReport();
  if (isBadTrace) return;
  if (isRecording()) startRecording();
  if (settings.monkey) startMonkey();
  if (!isPlaying()) return;
  std::ranges::for_each(worldAtStart(parsed.trace),
                        [this](const WorldChange& change) { world.change(change, 0); });
  runner.emplace(parsed.trace, stage());
}

void Session::takeScreen() {
  const SettingsResult wanted = readSettings();
  screenSize = wanted.settings.screen;
  display = wanted.settings.display;
  if (problem.empty()) problem = wanted.error;
  takeDensity(wanted.settings);
  const std::optional<Size>& size = parsed.trace.screen;
  if (!size) return;
  if (!wanted.settings.isSizeGiven) screenSize = *size;
  if (*size != screenSize) {
    parsed.refuse(parsed.trace.screenLine, "it is for a screen of " + std::to_string(size->w) +
                                               'x' + std::to_string(size->h) +
                                               ", and the environment asks for another");
  }
}

void Session::takeDensity(const Settings& wanted) {
  density = wanted.density;
  const std::optional<float>& recorded = parsed.trace.density;
  if (!recorded) return;
  if (!wanted.isDensityGiven) density = *recorded;
  if (*recorded != density) {
    parsed.refuse(parsed.trace.densityLine, "BRIMOL_DEVICE asks for another density");
  }
}

void Session::startReport() {
  report.emplace(settings.reportFolder, problem);
  report->start(settings, {screenSize, density, nameOf(display)},
                turns ? turns->ticksAtStart() : 0);
}

void Session::startClock() {
  const uint32_t start = parsed.trace.clockStart.value_or(settings.clockStart.value_or(0));
  turns.emplace(start, settings.clock == ClockChoice::Paced ? Speed::Real : Speed::Free);
  turns->setStep(parsed.trace.clockStep.value_or(settings.clockStep.value_or(1)));
  turns->setAgent({[this](uint64_t soonest) { return due(soonest); },
                   [this](uint64_t moment) { act(moment); }});
  turns->setBlockedWatcher(
      [this](const std::string& name, pid_t thread) { tellBlocked(name, thread); });
  letCreatedThreadsTakePart(*turns);
  inputService().follow(&*turns);
  inputService().divert([this](const Event& record) { userInput(record); });
}

void Session::startRecording() {
  recorder.emplace(settings.recording);
  if (settings.monkey) {  // its world is that of a script
    recorder->startScript(turns->ticksAtStart());
  } else {
    recordWorld();
  }
  if (settings.clockStep) recorder->clockStep(*settings.clockStep);
  recorder->screen(screenSize);
  if (density != kDefaultDensity) recorder->density(density);
}

void Session::recordWorld() {
  std::random_device seeds;
  const uint64_t seed = seeds();
  const auto since1970 = std::chrono::system_clock::now().time_since_epoch();
  const auto utc = std::chrono::duration_cast<std::chrono::milliseconds>(since1970).count();
  world.change({WorldChange::Kind::Time, static_cast<uint64_t>(utc), {}, {}}, 0);
  world.change({WorldChange::Kind::Random, seed, {}, {}}, 0);
  recorder->start(turns->ticksAtStart(), static_cast<uint64_t>(utc), seed);
}

std::string Session::prepare() {
  if (isOver) return {};
  if (!parsed.error.empty()) endWithBadTrace();
  if (problem.empty() && !parsed.trace.cutAt.empty()) {
    std::cerr << parsed.trace.cutAt << ": the recording has no end; it is played up to here\n";
  }
  if (!problem.empty() || !recorder) return problem;
  const std::lock_guard lock(mutex);
  const std::string error = recorder->open();
  return error.empty() ? error : "BRIMOL_RECORD=" + error;
}

void Session::giveUp() {
  const std::lock_guard lock(mutex);
  if (recorder && !isOver) recorder->close();
}

void Session::begin(Platform& platform) {
  // Without the lock, which is taken while the log holds its own.
  const bool isHeard = (!report && !runner) || watchLog(hearLog);
  const std::lock_guard lock(mutex);
  if (isOver || open != nullptr) return;
  open = &platform;
  if (recorder) recorder->begin();
  if (!isHeard && report) {
    report->error(now(), "the log is not heard: link brimol_pc before the log's library", nullptr);
  }
}

void Session::close() {
  const InsideWait wait(clock());
  const std::lock_guard lock(mutex);
  if (isOver || open == nullptr) return;
  if (runner) runner->seeEnd();
  endIfFailed();
  isOver = true;
  if (recorder && !monkey) recorder->end(now());
  if (report) report->end(now(), 0, "closed");
  open = nullptr;
}

TraceStage Session::stage() {
  return {.screen = screenSize,
          .post = [this](const Event& record) { deliver(record); },
          .close =
              [this] {
                askToClose();
                if (report) report->close(now(), &present);
              },
          .pixel = [this](ScreenPoint place) { return pixel(place); },
          .shoot = [this](const std::string& file) { return shoot(file); },
          .changeWorld = [this](const WorldChange& change) { world.change(change, now()); },
          .begin =
              [this](const TraceLine& line) {
                present = line;
                if (report) report->step(now(), line);
              },
          .judge =
              [this](const TraceLine& line, const std::string& why) {
                if (report) report->expectation(now(), line, why);
              }};
}

std::optional<uint64_t> Session::due(uint64_t soonest) {
  if (isOver) return std::nullopt;
  if (isRecording() && !isDriven()) {
    const std::lock_guard lock(arrivalMutex);
    return arrivals.empty() ? std::nullopt : std::optional(soonest);
  }
  const std::lock_guard lock(mutex);
  if (closedBy) return std::max(*closedBy, soonest);
  if (monkey) return monkey->due(soonest);
  return runner ? runner->due(soonest) : std::nullopt;
}

void Session::act(uint64_t moment) {
  {
    const std::lock_guard lock(mutex);
    if (isOver) return;
    hasPosted = false;
    if (runner) runner->act(moment);
    if (monkey) followMonkey(moment);
    endIfFailed();
    takeArrivals(moment);
    if (!hasPosted) return;
  }
  turns->wakePoller();
}

void Session::takeArrivals(uint64_t moment) {
  std::vector<Arrival> taken;
  {
    const std::lock_guard lock(arrivalMutex);
    taken.swap(arrivals);
  }
  for (const auto& [record, isClose] : taken) {
    if (isClose) {
      recorder->userCloses(moment);
      if (report) report->close(moment, nullptr);
      askToClose();
    } else {
      recorder->input(moment, record);
      deliver(record);
    }
  }
}

void Session::deliver(const Event& record) {
  inputService().deliver(record);
  hasPosted = true;
  if (report) report->event(now(), record, &present);
}

void Session::askToClose() { closeAsked = true; }

void Session::userInput(const Event& record) {
  if (!isRecording() || isDriven() || isOver) return;
  {
    const std::lock_guard lock(arrivalMutex);
    arrivals.push_back({record, false});
  }
  turns->lookAtAgent();
}

void Session::userCloses() {
  if (!isRecording() || isDriven() || isOver) return;
  {
    const std::lock_guard lock(arrivalMutex);
    arrivals.push_back({{}, true});
  }
  turns->lookAtAgent();
}

std::optional<bool> Session::isCloseRequested() const {
  if (!isDriven() && !isRecording()) return std::nullopt;
  return closeAsked.load();
}

void Session::frame(Platform& platform, Frame& shown) {
  if (turns) turns->takePart();
  const InsideWait wait(clock());
  const std::lock_guard lock(mutex);
  if (isOver || open == nullptr || (frames > 0 && isSameFrame(lastFrame, shown))) {
    platform.submit(shown);
    return;
  }
  lastFrame = shown;
  ++frames;
  const std::vector<std::string> items = textOfFrame(lastFrame);
  const auto start = std::chrono::steady_clock::now();
  platform.submit(shown);
  if (report) {
    CairoSurface picture;
    if (settings.keepsPictures) picture = platform.copyPicture(kPictureBound);
    const auto taken = std::chrono::steady_clock::now() - start;
    report->frame({now(), frames, lastFrame, items}, screenSize, picture.get(),
                  std::chrono::duration_cast<std::chrono::microseconds>(taken).count());
  }
  if (recorder && !monkey) recorder->frame(now(), items);
  if (monkey) monkey->seeFrame(now(), lastFrame);
  if (runner) runner->seeFrame(now(), lastFrame, items);
  endIfFailed();
}

void Session::log(int priority, const char* tag, const char* message) {
  const std::lock_guard lock(mutex);
  if (isOver) return;
  if (report) report->log(now(), priority, tag, message);
  if (runner) runner->seeLog(std::string(tag) + ": " + message);
}

std::optional<uint32_t> Session::pixel(ScreenPoint place) {
  const CairoSurface picture = open == nullptr ? nullptr : open->copyPicture(kPictureBound);
  const bool isInside =
      place.x >= 0 && place.y >= 0 && place.x < screenSize.w && place.y < screenSize.h;
  if (!picture || !isInside) return std::nullopt;
  constexpr uint32_t kColourBits = 0xFFFFFF;
  const auto stride = static_cast<std::ptrdiff_t>(cairo_image_surface_get_stride(picture.get()));
  const unsigned char* const row = cairo_image_surface_get_data(picture.get()) + place.y * stride;
  uint32_t colour = 0;
  std::memcpy(&colour, row + place.x * static_cast<std::ptrdiff_t>(sizeof colour), sizeof colour);
  return colour & kColourBits;
}

std::string Session::shoot(const std::string& file) {
  const std::filesystem::path path = std::filesystem::path(settings.reportFolder) / file;
  // A link of the folder may lead elsewhere.
  if (!isInside(settings.reportFolder, path)) return path.native() + " is outside of the folder";
  const CairoSurface picture = open == nullptr ? nullptr : open->copyPicture(kPictureBound);
  if (!picture) return "there is no picture";
  std::string error = writePng(picture.get(), path);
  if (error.empty() && report) report->shot(now(), present, path);
  return error;
}

std::optional<uint64_t> Session::utcMs() {
  if (!turns) return std::nullopt;
  turns->takePart();
  const std::lock_guard lock(mutex);
  return world.utcMs(now());
}

std::optional<uint32_t> Session::random() {
  if (!turns) return std::nullopt;
  turns->takePart();
  const std::lock_guard lock(mutex);
  const uint32_t number = world.random();
  showWorld("random", std::to_string(number));
  return number;
}

std::optional<std::string> Session::figure(const std::string& name, const std::string& real) {
  if (!turns) return std::nullopt;
  turns->takePart();
  const std::lock_guard lock(mutex);
  if (!isRecording() || isDriven()) return world.figure(name);
  bool isNew = false;
  std::string value = world.record(name, real, now(), isNew);
  if (isNew && !isOver) recorder->figure(now(), name, value);
  if (isNew) showWorld(name, value);
  return value;
}

void Session::showWorld(const std::string& name, const std::string& value) {
  if (report && !isOver) report->world(now(), name, value);
}

}  // namespace brimol::pc
