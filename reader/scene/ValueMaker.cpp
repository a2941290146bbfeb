#include "reader/scene/ValueMaker.h"

#include "platform/formatting/IsoTime.h"
#include "platform/foundation/Array.h"
#include "platform/foundation/AttributedString.h"
#include "platform/foundation/Date.h"
#include "platform/foundation/Formatters.h"
#include "platform/health/Quantity.h"
#include "platform/runtime/Message.h"
#include "platform/runtime/Value.h"
#include "platform/toolkit/AccessibilityMessages.h"

namespace ax::reader {

namespace {

Ref<String> hostText(const std::string& key) {
  static const Message<Ref<String>(Ref<String>)> textForKey{"textForKey:"};
  return textForKey(Class::namedEvenIfHidden("HostStrings"), string(key));
}

Ref<Date> makeDate(const SceneDate& given) {
  return date(*formatting::timeFromIso(given.iso));
}

}  // namespace

class ValueMaker::Visitor {
 public:
  Visitor(const ValueMaker& maker, const std::string& place) : maker_(maker), place_(place) {}

  Ref<Object> operator()(std::nullptr_t) const { return nullptr; }
  Ref<Object> operator()(Number::Content content) const { return make<Number>(content); }
  Ref<Object> operator()(const SceneString& given) const;
  Ref<Object> operator()(const std::vector<SceneValue>& values) const;
  Ref<Object> operator()(const std::unique_ptr<SceneObject>& object) const {
    return maker_.makeObject_(*object);
  }
  Ref<Object> operator()(const SceneReference& reference) const {
    return maker_.objects_.find(reference.target, place_);
  }
  Ref<Object> operator()(const SceneDate& given) const { return makeDate(given); }
  Ref<Object> operator()(const SceneInterval& given) const;
  Ref<Object> operator()(const SceneQuantity& given) const {
    return quantity(given.value, Unit::unitFromString(given.unit));
  }
  Ref<Object> operator()(const SceneUnit& given) const { return Unit::unitFromString(given.unit); }
  // Geometry and selectors.
  template <class T>
  Ref<Object> operator()(const T& content) const {
    return make<Value>(Value::Content(content));
  }

 private:
  // The text, and its spoken form when the table has one.
  std::pair<Ref<String>, Ref<String>> text(const SceneText& given) const;

  const ValueMaker& maker_;
  const std::string& place_;
};

std::pair<Ref<String>, Ref<String>> ValueMaker::Visitor::text(const SceneText& given) const {
  if (!given.isLocalized) return {string(given.text), nullptr};
  const Ref<String> pattern = hostText(given.text);
  if (!pattern) {
    throw Fault{maker_.objects_.file(), place_, "unknown text \"" + given.text + "\"",
                "a key of the host's string table"};
  }
  const std::vector<Ref<Object>> arguments = maker_.values(given.with);
  return {stringWithFormat(pattern, arguments),
          stringWithFormat(hostText(given.text + ".spoken"), arguments)};
}

Ref<Object> ValueMaker::Visitor::operator()(const SceneString& given) const {
  const auto both = text(given.text);
  const Ref<String> shown = both.first;
  const Ref<String> spoken = given.label ? text(*given.label).first : both.second;
  Ref<Object> result = given.isAttributed ? Ref<Object>(make<AttributedString>(shown)) : Ref<Object>(shown);
  if (spoken) messages::setAccessibilityLabel(result, spoken);
  return result;
}

Ref<Object> ValueMaker::Visitor::operator()(const std::vector<SceneValue>& values) const {
  const Ref<MutableArray> list = make<MutableArray>();
  for (const SceneValue& value : values) {
    Ref<Object> item = maker_.value(value);
    if (!item) throw Fault{maker_.objects_.file(), value.place, "null in a list", "an object"};
    list->axSafelyAddObject(std::move(item));
  }
  return list;
}

Ref<Object> ValueMaker::Visitor::operator()(const SceneInterval& given) const {
  const Ref<Date> start = makeDate(given.start);
  const Ref<Date> end = makeDate(given.end);
  if (end->timeIntervalSinceDate(*start) >= 0) return make<DateInterval>(start, end);
  throw Fault{maker_.objects_.file(), place_, "an interval that ends before it starts",
              "the earlier date first"};
}

Ref<Object> ValueMaker::value(const SceneValue& given) const {
  return std::visit(Visitor(*this, given.place), given.content);
}

std::vector<Ref<Object>> ValueMaker::values(const std::vector<SceneValue>& given) const {
  std::vector<Ref<Object>> made;
  made.reserve(given.size());
  for (const SceneValue& one : given) made.push_back(value(one));
  return made;
}

}  // namespace ax::reader
