#include "reader/scene/StepReader.h"

#include <array>

#include "reader/scene/EnvironmentReader.h"
#include "reader/scene/ExportedFunctions.h"
#include "reader/scene/ObjectReader.h"
#include "reader/scene/ValueReader.h"

namespace ax::reader {

namespace {

using Action = decltype(SceneStep::action);

SceneTarget readTarget(const JsonNode& node, SceneIds& ids) {
  ids.refer(node);
  return {node.place(), node.text()};
}

std::vector<SceneValue> readArguments(const JsonNode& node, SceneIds& ids) {
  const auto with = node.optionalField("with");
  return with ? readValues(*with, ids) : std::vector<SceneValue>();
}

std::string readName(const JsonNode& node, const std::string& expected) {
  if (node.text().empty()) node.failKind(expected);
  return node.text();
}

Action readAsk(const JsonNode& node, SceneIds& ids) {
  node.expectKeys({"ask", "of", "with", "as", "expect"});
  return AskStep{readName(node.field("ask"), "the name of a method"), readTarget(node.field("of"), ids),
                 readArguments(node, ids)};
}

Action readSend(const JsonNode& node, SceneIds& ids) {
  node.expectKeys({"send", "of", "with", "as", "expect"});
  return AskStep{readName(node.field("send"), "the name of a method"), readTarget(node.field("of"), ids),
                 readArguments(node, ids), true};
}

Action readRead(const JsonNode& node, SceneIds& ids) {
  node.expectKeys({"read", "of", "as", "expect"});
  return ReadStep{readName(node.field("read"), "the name of a member"), readTarget(node.field("of"), ids)};
}

Action readSet(const JsonNode& node, SceneIds& ids) {
  node.expectKeys({"set", "on", "as", "expect"});
  const SceneTarget target = readTarget(node.field("on"), ids);
  return SetStep{readMembers(node.field("set"), ids.classOf(target.text), ids), target};
}

Action readChange(const JsonNode& node, SceneIds&) {
  node.expectKeys({"environment", "as", "expect"});
  return readEnvironment(node.field("environment"));
}

Action readCall(const JsonNode& node, SceneIds& ids) {
  node.expectKeys({"call", "with", "as", "expect"});
  const JsonNode name = node.field("call");
  const ExportedFunction* function = exportedFunction(name.text());
  if (function == nullptr) name.fail("unknown function \"" + name.text() + "\"", "one of " + exportedNames());
  std::vector<SceneValue> arguments = readArguments(node, ids);
  if (arguments.size() + 1 != function->encodings.size()) {
    node.fail(std::to_string(arguments.size()) + " values for " + name.text(),
              std::to_string(function->encodings.size() - 1) + " under \"with\"");
  }
  return CallStep{name.text(), std::move(arguments)};
}

Action readSame(const JsonNode& node, SceneIds& ids) {
  node.expectKeys({"same", "as", "expect"});
  const JsonNode both = node.field("same");
  both.expectCount(2, "two targets");
  return SameStep{readTarget(both.item(0), ids), readTarget(both.item(1), ids)};
}

struct Form {
  const char* key;
  Action (*read)(const JsonNode&, SceneIds&);
};
constexpr std::array forms = {Form{"ask", readAsk},           Form{"send", readSend}, Form{"read", readRead},
                              Form{"set", readSet},           Form{"call", readCall}, Form{"same", readSame},
                              Form{"environment", readChange}};

Action readAction(const JsonNode& node, SceneIds& ids) {
  if (!node.isObject()) node.failKind("a step");
  for (const Form& form : forms) {
    if (node.has(form.key)) return form.read(node, ids);
  }
  node.fail("a step of no known kind", "one of ask, send, read, set, call, same, environment");
}

}  // namespace

SceneStep readStep(const JsonNode& node, SceneIds& ids) {
  SceneStep step{node.place(), "", readAction(node, ids)};
  if (const auto name = node.optionalField("as")) {
    ids.declare(*name, nullptr);
    step.name = name->text();
  }
  if (const auto expect = node.optionalField("expect")) step.expect = expect->json();
  return step;
}

}  // namespace ax::reader
