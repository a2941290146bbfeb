#include "reader/scene/ObjectBuilder.h"

#include <stdexcept>

#include "platform/runtime/Number.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "platform/runtime/Signature.h"
#include "platform/runtime/Weak.h"
#include "platform/toolkit/View.h"
#include "reader/scene/MemberWriter.h"
#include "reader/scene/Raised.h"
#include "reader/scene/ValueKind.h"

namespace ax::reader {

namespace {

// A reply as the object keeps it: referred objects weakly, or an object that answers with its owner would
// never end.
struct ReadyReply {
  Ref<Object> value = nullptr;
  Weak<Object> referred = nullptr;
  std::optional<std::string> raises = std::nullopt;

  Ref<Object> give() const {
    if (raises) throw std::runtime_error(*raises);
    return value ? value : referred.lock();
  }
};

const ReadyReply& choose(const std::vector<ReadyReply>& replies, std::span<const Ref<Object>> arguments) {
  const std::int64_t index = arguments.empty() ? -1 : unboxInt(arguments[0]);
  if (index >= 0 && static_cast<std::size_t>(index) < replies.size()) return replies[index];
  throw std::out_of_range("no reply for " + std::to_string(index));
}

}  // namespace

ObjectBuilder::ObjectBuilder(const std::string& file)
    : table_(file), maker_(table_, [this](const SceneObject& object) { return build(object); }) {}

ObjectBuilder::~ObjectBuilder() {
  for (const auto& [scene, object] : allocated_) removeScriptedAnswers(*object);
  for (const auto& [object, key] : linked_) {
    const Ref<Object> holder = object.lock();
    if (!holder) continue;
    try {
      writeMember(*holder, key, nullptr, "", table_.file());
    } catch (...) {
      continue;  // a member that cannot be empty
    }
  }
}

void ObjectBuilder::allocate(const SceneObject& object) {
  const Class* made = Class::namedEvenIfHidden(object.className);
  Ref<Object> instance = made == nullptr ? nullptr : made->instantiate();
  if (!instance) {
    throw Fault{table_.file(), object.place + "/class", "\"" + object.className + "\"",
                "a class whose objects can be made"};
  }
  if (!object.id.empty()) table_.addId(object.id, instance);
  table_.keep(instance);
  allocated_[&object] = std::move(instance);
  for (const SceneObject& child : object.subviews) allocate(child);
  for (const SceneObject& child : object.sublayers) allocate(child);
  for (const SceneAnswer& answer : object.answers) {
    for (const SceneReply& reply : answer.replies) allocateIn(reply.value);
  }
  for (const SceneMember& member : object.set) allocateIn(member.value);
}

void ObjectBuilder::allocateIn(const SceneValue& value) {
  if (const auto* object = std::get_if<std::unique_ptr<SceneObject>>(&value.content)) allocate(**object);
  if (const auto* list = std::get_if<std::vector<SceneValue>>(&value.content)) {
    for (const SceneValue& item : *list) allocateIn(item);
  }
}

Ref<Object> ObjectBuilder::build(const SceneObject& object) {
  if (!allocated_.contains(&object)) allocate(object);
  Ref<Object> made = allocated_.at(&object);
  addChildren(object, made);
  for (const SceneAnswer& answer : object.answers) addAnswer(answer, *made);
  for (const SceneMember& member : object.set) fillMember(member, *made);
  return made;
}

void ObjectBuilder::addChildren(const SceneObject& object, const Ref<Object>& made) {
  const Ref<View> view = cast<View>(made);
  for (const SceneObject& child : object.subviews) {
    const Ref<View> subview = cast<View>(build(child));
    if (view) view->addSubview(subview);
  }
  if (object.sublayers.empty()) return;
  const Ref<Layer> layer = view ? view->layer() : cast<Layer>(made);
  for (const SceneObject& child : object.sublayers) {
    const Ref<Layer> sublayer = cast<Layer>(build(child));
    if (layer) layer->addSublayer(sublayer);
  }
}

void ObjectBuilder::addAnswer(const SceneAnswer& answer, Object& made) {
  const Method& method = made.isa().lookUp(answer.selector);
  std::vector<ReadyReply> replies;
  for (const SceneReply& reply : answer.replies) {
    const bool isReference = std::holds_alternative<SceneReference>(reply.value.content);
    Ref<Object> answered = value(reply.value);
    if (!reply.raises && method.function != nullptr && !fits(answered, method.signature->encodings[0])) {
      throw Fault{table_.file(), reply.value.place,
                  "a reply of another kind for " + std::string(answer.selector.name()),
                  kindInWords(method.signature->encodings[0])};
    }
    replies.push_back({isReference ? nullptr : answered, isReference ? answered : nullptr, reply.raises});
  }
  // A method that was taken away is not missed.
  setScriptedAnswer(
      made, answer.selector,
      [replies = std::move(replies), isIndexed = answer.isIndexed](std::span<const Ref<Object>> arguments) {
        return (isIndexed ? choose(replies, arguments) : replies.front()).give();
      });
}

// A value that the host refuses is no value for the member.
void ObjectBuilder::fillMember(const SceneMember& member, Object& made) {
  const auto raised = raisedBy([&] { setMember(member, made); });
  if (!raised) return;
  throw Fault{table_.file(), member.value.place, "the host raised \"" + *raised + "\"",
              "a value that it takes"};
}

void ObjectBuilder::setMember(const SceneMember& member, Object& made) {
  const std::string& place = member.value.place;
  const Ref<Object> given = value(member.value);
  if (member.key == "frame") placed_.insert(&made);
  if (given && !isNumber(*given) && !cast<String>(given.get())) linked_.emplace_back(made, member.key);
  writeMember(made, member.key, given, place, table_.file());
}

Ref<Object> ObjectBuilder::value(const SceneValue& given) {
  return maker_.value(given);
}

std::vector<Ref<Object>> ObjectBuilder::values(const std::vector<SceneValue>& given) {
  return maker_.values(given);
}

}  // namespace ax::reader
