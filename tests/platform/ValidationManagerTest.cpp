#include "platform/accessibility/ValidationManager.h"

#include <gtest/gtest.h>

#include "platform/accessibility/Notifications.h"
#include "platform/toolkit/Label.h"
#include "tests/contract/OwnProcess.h"
#include "tests/platform/AddedCategory.h"

namespace ax {

namespace {

const Message<Ref<String>()> reply{"validationTestReply"};

class Part : public View {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Part>("ValidationTestPart", View::staticClass()).build();
    return result;
  }
};

class Screen : public View {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Screen>("Velto.ValidationTestScreen", View::staticClass())
                               .instanceVariable<&Screen::title>("_titleLabel")
                               .instanceVariable<&Screen::isBusy>("_isBusy")
                               .instanceVariable<&Screen::part>("_part")
                               .method<&Screen::configure>("configureWithTitle1:value1:")
                               .method<&Screen::run>("runWithBlock:")
                               .method<&Screen::place>("placeAt:")
                               .method<&Screen::reply>("validationTestReply")
                               .classMethod<&Screen::shared>("sharedScreen")
                               .conformsTo("ValidationTestSource")
                               .build();
    return result;
  }
  void configure(Ref<String>, Ref<String>) {}
  bool run(std::function<void()>) { return false; }
  double place(Rect, std::int32_t) { return 0; }
  Ref<String> reply() { return string("host"); }
  static Ref<Screen> shared() { return nullptr; }
  Ref<Label> title;
  Ref<Part> part;
  bool isBusy = false;
};

class SubScreen : public Screen {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<SubScreen>("ValidationTestSubScreen", Screen::staticClass()).build();
    return result;
  }
};

// Each test may run alone.
const RegisteredClass<SubScreen> registered;

constexpr const char* screen = "Velto.ValidationTestScreen";
constexpr const char* subScreen = "ValidationTestSubScreen";
constexpr const char* nobody = "ValidationTestNobody";

TEST(ValidationManagerTest, ChecksAndTellsWhatItFound) {
  const Ref<ValidationManager> owned = make<ValidationManager>();
  ValidationManager& m = *owned;
  EXPECT_TRUE(m.validateClass(screen));
  EXPECT_TRUE(m.validateClassIsKindOfClass(subScreen, "View"));
  EXPECT_TRUE(m.validateClassHasInstanceVariableWithType(subScreen, "_titleLabel", "Label"));
  EXPECT_TRUE(m.validateClassHasInstanceVariableWithType(screen, "_isBusy", "B"));
  EXPECT_TRUE(m.validateClassHasInstanceMethodWithFullSignature(
      screen, "configureWithTitle1: value1:", {"v", "@", "@"}));
  EXPECT_TRUE(m.validateClassHasInstanceMethodWithFullSignature(screen, "runWithBlock:", {"B", "@?"}));
  EXPECT_TRUE(
      m.validateClassHasInstanceMethodWithFullSignature(screen, "placeAt:", {"d", rectEncoding, "i"}));
  EXPECT_TRUE(m.validateClassHasClassMethodWithFullSignature(subScreen, "sharedScreen", {"@"}));
  EXPECT_TRUE(m.validateClassConformsToProtocol(subScreen, "ValidationTestSource"));
  EXPECT_TRUE(m.failedChecks().empty());
  EXPECT_EQ(m.checks().size(), 9u);
}

TEST(ValidationManagerTest, NamesWhatFails) {
  const Ref<ValidationManager> owned = make<ValidationManager>();
  ValidationManager& m = *owned;
  const struct {
    bool held;
    const char* text;
    const char* expected;
    const char* found;
  } cases[] = {
      {m.validateClass(nobody), "ValidationTestNobody exists", "a class", "no such class"},
      {m.validateClassIsKindOfClass(screen, "Label"), "Velto.ValidationTestScreen is kind of Label",
       "a subclass of Label", "a subclass of View"},
      {m.validateClassIsKindOfClass(screen, nobody),
       "Velto.ValidationTestScreen is kind of ValidationTestNobody", "a subclass of ValidationTestNobody",
       "no class ValidationTestNobody"},
      {m.validateClassHasInstanceVariableWithType(screen, "_titleLabel", "View"),
       "Velto.ValidationTestScreen has instance variable _titleLabel", "View", "Label"},
      {m.validateClassHasInstanceVariableWithType(screen, "_validationTestMissing", "View"),
       "Velto.ValidationTestScreen has instance variable _validationTestMissing", "View", "no such member"},
      {m.validateClassHasInstanceMethodWithFullSignature(screen, "validationTestReply", {"@", "q"}),
       "Velto.ValidationTestScreen has instance method validationTestReply", "@ q", "@"},
      {m.validateClassHasInstanceMethodWithFullSignature(screen, "sharedScreen", {"@"}),
       "Velto.ValidationTestScreen has instance method sharedScreen", "@", "no such member"},
      {m.validateClassHasClassMethodWithFullSignature(screen, "validationTestReply", {"@"}),
       "Velto.ValidationTestScreen has class method validationTestReply", "@", "no such member"},
      {m.validateClassConformsToProtocol(screen, "ValidationTestOther"),
       "Velto.ValidationTestScreen conforms to protocol ValidationTestOther", "adopted", "not adopted"},
      {m.validateClassConformsToProtocol(nobody, "ValidationTestSource"),
       "ValidationTestNobody conforms to protocol ValidationTestSource", "adopted", "no such class"}};
  const std::vector<ContractCheck> failed = m.failedChecks();
  ASSERT_EQ(failed.size(), std::size(cases));
  for (std::size_t i = 0; i < failed.size(); ++i) {
    EXPECT_FALSE(cases[i].held);
    EXPECT_EQ(failed[i].description(), cases[i].text);
    EXPECT_EQ(failed[i].expected, cases[i].expected) << cases[i].text;
    EXPECT_EQ(failed[i].found, cases[i].found) << cases[i].text;
  }
}

template <int N>
class Category : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.of("View").exists();
    contract.instanceVariable("_gone" + std::to_string(N), "Label");
  }
  Ref<String> reply() { return string(super(ax::reply)->text() + " " + std::to_string(N)); }
};

template <int N>
Class& registerNumbered(const char* name, const char* target) {
  using C = Category<N>;
  return addCategory({name,
                      target,
                      {overrides<&C::reply>(reply)},
                      &C::_accessibilityPerformValidations,
                      "Screen " + std::to_string(N)});
}

void startWith(ValidationManager& manager, bool checks, const ValidationManager::Handler& installation) {
  manager.performValidationsWithPreValidationHandlerPostValidationHandlerSafeCategoryInstallationHandler(
      [](ValidationManager& m) { return m.validateClass(nobody); },
      [checks](ValidationManager& m) {
        m.setValidationTargetName(string("AX Velto"));
        return checks;
      },
      nullptr, installation);
}

TEST(ValidationManagerTest, InstallsInOrderWhateverIsMissing) {
  if (ranInOwnProcess()) return;
  registerNumbered<1>("ValidationTestOne", screen);
  registerNumbered<2>("ValidationTestTwo", nobody);
  registerNumbered<3>("ValidationTestThree", screen);
  const Ref<ValidationManager> owned = make<ValidationManager>();
  ValidationManager& m = *owned;
  startWith(m, true, [](ValidationManager& manager) {
    for (const char* name : {"ValidationTestOne", "ValidationTestNone", "ValidationTestTwo",
                             "ValidationTestThree", "ValidationTestOne"}) {
      manager.installSafeCategoryCanInteractWithTargetClass(name, true);
    }
  });
  std::vector<bool> installed;
  for (const InstallationRequest& request : m.installationRequests()) {
    EXPECT_TRUE(request.canInteractWithTargetClass);
    installed.push_back(request.installed);
  }
  EXPECT_EQ(installed, (std::vector{true, false, false, true, false}));
  EXPECT_EQ(reply(make<SubScreen>())->text(), "host 1 3") << "failed checks do not stop a category";
  EXPECT_EQ(m.validationTargetName(), "AX Velto");
  const std::vector<ContractCheck> failed = m.failedChecks();
  ASSERT_EQ(failed.size(), 3u) << "one of the bundle, one of each category that has a target";
  EXPECT_EQ(failed[0].category, "");
  EXPECT_EQ(failed[1].category, "ValidationTestOne");
  EXPECT_EQ(failed[1].member, "_gone1");
  EXPECT_EQ(failed[1].className, screen);
  EXPECT_EQ(failed[2].category, "ValidationTestThree");
  EXPECT_EQ(categoryScreen(*Class::named("ValidationTestThree")), "Screen 3");
  EXPECT_EQ(categoryTargetClassName(*Class::named("ValidationTestTwo")), nobody);
  EXPECT_EQ(categoryScreen(View::staticClass()) + categoryScreen(*Class::named("SafeCategory")), "");
}

TEST(ValidationManagerTest, MissesTheClassOfAMember) {
  const Ref<ValidationManager> owned = make<ValidationManager>();
  EXPECT_TRUE(owned->validateClassHasInstanceVariableWithType(screen, "_part", "ValidationTestPart"));
  Part::staticClass().hide();
  EXPECT_FALSE(owned->validateClassHasInstanceVariableWithType(screen, "_part", "ValidationTestPart"));
  EXPECT_EQ(owned->failedChecks().at(0).found, "no class ValidationTestPart");
}

// Checks are off: what installation left out is told all the same.
TEST(ValidationManagerTest, TellsWhatIsLeftToTheHost) {
  static constexpr auto answer = [](Object&, const Method&, double seconds) { return seconds > 1; };
  Class& changed = Class::add("ValidationTestChanged", &Screen::staticClass(), nullptr);
  changed.addMethod(registration::record<bool, double>(reply.selector(), answer));
  registerNumbered<5>("ValidationTestFive", "ValidationTestChanged");
  const Ref<ValidationManager> owned = make<ValidationManager>();
  ValidationManager& m = *owned;
  startWith(m, false, [](ValidationManager& manager) {
    manager.installSafeCategoryCanInteractWithTargetClass("ValidationTestFive", true);
  });
  EXPECT_TRUE(m.installationRequests().at(0).installed);
  ASSERT_EQ(m.failedChecks().size(), 1u);
  const ContractCheck left = m.failedChecks()[0];
  EXPECT_EQ(left.category, "ValidationTestFive");
  EXPECT_EQ(left.description(),
            "ValidationTestChanged takes override of instance method validationTestReply");
  EXPECT_EQ(left.expected, "@");
  EXPECT_EQ(left.found, "B d, left to the host");
}

// Nobody but another category answers the selector.
TEST(ValidationManagerTest, TellsWhatIsLeftToAnotherCategory) {
  static constexpr auto answer = [](Object&, const Method&, double seconds) { return seconds > 1; };
  Class& target = Class::add("ValidationTestBare", &Object::staticClass(), nullptr);
  addCategory({"ValidationTestAdding", target.name()})
      .addMethod(registration::record<bool, double>(reply.selector(), answer));
  registerNumbered<6>("ValidationTestSix", "ValidationTestBare");
  const Ref<ValidationManager> manager = make<ValidationManager>();
  manager->installSafeCategoryCanInteractWithTargetClass("ValidationTestAdding", true);
  manager->installSafeCategoryCanInteractWithTargetClass("ValidationTestSix", true);
  const ContractCheck left = manager->failedChecks().back();
  EXPECT_EQ(left.category, "ValidationTestSix");
  EXPECT_EQ(left.expected, "@");
  EXPECT_EQ(left.found, "B d, left to ValidationTestAdding");
}

TEST(ValidationManagerTest, InstallsWithoutChecksWhenTheyAreOff) {
  registerNumbered<4>("ValidationTestFour", subScreen);
  const Ref<ValidationManager> owned = make<ValidationManager>();
  ValidationManager& m = *owned;
  startWith(m, false, [](ValidationManager& manager) {
    manager.installSafeCategoryCanInteractWithTargetClass("ValidationTestFour", true);
  });
  EXPECT_TRUE(m.checks().empty());
  EXPECT_TRUE(m.installationRequests().at(0).installed);
  EXPECT_EQ(reply(make<SubScreen>())->text().back(), '4');
}

TEST(ReportsTest, KeepWhatWasPostedAndBroken) {
  forgetReports();
  const Ref<String> about = string("about");
  postNotification(LayoutChangedNotification, about);
  assertion(true, "holds", "source", 1, "function");
  assertion(false, "broken", "source", 52, "function");
  ASSERT_EQ(postedNotifications().size(), 1u);
  EXPECT_EQ(postedNotifications()[0].argument, about);
  ASSERT_EQ(failedAssertions().size(), 1u);
  EXPECT_EQ(failedAssertions()[0].message, "broken");
  EXPECT_EQ(failedAssertions()[0].line, 52);
  forgetReports();
  EXPECT_TRUE(postedNotifications().empty());
}

TEST(ReportsTest, KeepTheLastOnesAndCountAll) {
  forgetReports();
  Ref<String> first = string("first");
  const Weak<String> weak = first;
  postNotification(LayoutChangedNotification, std::move(first));
  for (int i = 0; i < int(keptReports) + 10; ++i) {
    postNotification(LayoutChangedNotification);
    assertion(false, "broken", "source", i, "function");
  }
  EXPECT_EQ(postedNotifications().size(), keptReports);
  EXPECT_EQ(postedNotificationCount(), keptReports + 11);
  EXPECT_FALSE(weak) << "what is dropped is let go";
  EXPECT_EQ(failedAssertions().size(), keptReports);
  EXPECT_EQ(failedAssertions().front().line, 10) << "the oldest go first";
  EXPECT_EQ(failedAssertionCount(), keptReports + 10);
  forgetReports();
  EXPECT_EQ(postedNotificationCount(), 0u);
}

}  // namespace

}  // namespace ax
