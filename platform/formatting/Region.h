// The language and the time zone that everything in this folder formats for.
// Main thread only.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace ax::formatting {

struct Region {
  std::string locale;    // such as "en_US"
  std::string timeZone;  // such as "America/New_York"

  bool operator==(const Region&) const = default;
};

// "en_US" and "UTC" until it is set; the environment of the process is never read.
const Region& currentRegion();

// Makes `region` current and drops every cached formatter, even when nothing changed. A locale or
// zone that is not known is replaced by its default, so that currentRegion() tells what is in force.
void setCurrentRegion(Region region);

// Grows by one with each setCurrentRegion: what is derived from the region is stale when it differs.
std::uint64_t regionGeneration();

// The language alone: "en".
std::string currentLanguage();
bool currentLanguageIsRightToLeft();
bool isRightToLeft(const std::string& locale);

// The locale of the region where a language is spoken most: "de_DE" for "de", "en_US" for "root".
std::string likelyLocale(const std::string& language);

// For checking input before it becomes current. A locale is known when its language is.
bool isKnownLocale(std::string_view locale);
bool isKnownTimeZone(std::string_view timeZone);

}  // namespace ax::formatting
