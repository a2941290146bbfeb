#include "reader/scene/SceneText.h"

#include <algorithm>
#include <optional>

#include "reader/scene/JsonText.h"

namespace ax::reader {

namespace {

constexpr std::size_t lineWidth = 110;
constexpr std::string_view blanks = " \t\r\n";

std::string nameOf(const Json& holder, const std::string& key) {
  return holder.is_object() ? Json(key).dump(-1, ' ', false) + ": " : "";
}

std::string enclosed(const Json& value, const std::string& text) {
  return value.is_object() ? "{" + text + "}" : "[" + text + "]";
}

std::string oneLine(const Json& value) {
  if (!value.is_structured()) {
    const bool isWhole =
        value.is_number_float() && value.get<double>() == static_cast<double>(value.get<std::int64_t>());
    return isWhole ? std::to_string(value.get<std::int64_t>()) : value.dump(-1, ' ', false);
  }
  std::string text;
  for (const auto& [key, item] : value.items()) {
    text += text.empty() ? "" : ", ";
    text += nameOf(value, key) + oneLine(item);
  }
  return enclosed(value, text);
}

// Characters, not bytes.
std::size_t widthOf(std::string_view text) {
  std::size_t width = 0;
  for (const char c : text) width += (static_cast<unsigned char>(c) & 0xC0) != 0x80 ? 1 : 0;
  return width;
}

bool fitsOneLine(const Json& value) {
  return !value.is_structured() || widthOf(oneLine(value)) < lineWidth / 2;
}

// Objects of short members, and lists of numbers, fill their lines.
bool flows(const Json& value) {
  return value.is_object() ? std::ranges::all_of(value, fitsOneLine)
                           : std::ranges::all_of(value, [](const Json& item) { return item.is_number(); });
}

// Members one behind the other, in lines that begin behind the opening bracket.
std::string flowing(const Json& value, std::size_t column) {
  std::string text;
  std::size_t at = column + 1;
  for (const auto& [key, item] : value.items()) {
    const std::string member = nameOf(value, key) + oneLine(item);
    const bool breaks = !text.empty() && at + 2 + widthOf(member) >= lineWidth;
    if (!text.empty()) text += breaks ? ",\n" + std::string(column + 1, ' ') : ", ";
    at = (breaks || text.empty() ? column + 1 : at + 2) + widthOf(member);
    text += member;
  }
  return enclosed(value, text);
}

std::string itemPerLine(const Json& value, std::size_t indent) {
  const std::size_t inner = indent + 2;
  std::string text;
  for (const auto& [key, item] : value.items()) {
    const std::string name = nameOf(value, key);
    text += (text.empty() ? "\n" : ",\n") + std::string(inner, ' ') + name +
            laidOut(item, inner + widthOf(name), inner);
  }
  return enclosed(value, text + "\n" + std::string(indent, ' '));
}

// A part of a text that is well-formed JSON.
struct TextRange {
  std::size_t begin;
  std::size_t end;
};

class JsonScanner {
 public:
  explicit JsonScanner(std::string_view text) : text_(text) {}

  TextRange whole() { return valueFrom(0); }

  // A member or an item of the value at a range, by its key or its number; nothing when there is none.
  std::optional<TextRange> part(TextRange of, std::string_view name) {
    const bool isObject = text_[of.begin] == '{';
    std::size_t at = skipBlanks(of.begin + 1);
    for (std::size_t number = 0; at < of.end - 1; ++number) {
      std::string_view key;
      if (isObject) {
        const std::size_t end = endOfString(at);
        key = text_.substr(at + 1, end - at - 2);
        at = skipBlanks(skipBlanks(end) + 1);
      }
      const TextRange value = valueFrom(at);
      if (isObject ? key == name : std::to_string(number) == name) return value;
      at = skipBlanks(value.end);
      if (text_[at] == ',') at = skipBlanks(at + 1);
    }
    return std::nullopt;
  }

 private:
  std::size_t skipBlanks(std::size_t at) const {
    return std::min(text_.find_first_not_of(blanks, at), text_.size());
  }

  std::size_t endOfString(std::size_t quote) const {
    std::size_t at = quote + 1;
    while (text_[at] != '"') at += text_[at] == '\\' ? 2 : 1;
    return at + 1;
  }

  TextRange valueFrom(std::size_t at) const {
    const std::size_t begin = skipBlanks(at);
    std::size_t end = begin;
    std::size_t depth = 0;
    do {
      const char c = text_[end];
      if (c == '"') {
        end = endOfString(end);
        continue;
      }
      if (c == '{' || c == '[') ++depth;
      if (c == '}' || c == ']') --depth;
      const bool isPlain = depth == 0 && c != '}' && c != ']';
      end = isPlain ? std::min(text_.find_first_of(",]} \t\r\n", end), text_.size()) : end + 1;
    } while (depth > 0);
    return {begin, end};
  }

  std::string_view text_;
};

std::size_t columnOf(const std::string& text, std::size_t at) {
  const std::size_t newline = at == 0 ? std::string::npos : text.rfind('\n', at - 1);
  return widthOf(std::string_view(text).substr(newline + 1, at - newline - 1));
}

std::size_t indentOf(const std::string& text, std::size_t at) {
  const std::size_t newline = at == 0 ? std::string::npos : text.rfind('\n', at - 1);
  return text.find_first_not_of(' ', newline + 1) - newline - 1;
}

std::optional<TextRange> find(const std::string& text, const std::string& pointer) {
  JsonScanner scanner(text);
  std::optional<TextRange> range = scanner.whole();
  for (std::size_t at = 0; range && at < pointer.size();) {
    const std::size_t end = std::min(pointer.find('/', at + 1), pointer.size());
    range = scanner.part(*range, std::string_view(pointer).substr(at + 1, end - at - 1));
    at = end;
  }
  return range;
}

// A new last member: on the line of the others where it fits, else below the first of them.
std::string appended(const std::string& text, TextRange object, const std::string& key, const Json& value) {
  const std::size_t last = text.find_last_not_of(blanks, object.end - 2) + 1;
  const std::string name = Json(key).dump() + ": ";
  if (last == object.begin + 1)
    return text.substr(0, last) + name +
           laidOut(value, columnOf(text, last) + name.size(), indentOf(text, last)) + text.substr(last);
  const bool isOneLine = text.find('\n', object.begin) >= object.end;
  const std::string onSameLine = ", " + name + oneLine(value);
  if (isOneLine && columnOf(text, object.end) + widthOf(onSameLine) < lineWidth) {
    return text.substr(0, last) + onSameLine + text.substr(last);
  }
  const std::size_t indent = columnOf(text, text.find_first_not_of(blanks, object.begin + 1));
  return text.substr(0, last) + ",\n" + std::string(indent, ' ') + name +
         laidOut(value, indent + name.size(), indent) + text.substr(last);
}

std::string replaced(const std::string& text, TextRange old, const Json& value) {
  const std::string put = laidOut(value, columnOf(text, old.begin), indentOf(text, old.begin));
  return text.substr(0, old.begin) + put + text.substr(old.end);
}

}  // namespace

std::string laidOut(const Json& value, std::size_t column, std::size_t indent) {
  const std::string line = oneLine(value);
  const bool isFlat = !value.is_structured() || value.empty();
  if (isFlat || column + widthOf(line) < lineWidth) return line;
  return flows(value) ? flowing(value, column) : itemPerLine(value, indent);
}

std::string withMember(const std::string& text, const std::string& object, const std::string& key,
                       const Json& value, const std::string& file) {
  const nlohmann::ordered_json::json_pointer pointer(object);
  Json wanted = readJson(text, file);
  wanted[pointer][key] = value;
  const std::optional<TextRange> holder = find(text, object);
  const std::optional<TextRange> old = find(text, object + "/" + key);
  std::string changed = !holder ? text
                        : old   ? replaced(text, *old, value)
                                : appended(text, *holder, key, value);
  if (readJson(changed, file) == wanted) return changed;
  throw Fault{file, object, "a spelling that cannot be added to", "keys without escapes"};
}

}  // namespace ax::reader
