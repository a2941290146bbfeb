#include "platform/formatting/Dates.h"

#include <array>

#include "platform/formatting/Region.h"
#include "tests/fuzz/Pieces.h"

// The first byte chooses the region, the first line is the template, the rest a date to be read by it.
void ax::fuzz::fuzzDates(Bytes bytes) {
  static const std::array<formatting::Region, 4> regions = {{{"en_US", "America/New_York"},
                                                             {"ar_EG", "Africa/Cairo"},
                                                             {"ja_JP", "Asia/Tokyo"},
                                                             {"fr_FR", "Europe/Paris"}}};
  if (bytes.empty()) return;
  const formatting::Region& region = regions[bytes[0] % regions.size()];
  if (formatting::currentRegion() != region) formatting::setCurrentRegion(region);
  const std::string text = textOf(bytes.subspan(1));
  const auto [pattern, date] = firstLine(text);
  constexpr double morning = 1772953200;
  formatting::dateString(morning, pattern);
  if (const auto time = formatting::parseDate(date, pattern)) formatting::dateString(*time, pattern);
}
