#include "reader/scene/ObjectReader.h"

#include "platform/runtime/Signature.h"
#include "platform/toolkit/View.h"
#include "reader/scene/HostNames.h"
#include "reader/scene/ValueReader.h"

namespace ax::reader {

namespace {

const Class& readClass(const JsonNode& node) {
  const Class* found = Class::namedEvenIfHidden(node.text());
  if (found == nullptr)
    node.fail("unknown class \"" + node.text() + "\"", "a class of the host or the platform");
  return *found;
}

// `owner` must be of one of the classes that hold such children, and every child of the child's class.
std::vector<SceneObject> readChildren(const JsonNode& list, const Class& owner, bool mayHold,
                                      const Class& childClass, SceneIds& ids) {
  if (!mayHold) list.fail("an object of class " + owner.name() + " holds none", "no such key");
  list.expectArray("a list of objects");
  std::vector<SceneObject> children;
  list.forEachItem([&](const JsonNode& item) {
    if (!readClass(item.field("class")).isSubclassOf(childClass)) {
      item.field("class").failKind("a class below " + childClass.name());
    }
    children.push_back(readObject(item, ids));
  });
  return children;
}

SceneReply readReply(const JsonNode& node, SceneIds& ids) {
  if (!node.isObject() || !node.has("raises")) return {readValue(node, ids)};
  node.expectKeys({"raises"});
  return {{node.place()}, node.field("raises").text()};
}

void checkFirstArgument(const JsonNode& node, const Class& declaring, Selector selector) {
  const Method& method = declaring.lookUp(selector);
  if (method.function == nullptr) return;  // taken away
  const auto& codes = method.signature->encodings;
  const bool counts = codes.size() > 1 && std::string_view("qQiI").find(codes[1]) != std::string_view::npos;
  if (!counts) node.fail("\"indexed\"", "a method whose first argument is a whole number");
}

SceneAnswer readAnswer(const JsonNode& node, const std::string& method, const Class& declaring,
                       SceneIds& ids) {
  const Selector selector = Selector::find(method);
  if (!answersMethod(declaring, selector)) {
    node.fail("unknown method \"" + method + "\"", "a method of class " + declaring.name());
  }
  SceneAnswer answer{node.place(), selector, {}};
  answer.isIndexed = node.isObject() && node.has("indexed");
  if (!answer.isIndexed) {
    answer.replies.push_back(readReply(node, ids));
    return answer;
  }
  node.expectKeys({"indexed"});
  checkFirstArgument(node.field("indexed"), declaring, selector);
  node.field("indexed").expectArray("a list of replies");
  node.field("indexed").forEachItem(
      [&](const JsonNode& item) { answer.replies.push_back(readReply(item, ids)); });
  return answer;
}

std::vector<SceneAnswer> readAnswers(const JsonNode& node, const Class& declaring, SceneIds& ids) {
  if (!node.isObject()) node.failKind("an object: replies by method");
  std::vector<SceneAnswer> answers;
  node.forEachField([&](const std::string& method, const JsonNode& reply) {
    answers.push_back(readAnswer(reply, method, declaring, ids));
  });
  return answers;
}

}  // namespace

std::vector<SceneMember> readMembers(const JsonNode& node, const Class* declaring, SceneIds& ids) {
  if (!node.isObject()) node.failKind("an object: values by member");
  std::vector<SceneMember> members;
  node.forEachField([&](const std::string& key, const JsonNode& value) {
    if (declaring != nullptr && !hasSettableMember(*declaring, key)) {
      value.fail("unknown member \"" + key + "\"", "an instance variable of class " + declaring->name() +
                                                       ", or what its " + setterName(key) + " sets");
    }
    members.push_back({key, readValue(value, ids)});
  });
  return members;
}

SceneObject readObject(const JsonNode& node, SceneIds& ids) {
  node.expectKeys({"class", "id", "set", "answers", "subviews", "sublayers"});
  const Class& made = readClass(node.field("class"));
  SceneObject object{node.place(), made.name()};
  if (const auto id = node.optionalField("id")) {
    ids.declare(*id, &made);
    object.id = id->text();
  }
  const bool isView = made.isSubclassOf(View::staticClass());
  const bool isLayer = made.isSubclassOf(Layer::staticClass());
  if (const auto list = node.optionalField("subviews")) {
    object.subviews = readChildren(*list, made, isView, View::staticClass(), ids);
  }
  if (const auto list = node.optionalField("sublayers")) {
    object.sublayers = readChildren(*list, made, isView || isLayer, Layer::staticClass(), ids);
  }
  if (const auto answers = node.optionalField("answers")) object.answers = readAnswers(*answers, made, ids);
  if (const auto members = node.optionalField("set")) object.set = readMembers(*members, &made, ids);
  return object;
}

}  // namespace ax::reader
