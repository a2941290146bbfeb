#pragma once

#include <string>

#include "platform/formatting/Region.h"

// Sets the region for one block of a test and puts the default back.
struct RegionScope {
  explicit RegionScope(const std::string& locale, const char* timeZone = "UTC") {
    ax::formatting::setCurrentRegion({locale, timeZone});
  }
  ~RegionScope() { ax::formatting::setCurrentRegion({"en_US", "UTC"}); }
  RegionScope(const RegionScope&) = delete;
  RegionScope& operator=(const RegionScope&) = delete;
};

// The text with every narrow, thin or no-break space as a plain one, so that expectations can be read.
inline std::string plainSpaces(std::string text) {
  for (const std::string space : {"\u00A0", "\u2009", "\u202F"}) {
    for (std::size_t at = text.find(space); at != std::string::npos; at = text.find(space, at)) {
      text.replace(at, space.size(), " ");
    }
  }
  return text;
}
