#include "tests/bundle/shared/FurnishedScreens.h"

#include <algorithm>
#include <array>

#include "host/charts/ActivityMoveAndExerciseChartView.h"
#include "host/charts/ActivityStandChartView.h"
#include "host/charts/DayViewTitleAndValueLabelPair.h"
#include "platform/accessibility/CategoryRegistration.h"
#include "platform/accessibility/ValidationManager.h"
#include "platform/runtime/Number.h"
#include "platform/toolkit/Control.h"
#include "platform/toolkit/DataSeriesMessages.h"
#include "platform/toolkit/ElementTree.h"
#include "platform/toolkit/TableViewCell.h"
#include "platform/toolkit/ViewController.h"

namespace ax {

namespace {

Ref<Label> captioned() {
  const Ref<Label> label = make<Label>();
  label->setText(string("5'30\""));
  return label;
}

// Where a chart draws a week's columns.
Ref<Array> columns() {
  Array::Items items;
  for (int i = 0; i < 7; ++i) items.push_back(number(50.0 * i));
  return array(std::move(items));
}

// The first that a setter takes is given to it.
std::vector<Ref<Object>> parts() {
  return {captioned(),
          make<Button>(),
          make<host::DayViewTitleAndValueLabelPair>(),
          make<host::ActivityMoveAndExerciseChartView>(),
          make<host::ActivityStandChartView>(),
          make<View>(),
          columns()};
}

bool belongsToTheToolkit(const Class* c) {
  return c == &View::staticClass() || c == &Layer::staticClass() || c == &Label::staticClass() ||
         c == &Control::staticClass() || c == &ViewController::staticClass() || c == &Object::staticClass();
}

void furnishVariables(Object& object, const Class& declaring) {
  declaring.forEachOwnInstanceVariable([&](const InstanceVariable& variable) {
    const Class* kind = Class::named(variable.type());
    if (kind == nullptr || !kind->isSubclassOf(Responder::staticClass()) || variable.read(object)) return;
    const Ref<Object> part = kind->instantiate();
    if (Label* label = cast<Label>(part.get())) label->setText(string("--"));
    if (variable.write(object, part)) furnish(*part);
  });
}

void furnishProperties(Object& object, const Class& declaring) {
  std::vector<const Method*> setters;
  declaring.forEachOwnMethod([&](const Method& method) {
    const std::string_view name = method.selector.name();
    const bool isSetter = name.starts_with("set") && std::count(name.begin(), name.end(), ':') == 1;
    if (isSetter && method.signature->encodings[1] == "@" && method.takes != nullptr)
      setters.push_back(&method);
  });
  for (const Method* setter : setters) {
    for (const Ref<Object>& part : parts()) {
      if (!setter->takes(std::array{part})) continue;
      furnish(*part);
      setter->signature->invoke(object, *setter, std::array{part});
      break;
    }
  }
}

void addVariables(Object& object, std::vector<Ref<Object>>& next) {
  for (const Class* c = &object.isa(); c != nullptr; c = c->superclass()) {
    c->forEachOwnInstanceVariable([&](const InstanceVariable& variable) {
      const Ref<Object> value = variable.read(object);
      if (cast<Responder>(value.get()) != nullptr) next.push_back(value);
    });
  }
}

}  // namespace

std::vector<Class*> extendedClasses() {
  std::vector<Class*> classes;
  for (const InstallationRequest& request : ValidationManager::sharedInstance()->installationRequests()) {
    Class* category = Class::named(request.category);
    Class* target = category == nullptr ? nullptr : Class::named(categoryTargetClassName(*category));
    if (target != nullptr && cast<Responder>(target->instantiate().get()) != nullptr)
      classes.push_back(target);
  }
  return classes;
}

void furnish(Object& object) {
  if (View* view = cast<View>(&object)) view->setFrame({0, 0, 350, 120});
  for (const Class* c = &object.isa(); !belongsToTheToolkit(c); c = c->superclass()) {
    furnishVariables(object, *c);
    furnishProperties(object, *c);
  }
}

void show(Object& object) {
  if (cast<ViewController>(&object) != nullptr) {
    messages::loadView(object);
    messages::viewDidLoad(object);
  }
  messages::layoutSubviews(object);
}

void askEverything(Object& object, ObjectSet& seen) {
  namespace m = messages;
  const auto keep = [&](Ref<Object> answer) {
    if (answer) seen.emplace(answer.get(), answer);
  };
  m::isAccessibilityElement(object);
  m::accessibilityTraits(object);
  m::accessibilityFrame(object);
  m::accessibilityActivationPoint(object);
  m::accessibilityViewIsModal(object);
  m::_accessibilityExpandedStatus(object);
  for (const auto* text : {&m::accessibilityLabel, &m::accessibilityValue, &m::accessibilityHint,
                           &m::_accessibilityDataSeriesName})
    keep((*text)(object));
  for (const std::int64_t axis : {0, 1, 2}) {
    keep(m::_accessibilityDataSeriesValuesForAxis(object, axis));
    keep(m::_accessibilityDataSeriesTitleForAxis(object, axis));
    keep(m::_accessibilityDataSeriesUnitLabelForAxis(object, axis));
    keep(m::_accessibilityDataSeriesMinimumValueForAxis(object, axis));
    keep(m::_accessibilityDataSeriesMaximumValueForAxis(object, axis));
    keep(m::_accessibilityDataSeriesValueDescriptionForPositionAxis(object, 0.5, axis));
  }
  keep(m::_accessibilityQuantityForSliceAtIndex(object, 3));
  keep(m::_accessibilityHitTest(object, {20, 20}, nullptr));
  keep(m::accessibilityElements(object));
}

ObjectSet everythingIn(Object& object) {
  ObjectSet all;
  std::vector<Ref<Object>> next = {Ref<Object>(&object)};
  while (!next.empty()) {
    const Ref<Object> one = next.back();
    next.pop_back();
    if (!all.emplace(one.get(), one).second) continue;
    for (const Ref<Object>& child : drawnChildren(*one)) next.push_back(child);
    if (const Ref<Array> elements = messages::accessibilityElements(one))
      next.insert(next.end(), elements->begin(), elements->end());
    if (ViewController* controller = cast<ViewController>(one.get())) next.push_back(controller->view());
    addVariables(*one, next);
  }
  return all;
}

std::vector<const Method*> hostMethods(const Class& start) {
  std::vector<const Method*> methods;
  for (const Class* c = &start; !belongsToTheToolkit(c); c = c->superclass()) {
    c->forEachOwnMethod([&](const Method& method) {
      if (method.graft == nullptr) methods.push_back(&method);
    });
  }
  return methods;
}

}  // namespace ax
