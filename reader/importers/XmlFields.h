#pragma once

#include <optional>
#include <pugixml.hpp>
#include <string>
#include <string_view>
#include <vector>

namespace ax::reader {

// Reading elements by local name: a file may put any of its elements behind a namespace prefix. An element
// that is missing reads as a null node, and a null node has no children and no text.

std::string_view localName(pugi::xml_node node);

// The first child element of that name; along a path such as "Creator/Name", the first child's first child.
pugi::xml_node childNamed(pugi::xml_node node, std::string_view name);
pugi::xml_node childAt(pugi::xml_node node, std::string_view path);
std::vector<pugi::xml_node> childrenNamed(pugi::xml_node node, std::string_view name);

// The element anywhere below `node`, in the order of the file.
pugi::xml_node descendantNamed(pugi::xml_node node, std::string_view name);

// The element's own text without surrounding blanks.
std::string textOf(pugi::xml_node node);

// The first line that says something, with runs of blanks made one: fit to be spoken.
std::string lineOf(std::string_view text);

// Closed at both ends.
struct NumberLimits {
  double least;
  double most;
};
constexpr double beyondAnyRecord = 1e12;
constexpr NumberLimits notNegative{0, beyondAnyRecord};
constexpr NumberLimits heartRates{1, 255};  // beats a minute, what both formats have room for
constexpr NumberLimits latitudes{-90, 90};
constexpr NumberLimits longitudes{-180, 180};
constexpr NumberLimits altitudes{-1000, 20000};
constexpr NumberLimits cadences{0, 254};
constexpr NumberLimits powers{0, 10000};

// A decimal number with nothing but blanks around it, in the notation of XML whatever the locale.
std::optional<double> parseNumber(std::string_view text, NumberLimits limits);
// The same, for fields that need no more digits.
std::optional<float> parseShort(std::string_view text, NumberLimits limits);

// Seconds since 1970-01-01 00:00 UTC; a time without an offset is in UTC.
struct FileTime {
  double time = 0;
  std::optional<double> secondsEastOfUtc = {};  // as the text tells; "Z" tells no local time
};
// A date with its time of the day, with nothing but blanks around it.
std::optional<FileTime> parseTime(std::string_view text);

}  // namespace ax::reader
