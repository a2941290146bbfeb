#include "reader/picture/Markup.h"

#include <charconv>
#include <cmath>
#include <nlohmann/json.hpp>

namespace ax::reader {

namespace {

// JSON's writer knows what is UTF-8.
std::string wellFormed(std::string_view text) {
  using Json = nlohmann::json;
  return Json::parse(Json(text).dump(-1, ' ', false, Json::error_handler_t::replace)).get<std::string>();
}

std::string_view escaped(char c) {
  switch (c) {
    case '&':
      return "&amp;";
    case '<':
      return "&lt;";
    case '>':
      return "&gt;";
    case '"':
      return "&quot;";
    case '\'':
      return "&#39;";
    default:
      return {};
  }
}

bool isControl(char c) {
  return (c >= 0 && c < ' ' && c != '\n' && c != '\t') || c == 0x7F;
}

void addEscaped(std::string_view text, std::string& to) {
  for (const char c : wellFormed(text)) {
    if (isControl(c)) continue;
    const std::string_view instead = escaped(c);
    if (instead.empty()) {
      to += c;
    } else {
      to += instead;
    }
  }
}

}  // namespace

std::string markupNumber(double value) {
  if (!std::isfinite(value)) return "0";
  constexpr std::size_t longest = 400;  // of the largest double
  char text[longest];
  const double rounded = std::round(value * 100) / 100;
  const auto [end, error] =
      std::to_chars(text, text + longest, rounded == 0 ? 0.0 : rounded, std::chars_format::fixed, 2);
  std::string number(text, error == std::errc() ? end : text);
  number.erase(number.find_last_not_of('0') + 1);
  if (number.ends_with('.')) number.pop_back();
  return number;
}

Attribute::Attribute(std::string_view attribute, double number)
    : name(attribute), value(markupNumber(number)) {}

void Markup::start(std::string_view name, Attributes attributes) {
  text_.append("<").append(name);
  for (const Attribute& attribute : attributes) {
    if (!attribute.value) continue;
    text_.append(" ").append(attribute.name).append("=\"");
    addEscaped(*attribute.value, text_);
    text_ += '"';
  }
}

Markup& Markup::open(std::string_view name, Attributes attributes) {
  start(name, attributes);
  text_ += '>';
  open_.emplace_back(name);
  return *this;
}

Markup& Markup::close() {
  text_.append("</").append(open_.back()).append(">");
  open_.pop_back();
  return *this;
}

Markup& Markup::empty(std::string_view name, Attributes attributes) {
  start(name, attributes);
  text_ += "/>";
  return *this;
}

Markup& Markup::text(std::string_view text) {
  addEscaped(text, text_);
  return *this;
}

Markup& Markup::raw(std::string_view markup) {
  text_ += markup;
  return *this;
}

Markup& Markup::element(std::string_view name, Attributes attributes, std::string_view content) {
  return open(name, attributes).text(content).close();
}

}  // namespace ax::reader
