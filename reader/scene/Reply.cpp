#include "reader/scene/Reply.h"

#include <array>
#include <charconv>
#include <cmath>

#include "platform/foundation/Array.h"
#include "platform/foundation/AttributedString.h"
#include "platform/foundation/Date.h"
#include "platform/health/Quantity.h"
#include "platform/runtime/Number.h"
#include "platform/runtime/Value.h"
#include "platform/toolkit/AccessibilityMessages.h"
#include "platform/toolkit/Responder.h"
#include "reader/text/TraitNames.h"

namespace ax::reader {

namespace {

using Json = nlohmann::ordered_json;

// One bit each, in the order of the bits.

Json real(double value) {
  if (std::isnan(value)) return "nan";
  if (std::isinf(value)) return value < 0 ? "-inf" : "inf";
  return value;
}

// The shortest decimal that is this float, so that 0.1 stays 0.1.
Json real(float value) {
  if (!std::isfinite(value)) return real(static_cast<double>(value));
  char text[32];
  const char* end = std::to_chars(text, text + sizeof text, value).ptr;
  double shortest = 0;
  std::from_chars(text, end, shortest);
  return shortest;
}

class ReplyWriter {
 public:
  explicit ReplyWriter(const IdOf& idOf) : idOf_(idOf) {}

  Json write(const Ref<Object>& reply) const;

 private:
  Json writeText(const String& text) const;
  Json writeList(const Array& list) const;
  Json writeQuantity(const Quantity& quantity) const;
  Json writeShown(Object& shown) const;
  Json writeOther(const Object& other) const;

  const IdOf& idOf_;
};

Json writeNumber(const Number& number) {
  return std::visit(
      [](auto value) -> Json {
        if constexpr (std::is_floating_point_v<decltype(value)>) {
          return real(value);
        } else {
          return value;
        }
      },
      number.content());
}

Json named(const char* name, Json content) {
  Json result = Json::object();
  result[name] = std::move(content);
  return result;
}

Json reals(std::initializer_list<double> values) {
  Json list = Json::array();
  for (double value : values) list.push_back(real(value));
  return list;
}

struct ValueWriter {
  Json operator()(Point p) const { return named("point", reals({p.x, p.y})); }
  Json operator()(Size s) const { return named("size", reals({s.width, s.height})); }
  Json operator()(Rect r) const { return named("rect", reals({r.x, r.y, r.width, r.height})); }
  Json operator()(Insets i) const { return named("insets", reals({i.top, i.left, i.bottom, i.right})); }
  Json operator()(Selector s) const { return named("selector", s.name()); }
};

Json writeInterval(const DateInterval& interval) {
  return named("interval", {interval.startDate()->description(), interval.endDate()->description()});
}

Json ReplyWriter::write(const Ref<Object>& reply) const {
  Object* object = reply.get();
  if (object == nullptr) return nullptr;
  if (const auto* text = cast<String>(object)) return writeText(*text);
  if (const auto* number = cast<Number>(object)) return writeNumber(*number);
  if (const auto* list = cast<Array>(object)) return writeList(*list);
  if (const auto* date = cast<Date>(object)) return named("date", date->description());
  if (const auto* interval = cast<DateInterval>(object)) return writeInterval(*interval);
  if (const auto* unit = cast<Unit>(object)) return named("unit", unit->text());
  if (const auto* quantity = cast<Quantity>(object)) return writeQuantity(*quantity);
  if (const auto* value = cast<Value>(object)) return std::visit(ValueWriter(), value->content());
  if (object->isKindOf(Responder::staticClass())) return writeShown(*object);
  return writeOther(*object);
}

Json ReplyWriter::writeText(const String& text) const {
  const auto* attributed = cast<AccessibilityAttributedString>(&text);
  if (attributed == nullptr) return text.text();
  Json attributes = Json::array();
  for (const TextAttribute& attribute : attributed->attributes()) {
    attributes.push_back({{"key", attribute.key.name()},
                          {"range", {attribute.range.location, attribute.range.length}},
                          {"value", write(attribute.value)}});
  }
  return {{"string", text.text()}, {"attributes", std::move(attributes)}};
}

Json ReplyWriter::writeList(const Array& list) const {
  Json items = Json::array();
  for (const Ref<Object>& item : list) items.push_back(write(item));
  return items;
}

Json ReplyWriter::writeQuantity(const Quantity& quantity) const {
  Json parts = Json::array({real(quantity.value())});
  parts.push_back(quantity.unit() ? Json(quantity.unit()->text()) : Json());
  return named("quantity", std::move(parts));
}

Json ReplyWriter::writeShown(Object& shown) const {
  Json record = writeOther(shown);
  record["label"] = write(messages::accessibilityLabel(shown));
  record["value"] = write(messages::accessibilityValue(shown));
  record["hint"] = write(messages::accessibilityHint(shown));
  record["traits"] = traitNames(messages::accessibilityTraits(shown));
  const Rect frame = messages::accessibilityFrame(shown);
  record["frame"] = reals({frame.x, frame.y, frame.width, frame.height});
  record["isElement"] = messages::isAccessibilityElement(shown);
  return record;
}

// A class stands for itself, everything else is known by its id.
Json ReplyWriter::writeOther(const Object& other) const {
  if (const auto* itself = cast<Class>(&other)) return named("classNamed", itself->name());
  Json record = Json::object();
  const std::string id = idOf_(other);
  record["id"] = id.empty() ? Json() : Json(id);
  record["class"] = other.isa().name();
  const auto* styled = cast<AttributedString>(&other);
  if (styled == nullptr) return record;
  record["attributed"] = styled->description();
  record["label"] = write(messages::accessibilityLabel(const_cast<Object&>(other)));
  return record;
}

}  // namespace

Json replyAsJson(const Ref<Object>& reply, const IdOf& idOf) {
  return ReplyWriter(idOf).write(reply);
}

}  // namespace ax::reader
