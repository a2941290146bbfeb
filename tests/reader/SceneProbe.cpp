#include "tests/reader/SceneProbe.h"

#include <stdexcept>

#include "platform/runtime/ClassBuilder.h"

namespace ax::reader {

Class& SceneProbe::staticClass() {
  using T = SceneProbe;
  static Class& result = ClassBuilder<T>("Tests.SceneProbe", View::staticClass())
                             .instanceVariable<&T::flag_>("_flag")
                             .instanceVariable<&T::small_>("_small")
                             .instanceVariable<&T::large_>("_large")
                             .instanceVariable<&T::fraction_>("_fraction")
                             .instanceVariable<&T::place_>("_place")
                             .instanceVariable<&T::partner_>("_partner")
                             .instanceVariable<&T::styled_>("_styled")
                             .instanceVariable<&T::anything_>("_anything")
                             .instanceVariable<&T::weakly_>("_weakly")
                             .property<&T::note, &T::setNote>("note")
                             .method<&T::log>("log")
                             .method<&T::valueAt>("valueAt:for:")
                             .method<&T::isReady>("isReady")
                             .method<&T::fail>("fail")
                             .method<&T::loadAccessibility>("_accessibilityLoadAccessibilityInformation")
                             .conformsTo("Probing")
                             .build();
  return result;
}

void SceneProbe::setNote(Ref<String> note) {
  if (note && note->isEmpty()) throw std::invalid_argument("an empty note");
  note_ = std::move(note);
}

static const RegisteredClass<SceneProbe> registered;

std::string sceneText(std::string_view members) {
  std::string text = R"({"format": "axvelto-scene/1")";
  if (!members.empty()) text.append(", ").append(members);
  return text + "}";
}

Fault faultOf(const std::string& text) {
  try {
    const Scene scene = readScene(text, "test.json");
    SceneRun(scene).runSteps();
    return {};
  } catch (const Fault& fault) {
    return fault;
  }
}

}  // namespace ax::reader
