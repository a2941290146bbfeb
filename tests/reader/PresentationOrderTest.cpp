#include <gtest/gtest.h>

#include <stdexcept>

#include "platform/runtime/ClassBuilder.h"
#include "platform/toolkit/Label.h"
#include "platform/toolkit/ViewController.h"
#include "tests/reader/SceneProbe.h"

namespace ax::reader {
namespace {

// Who got which message, in the order in which all of them came.
std::vector<std::string>& heard() {
  static std::vector<std::string> all;
  return all;
}

class Witness : public View {
 public:
  static Class& staticClass();
  void setName(Ref<String> name) { name_ = name->text(); }
  Ref<String> name() const { return string(name_); }
  void layoutSubviews() override;
  void load() { heard().push_back("load " + name_); }

 private:
  std::string name_;
};

// Makes a row, as a table does, whenever it is laid out.
void Witness::layoutSubviews() {
  heard().push_back("layout " + name_);
  if (name_ == "table") {
    const Ref<Witness> row = make<Witness>();
    row->name_ = "row";
    addSubview(row);
  }
  if (name_ == "broken") throw std::runtime_error("no room");
}

Class& Witness::staticClass() {
  using T = Witness;
  static Class& result = ClassBuilder<T>("Tests.Witness", View::staticClass())
                             .property<&T::name, &T::setName>("name")
                             .method<&T::load>("_accessibilityLoadAccessibilityInformation")
                             .build();
  return result;
}

class WitnessController : public ViewController {
 public:
  static Class& staticClass();
  void loadView() override {
    heard().push_back("loadView");
    ViewController::loadView();
  }
  void viewDidLoad() override { heard().push_back("viewDidLoad"); }
  void load() { heard().push_back("load controller"); }
};

Class& WitnessController::staticClass() {
  using T = WitnessController;
  static Class& result = ClassBuilder<T>("Tests.WitnessController", ViewController::staticClass())
                             .method<&T::load>("_accessibilityLoadAccessibilityInformation")
                             .build();
  return result;
}

const RegisteredClass<Witness> registeredWitness;
const RegisteredClass<WitnessController> registeredController;

std::string named(const std::string& name, const std::string& subviews = "") {
  return R"({"class": "Tests.Witness", "set": {"name": ")" + name + R"("}, "subviews": [)" + subviews + "]}";
}

std::vector<std::string> heardOf(const std::string& members) {
  heard().clear();
  const StandingScene standing(members);
  return heard();
}

using Heard = std::vector<std::string>;

TEST(PresentationOrderTest, LaysOutFromTheTopAndThenLoadsChildrenFirst) {
  const std::string tree = named("a", named("b", named("c")) + ", " + named("d"));
  EXPECT_EQ(heardOf(R"("screen": )" + tree),
            (Heard{"layout a", "layout b", "layout c", "layout d", "load c", "load b", "load d", "load a"}));
}

TEST(PresentationOrderTest, TheControllerComesFirstAndLast) {
  const std::string view = named("a", named("b"));
  EXPECT_EQ(
      heardOf(R"("screen": {"class": "Tests.WitnessController", "set": {"view": )" + view + "}}"),
      (Heard{"loadView", "viewDidLoad", "layout a", "layout b", "load b", "load a", "load controller"}));
}

TEST(PresentationOrderTest, AControllerWithoutAViewMakesItOnce) {
  EXPECT_EQ(heardOf(R"("screen": {"class": "Tests.WitnessController"})"),
            (Heard{"loadView", "viewDidLoad", "load controller"}));
}

TEST(PresentationOrderTest, RowsMadeByTheLayoutAreShownToo) {
  EXPECT_EQ(heardOf(R"("screen": )" + named("table")),
            (Heard{"layout table", "layout row", "load row", "load table"}));
}

TEST(PresentationOrderTest, AHostThatRaisesDoesNotKeepTheOthersOut) {
  heard().clear();
  const StandingScene standing(R"("screen": )" + named("a", named("broken") + ", " + named("b")));
  EXPECT_EQ(heard(), (Heard{"layout a", "layout broken", "layout b", "load broken", "load b", "load a"}));
  EXPECT_EQ(standing.run.hostFaults(), Heard{"Tests.Witness layoutSubviews: no room"});
}

TEST(PresentationOrderTest, WhatIsOnlyHeldOrLiesBesideHearsNothing) {
  EXPECT_EQ(heardOf(R"("objects": [)" + named("beside") + R"(, {"class": "Tests.WitnessController"}],
      "screen": {"class": "Tests.SceneProbe", "set": {"_partner": )" +
                    named("held") + R"(}})"),
            Heard());
  EXPECT_EQ(heardOf(R"("objects": [)" + named("beside") + "]"), Heard());
}

}  // namespace
}  // namespace ax::reader
