#include "tests/proof/Interview.h"

#include <algorithm>
#include <array>
#include <deque>
#include <memory>
#include <unordered_set>

#include "platform/accessibility/ValidationManager.h"
#include "platform/foundation/AttributedString.h"
#include "platform/runtime/Boxing.h"
#include "platform/runtime/Grafting.h"
#include "platform/runtime/Number.h"
#include "platform/toolkit/ElementTree.h"
#include "platform/toolkit/ViewController.h"
#include "reader/snapshot/Snapshot.h"
#include "reader/transcript/Transcript.h"
#include "tests/proof/MemberFaults.h"

namespace ax::proof {

namespace {

using Json = nlohmann::ordered_json;

constexpr std::size_t mostObjects = 1500;
constexpr std::size_t mostElements = 40;  // of one list

// Whatever a category answers, for instances and for classes alike, each once.
const std::vector<const Method*>& overrides() {
  static const std::vector<const Method*> all = [] {
    std::map<std::string_view, const Method*> byName;
    for (const InstallationRequest& request : ValidationManager::sharedInstance()->installationRequests()) {
      const Class* category = Class::named(request.category);
      if (category == nullptr) continue;
      for (const Class* table : {category, &category->metaclass()})
        table->forEachOwnMethod([&](const Method& method) { byName[method.selector.name()] = &method; });
    }
    std::erase_if(byName, [](const auto& entry) {
      return entry.first.starts_with("safeCategory") || entry.first == "_accessibilityPerformValidations:";
    });
    std::vector<const Method*> methods;
    for (const auto& [name, method] : byName) methods.push_back(method);
    return methods;
  }();
  return all;
}

// Whether what it does shows in what others answer later.
bool isHook(const Method& method) {
  const std::string_view name = method.selector.name();
  return method.signature->encodings[0] == "v" || name == "accessibilityActivate";
}

Ref<Object> argument(std::string_view code, std::size_t round, bool last, Object& receiver) {
  if (code == "@") return last ? nullptr : Ref<Object>(&receiver);  // nil last: what keeps itself leaks
  if (code == "B") return number(round == 0);
  if (code == "d" || code == "f") return number(0.5 * static_cast<double>(round));
  if (code == encodingOf<Point>()) return box(Point{20, 20});
  return number(static_cast<std::int64_t>(round));
}

std::string described(const Ref<Object>& answer) {
  if (!answer) return "nil";
  if (const Array* list = cast<Array>(answer.get())) {
    std::string text = std::to_string(list->count()) + " items:";
    for (std::size_t i = 0; i < std::min(list->count(), mostElements); ++i)
      text += " " + described(list->at(i));
    return text;
  }
  return answer->description();
}

class Asking {
 public:
  Asking(Object& object, Interview& into) : object_(object), into_(into) {}

  void each(bool hooks, std::size_t most, std::string& text) {
    for (const Method* override : overrides()) {
      const Method& method = object_.isa().lookUp(override->selector);
      if (method.signature != override->signature || isHook(method) != hooks) continue;
      const std::size_t rounds = method.signature->encodings.size() > 1 ? most : 1;
      for (std::size_t round = 0; round < rounds; ++round) {
        const std::string answer = ask(method, round, round + 1 == rounds);
        text.append(method.selector.name()).append(": ").append(answer).append("\n");
      }
    }
  }

 private:
  std::string ask(const Method& method, std::size_t round, bool last) {
    std::vector<Ref<Object>> arguments;
    for (std::size_t i = 1; i < method.signature->encodings.size(); ++i)
      arguments.push_back(argument(method.signature->encodings[i], round, last, object_));
    ++into_.questions;
    try {
      return described(method.signature->invoke(object_, method, arguments));
    } catch (const MemberRaised& raised) {
      if (!mayRaise(method, arguments)) fault(method, raised.selector.name());
    } catch (const std::exception& error) {
      fault(method, error.what());
    } catch (...) {
      fault(method, "something without a reason");
    }
    return "raised";
  }

  // What is no override may, and an override passes on what the method raises that it replaced.
  bool mayRaise(const Method& method, const std::vector<Ref<Object>>& arguments) {
    if (method.graft == nullptr) return true;
    const Method& replaced = superMethod(method, method.selector);
    if (replaced.signature != method.signature) return false;
    try {
      replaced.signature->invoke(object_, replaced, arguments);
      return false;
    } catch (const MemberRaised&) {
      return true;
    }
  }

  void fault(const Method& method, std::string_view what) {
    into_.faults.push_back(object_.isa().name() + " " + std::string(method.selector.name()) + " raised " +
                           std::string(what));
  }

  Object& object_;
  Interview& into_;
};

// Breadth first: what the toolkit and the host hold comes before what is only listed.
class Finding {
 public:
  void add(std::string place, const Ref<Object>& object) {
    if (!object || found_.size() >= mostObjects || !met_.insert(object.get()).second) return;
    found_.push_back({std::move(place), object});
  }

  void follow() {
    for (; next_ < found_.size(); ++next_) {
      const PlacedObject at = found_[next_];
      const std::vector<Ref<Object>> drawn = drawnChildren(*at.object);
      for (std::size_t i = 0; i < drawn.size(); ++i) add(at.place + "/" + std::to_string(i), drawn[i]);
      if (ViewController* controller = cast<ViewController>(at.object.get()))
        add(at.place + "/view", controller->view());
      addVariables(at);
    }
  }

  const std::deque<PlacedObject>& found() const { return found_; }

 private:
  void addVariables(const PlacedObject& at) {
    for (const Class* c = &at.object->isa(); c != nullptr; c = c->superclass()) {
      c->forEachOwnInstanceVariable([&](const InstanceVariable& variable) {
        const Ref<Object> value = variable.read(*at.object);
        if (cast<Responder>(value.get()) != nullptr)
          add(at.place + "/" + std::string(variable.selector.name()), value);
      });
    }
  }

  std::deque<PlacedObject> found_;
  std::unordered_set<const Object*> met_;
  std::size_t next_ = 0;
};

void addTo(std::set<std::size_t>& all, const std::set<std::size_t>& more) {
  all.insert(more.begin(), more.end());
}

// Elements that the module has made are what their list says, so they depend on all that the list took.
void askElements(const PlacedObject& at, std::unordered_set<const Object*>& met, Interview& into,
                 std::size_t level) {
  Ref<Array> elements;
  try {
    elements = messages::accessibilityElements(at.object);
  } catch (...) {
    return;
  }
  if (!elements || level > 4) return;
  const std::set<std::size_t> ofList = into.objects[at.place].touched;
  for (std::size_t i = 0; i < std::min(elements->count(), mostElements); ++i) {
    const PlacedObject element{at.place + "#" + std::to_string(i), elements->at(i)};
    if (!met.insert(element.object.get()).second) continue;
    takeTouched();
    ObjectAnswers answers{askEverything(*element.object, into), takeTouched()};
    addTo(answers.touched, ofList);
    into.objects[element.place] = std::move(answers);
    askElements(element, met, into, level + 1);
  }
}

void keepHostFaults(const reader::SceneRun& run, Interview& into) {
  static const std::string expected = MemberRaised(Selector()).what();
  for (const std::string& fault : run.hostFaults()) {
    if (!fault.ends_with(expected)) into.faults.push_back("presenting: " + fault);
  }
}

}  // namespace

std::set<std::size_t> Interview::touched() const {
  std::set<std::size_t> all = whilePresented;
  addTo(all, whileRead);
  addTo(all, byHooks);
  for (const auto& [place, answers] : objects) addTo(all, answers.touched);
  return all;
}

Json jsonOf(const Interview& interview) {
  Json objects = Json::object();
  for (const auto& [place, answers] : interview.objects) objects[place] = {answers.text, answers.touched};
  return {{"objects", objects},
          {"transcript", interview.transcript},
          {"whilePresented", interview.whilePresented},
          {"whileRead", interview.whileRead},
          {"byHooks", interview.byHooks},
          {"questions", interview.questions},
          {"faults", interview.faults}};
}

Interview interviewOf(const Json& json) {
  Interview interview{{},
                      json["transcript"],
                      json["whilePresented"],
                      json["whileRead"],
                      json["byHooks"],
                      json["questions"],
                      json["faults"]};
  for (const auto& [place, answers] : json["objects"].items())
    interview.objects[place] = {answers[0], answers[1]};
  return interview;
}

std::deque<PlacedObject> objectsHeldBy(const reader::SceneRun& run) {
  const WithoutFaults asTheyAre;
  Finding finding;
  finding.add("", run.screen());
  for (std::size_t i = 0; i < run.objects().size(); ++i)
    finding.add("/objects/" + std::to_string(i), run.objects()[i]);
  for (const InstallationRequest& request : ValidationManager::sharedInstance()->installationRequests()) {
    const Class* category = Class::named(request.category);
    const CategoryGraft* graft = category == nullptr ? nullptr : graftOf(*category);
    if (graft != nullptr &&
        std::ranges::any_of(graft->methods, [](auto* m) { return m->owner->isMetaclass(); }))
      finding.add("/" + graft->target->name(), Ref<Object>(const_cast<Class*>(graft->target)));
  }
  finding.follow();
  return finding.found();
}

std::string askEverything(Object& object, Interview& into) {
  std::string text = object.isa().name() + "\n";
  Asking(object, into).each(false, 3, text);
  return text;
}

void sendHooks(Object& object, Interview& into, std::size_t rounds) {
  std::string ignored;
  Asking(object, into).each(true, rounds, ignored);
}

namespace {

// Null where the host refuses what the scene sets.
std::unique_ptr<reader::SceneRun> presented(const reader::Scene& scene, const std::string& module,
                                            Interview& into) {
  try {
    return std::make_unique<reader::SceneRun>(scene, reader::SceneRunOptions{.modulePath = module});
  } catch (const MemberRaised&) {
    return nullptr;
  } catch (const reader::Fault& fault) {
    const bool hasRaised = fault.what.find(MemberRaised(Selector()).what()) != std::string::npos;
    if (!hasRaised) into.refusal = fault.text();
    return nullptr;
  }
}

std::vector<std::string> read(const reader::SceneRun& run, Interview& into) {
  try {
    return reader::transcript(reader::takeSnapshot(run.screen()), run.title());
  } catch (const MemberRaised& raised) {
    into.faults.push_back("reading it raised " + std::string(raised.selector.name()));
    return {};
  }
}

void readScreen(const reader::SceneRun& run, Interview& into) {
  keepHostFaults(run, into);
  into.transcript = read(run, into);
  into.whileRead = takeTouched();
}

// In a screen of its own: what has been read may be kept.
void askObjects(const reader::SceneRun& run, Interview& into) {
  into.whilePresented = takeTouched();
  const std::deque<PlacedObject> held = objectsHeldBy(run);
  std::unordered_set<const Object*> met;
  for (const PlacedObject& at : held) {
    std::string text = askEverything(*at.object, into);
    into.objects[at.place] = {std::move(text), takeTouched()};
    met.insert(at.object.get());
  }
  for (const PlacedObject& at : held) askElements(at, met, into, 0);
  for (const PlacedObject& at : held) sendHooks(*at.object, into);
  read(run, into);
  into.byHooks = takeTouched();
}

}  // namespace

Interview interview(const reader::Scene& scene, const std::string& module) {
  Interview result;
  takeTouched();
  if (const auto run = presented(scene, module, result)) readScreen(*run, result);
  if (const auto run = presented(scene, module, result)) askObjects(*run, result);
  return result;
}

}  // namespace ax::proof
