#include "apps/axvelto/Progress.h"

#include <unistd.h>

#include <iostream>
#include <utility>

namespace ax::app {

namespace {

constexpr std::string_view clearLine = "\r\x1B[K";

}  // namespace

Progress::Progress(std::string what) : what_(std::move(what)), isShown_(isatty(STDERR_FILENO) == 1) {}

Progress::~Progress() {
  clear();
}

void Progress::clear() const {
  if (isShown_) std::cerr << clearLine << std::flush;
}

void Progress::show(std::size_t done, std::size_t all) const {
  if (isShown_) std::cerr << clearLine << what_ << ' ' << done << '/' << all << std::flush;
}

}  // namespace ax::app
