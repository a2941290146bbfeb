#pragma once

#include <string>
#include <string_view>
#include <utility>

#include "tests/fuzz/Targets.h"

namespace ax::fuzz {

inline std::string textOf(Bytes bytes) {
  return {bytes.begin(), bytes.end()};
}

// A text up to its first line feed, and what stands behind it.
inline std::pair<std::string_view, std::string_view> firstLine(std::string_view text) {
  const std::size_t end = text.find('\n');
  if (end == std::string_view::npos) return {text, {}};
  return {text.substr(0, end), text.substr(end + 1)};
}

}  // namespace ax::fuzz
