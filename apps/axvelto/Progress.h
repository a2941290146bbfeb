#pragma once

#include <cstddef>
#include <string>

namespace ax::app {

// How far long work is: a line on standard error that is written over again, and only on a terminal. It goes
// with its end.
class Progress {
 public:
  explicit Progress(std::string what);
  ~Progress();
  Progress(const Progress&) = delete;
  Progress& operator=(const Progress&) = delete;

  void show(std::size_t done, std::size_t all) const;
  // Before another line is written there.
  void clear() const;

 private:
  std::string what_;
  bool isShown_;
};

}  // namespace ax::app
