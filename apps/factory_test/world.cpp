#include "world.h"

#include <brimol/host.h>

#include <array>
#include <string>

#include "language/language.h"

namespace factory_test {

namespace {

void ask(const char* name, std::string& figure) {
  constexpr std::size_t kMostBytes = 200;
  std::array<char, kMostBytes> told = {};
  brimol_host_figure(name, figure.c_str(), told.data(), static_cast<int>(told.size()));
  figure = told.front() == '\0' ? tr("n/a") : told.data();
}

}  // namespace

std::chrono::sys_seconds presentTime() {
  const std::chrono::milliseconds since1970(brimol_host_utc_ms());
  return std::chrono::floor<std::chrono::seconds>(
      std::chrono::sys_time<std::chrono::milliseconds>(since1970));
}

MachineFigures presentFigures() {
  MachineFigures figures = readMachineFigures();
  ask("battery", figures.battery);
  ask("charger", figures.charger);
  ask("brightness", figures.brightness);
  ask("host", figures.hostName);
  ask("address", figures.address);
  ask("load", figures.load);
  return figures;
}

}  // namespace factory_test
