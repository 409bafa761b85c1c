#include <exception>
#include <iostream>

#include "options.h"
#include "process/inherited.h"
#include "replay.h"
#include "verdict.h"
#include "version.h"

using brimol::replay::Options;

int main(int count, char** arguments) {
  brimol::process::settleInherited();
  try {
    std::string error;
    const auto options = brimol::replay::parseOptions({arguments + 1, arguments + count}, error);
    if (!options) {
      std::cerr << "brimol-replay: " << error << '\n';
      return exitCodeOf(brimol::replay::Verdict::Unusable);
    }
    switch (options->action) {
      case Options::Action::Help: std::cout << brimol::replay::usage(); return 0;
      case Options::Action::Version:
        std::cout << "brimol-replay " << brimol::replay::kVersion << '\n';
        return 0;
      default: return brimol::replay::replay(*options);
    }
  } catch (const std::exception& failure) {
    std::cerr << "brimol-replay: " << failure.what() << '\n';
    return exitCodeOf(brimol::replay::Verdict::Unusable);
  }
}
