#include "reader/scene/ValueKind.h"

#include <array>
#include <limits>

#include "platform/runtime/Boxing.h"
#include "platform/runtime/Number.h"
#include "platform/runtime/Value.h"

namespace ax::reader {

namespace {

bool isBoolean(const Ref<Object>& value) {
  const Number* number = cast<Number>(value.get());
  return number != nullptr && std::holds_alternative<bool>(number->content());
}

bool isNumber(const Ref<Object>& value) {
  return cast<Number>(value.get()) != nullptr && !isBoolean(value);
}

template <class Integer>
bool isInteger(const Ref<Object>& value) {
  const Number* number = cast<Number>(value.get());
  return number != nullptr && std::visit(
                                  [](auto content) {
                                    if constexpr (std::is_integral_v<decltype(content)> &&
                                                  !std::is_same_v<decltype(content), bool>) {
                                      return std::in_range<Integer>(content);
                                    } else {
                                      return false;
                                    }
                                  },
                                  number->content());
}

template <class Content>
bool holds(const Ref<Object>& value) {
  const Value* held = cast<Value>(value.get());
  return held != nullptr && std::holds_alternative<Content>(held->content());
}

bool isSelector(const Ref<Object>& value) {
  return !value || holds<Selector>(value);
}
bool isNil(const Ref<Object>& value) {
  return !value;
}

struct Kind {
  std::string_view code;
  bool (*isOne)(const Ref<Object>&);
  const char* inWords;
};
constexpr std::array kinds = {
    Kind{encodingOf<bool>(), isBoolean, "true or false"},
    Kind{encodingOf<std::int64_t>(), isInteger<std::int64_t>, "a whole number"},
    Kind{encodingOf<std::uint64_t>(), isInteger<std::uint64_t>, "a whole number that is not negative"},
    Kind{encodingOf<std::int32_t>(), isInteger<std::int32_t>, "a whole number of 32 bits"},
    Kind{encodingOf<std::uint32_t>(), isInteger<std::uint32_t>,
         "a whole number of 32 bits that is not negative"},
    Kind{encodingOf<double>(), isNumber, "a number"},
    Kind{encodingOf<float>(), isNumber, "a number"},
    Kind{encodingOf<Selector>(), isSelector, "a selector"},
    Kind{encodingOf<Point>(), holds<Point>, "a point"},
    Kind{encodingOf<Size>(), holds<Size>, "a size"},
    Kind{encodingOf<Rect>(), holds<Rect>, "a rect"},
    Kind{encodingOf<Insets>(), holds<Insets>, "insets"},
    Kind{"@?", isNil, "null"},
    Kind{"v", isNil, "null"},
};

}  // namespace

bool fits(const Ref<Object>& value, std::string_view code) {
  for (const Kind& kind : kinds) {
    if (kind.code == code) return kind.isOne(value);
  }
  return true;
}

std::string kindInWords(std::string_view code) {
  for (const Kind& kind : kinds) {
    if (kind.code == code) return kind.inWords;
  }
  return "an object of another class";
}

}  // namespace ax::reader
