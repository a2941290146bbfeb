#pragma once

namespace ax {

// Where in the code something was asked.
struct SourcePlace {
  const char* file;
  unsigned line;
  static constexpr SourcePlace current(const char* file = __builtin_FILE(),
                                       unsigned line = __builtin_LINE()) {
    return {file, line};
  }
};

}  // namespace ax
