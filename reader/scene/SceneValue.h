#pragma once

#include <memory>
#include <optional>
#include <string>
#include <variant>
#include <vector>

#include "platform/runtime/Geometry.h"
#include "platform/runtime/Number.h"
#include "platform/runtime/Selector.h"

namespace ax::reader {

struct SceneObject;
struct SceneValue;

// A text of a scene: literal, or a key of the host's string table with what fills its pattern.
struct SceneText {
  explicit SceneText(std::string literal);
  SceneText(std::string key, std::vector<SceneValue> fillings);
  SceneText(SceneText&&) noexcept;
  SceneText& operator=(SceneText&&) noexcept;
  ~SceneText();

  std::string text;  // or the key
  bool isLocalized;
  std::vector<SceneValue> with;
};

// What a VALUE may be, besides the plain kinds. Dates stay text until they are made: local times count in the
// zone of that moment.
struct SceneReference {
  std::string target;
};
struct SceneDate {
  std::string iso;
};
struct SceneInterval {
  SceneDate start, end;
};
struct SceneQuantity {
  double value;
  std::string unit;
};
struct SceneUnit {
  std::string unit;
};
struct SceneString {
  SceneText text;
  std::optional<SceneText> label = {};  // the spoken form
  bool isAttributed = false;            // the host's styled kind of text
};

using SceneContent = std::variant<std::nullptr_t, Number::Content, SceneString, std::vector<SceneValue>,
                                  std::unique_ptr<SceneObject>, SceneReference, SceneDate, SceneInterval,
                                  Point, Size, Rect, Insets, SceneQuantity, SceneUnit, Selector>;

// One VALUE of a scene, read and checked but not made yet.
struct SceneValue {
  std::string place;  // its JSON pointer
  SceneContent content = nullptr;
};

struct SceneMember {
  std::string key;
  SceneValue value;
};

// A scripted reply: the one value, or one of several by the first argument.
struct SceneReply {
  SceneValue value;
  std::optional<std::string> raises = {};
};
struct SceneAnswer {
  std::string place;
  Selector selector;
  std::vector<SceneReply> replies;
  bool isIndexed = false;
};

// One OBJECT of a scene: what it is made of, in the order in which that is done.
struct SceneObject {
  std::string place;
  std::string className;
  std::string id = {};  // empty: none
  std::vector<SceneObject> subviews = {};
  std::vector<SceneObject> sublayers = {};
  std::vector<SceneAnswer> answers = {};
  std::vector<SceneMember> set = {};
};

// Down here, where what the vector holds is known.
inline SceneText::SceneText(std::string literal) : text(std::move(literal)), isLocalized(false) {}
inline SceneText::SceneText(std::string key, std::vector<SceneValue> fillings)
    : text(std::move(key)), isLocalized(true), with(std::move(fillings)) {}
inline SceneText::SceneText(SceneText&&) noexcept = default;
inline SceneText& SceneText::operator=(SceneText&&) noexcept = default;
inline SceneText::~SceneText() = default;

}  // namespace ax::reader
