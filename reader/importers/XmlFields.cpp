#include "reader/importers/XmlFields.h"

#include <algorithm>
#include <charconv>

#include "platform/formatting/IsoTime.h"
#include "reader/importers/TextEncoding.h"

namespace ax::reader {
namespace {

constexpr std::string_view blanks = " \t\r\n";

std::string_view trimmed(std::string_view text) {
  const std::size_t first = text.find_first_not_of(blanks);
  if (first == std::string_view::npos) return {};
  return text.substr(first, text.find_last_not_of(blanks) - first + 1);
}

}  // namespace

std::string_view localName(pugi::xml_node node) {
  const std::string_view name = node.name();
  return name.substr(name.rfind(':') + 1);
}

pugi::xml_node childNamed(pugi::xml_node node, std::string_view name) {
  return node.find_child([&](pugi::xml_node child) { return localName(child) == name; });
}

pugi::xml_node childAt(pugi::xml_node node, std::string_view path) {
  const std::size_t slash = path.find('/');
  const pugi::xml_node child = childNamed(node, path.substr(0, slash));
  return slash == std::string_view::npos ? child : childAt(child, path.substr(slash + 1));
}

std::vector<pugi::xml_node> childrenNamed(pugi::xml_node node, std::string_view name) {
  std::vector<pugi::xml_node> found;
  for (const pugi::xml_node child : node) {
    if (localName(child) == name) found.push_back(child);
  }
  return found;
}

pugi::xml_node descendantNamed(pugi::xml_node node, std::string_view name) {
  return node.find_node([&](pugi::xml_node below) { return localName(below) == name; });
}

std::string textOf(pugi::xml_node node) {
  std::string text = node.type() == pugi::node_element ? node.value() : "";  // kept there when it is all
  for (const pugi::xml_node child : node) {
    if (child.type() == pugi::node_pcdata || child.type() == pugi::node_cdata) text += child.value();
  }
  return std::string(trimmed(text));
}

std::string lineOf(std::string_view text) {
  text = trimmed(text);
  text = text.substr(0, text.find_first_of("\r\n"));
  std::string line;
  for (std::size_t end = 0; !text.empty(); text = trimmed(text.substr(end))) {
    end = std::min(text.find_first_of(blanks), text.size());
    if (!line.empty()) line += ' ';
    line += text.substr(0, end);
  }
  return isUtf8(line) ? line : std::string();  // a character reference may name half a character
}

std::optional<double> parseNumber(std::string_view text, NumberLimits limits) {
  text = trimmed(text);
  if (text.starts_with('+') && !text.starts_with("+-")) text.remove_prefix(1);
  double value = 0;
  const char* end = text.data() + text.size();
  const auto [stop, error] = std::from_chars(text.data(), end, value);
  const bool isWhole = error == std::errc{} && stop == end;
  // "inf" lies outside all limits, and no comparison with "nan" holds.
  if (!isWhole || !(value >= limits.least && value <= limits.most)) return std::nullopt;
  return value;
}

std::optional<float> parseShort(std::string_view text, NumberLimits limits) {
  const auto value = parseNumber(text, limits);
  return value ? std::optional(static_cast<float>(*value)) : std::nullopt;
}

std::optional<FileTime> parseTime(std::string_view text) {
  const auto read = formatting::readIso(trimmed(text));
  if (!read || !read->hasClock) return std::nullopt;
  return FileTime{read->local - read->offset.value_or(0), read->offset};
}

}  // namespace ax::reader
