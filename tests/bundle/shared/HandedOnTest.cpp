#include <gtest/gtest.h>

#include <set>

#include "platform/accessibility/CategoryRegistration.h"
#include "platform/accessibility/ValidationManager.h"
#include "platform/runtime/Number.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "platform/toolkit/AccessibilityMessages.h"
#include "tests/bundle/StartedBundle.h"

// Categories stand in front of the host's methods: what they hand on is all that the sender gave.
namespace ax {

namespace {

using Arguments = std::vector<Ref<Object>>;

// One that can be told from every other; no block, which boxing does not know.
Ref<Object> argumentOf(std::string_view encoding, std::size_t place, bool flag) {
  const double figure = static_cast<double>(place) + (flag ? 3 : 40);
  if (encoding == "@") return make<Object>();
  if (encoding == "B") return number(flag);
  if (encoding == "@?") return nullptr;
  return encoding == encodingOf<Rect>() ? box(Rect{figure, 2, 3, 4}) : number(figure);
}

Arguments argumentsOf(const Method& method, bool flag) {
  Arguments given;
  for (const std::string_view encoding : method.signature->encodings.subspan(1))
    given.push_back(argumentOf(encoding, given.size(), flag));
  return given;
}

// What the method that the category replaced is sent; empty when it is sent nothing, or there is none.
Arguments handedOn(const Class& target, Selector selector, const Arguments& given) {
  Arguments got;
  const Ref<Object> receiver = target.instantiate();
  const bool isReplaced = receiver && setScriptedAnswer(*receiver, selector, [&](auto arguments) {
                            got.assign(arguments.begin(), arguments.end());
                            return nullptr;
                          });
  if (!isReplaced) return {};
  const Method& entry = target.lookUp(selector);
  entry.signature->invoke(*receiver, entry, given);
  return got;
}

TEST(HandedOnTest, EveryArgumentReachesTheHost) {
  ASSERT_NO_FATAL_FAILURE(startBundle());
  std::set<std::string> handing;
  for (const InstallationRequest& request : ValidationManager::sharedInstance()->installationRequests()) {
    Class& category = *Class::named(request.category);
    const Class& target = *Class::named(categoryTargetClassName(category));
    category.forEachOwnMethod([&](const Method& method) {
      for (const bool flag : {false, true}) {
        const Arguments given = argumentsOf(method, flag);
        const Arguments got = handedOn(target, method.selector, given);
        if (given.empty() || got.empty()) continue;
        handing.emplace(method.selector.name());
        for (std::size_t i = 0; i < given.size(); ++i)
          EXPECT_TRUE(!given[i] || (got.at(i) && given[i]->isEqual(*got[i]))) << method.selector.name() << i;
      }
    });
  }
  const std::set<std::string> expected = {
      "initWithPresentingViewController:detailViewController:shouldPlayFlipInAnimation:initialBadgeFrame:"
      "conversionView:presentAlongsideBlock:dismissAlongsideBlock:completionBlock:",
      "setFriend:snapshot:formattingManager:animated:",
      "configureWithWorkout:dataCalculator:",
      "configureWithTitle1:value1:",
      "configureWithTitle2:value2:",
      "formattedDurationForWorkout:context:",
      "addChartLabelWithUnit:",
      "setBriskMinutes:goal:percent:",
      "setActiveEnergy:goalEnergy:percent:",
      "highlightWeekdayLabelForDateAndSetDay:",
      "initWithNavigationPalette:",
      "setTemperature:humidity:weatherCondition:formattingManager:"};
  EXPECT_EQ(handing, expected);
}

// What a category loads comes on top of what the host, or a class above, loads for itself.
TEST(HandedOnTest, EveryLoadReachesTheHostFirst) {
  ASSERT_NO_FATAL_FAILURE(startBundle());
  const Selector selector = messages::_accessibilityLoadAccessibilityInformation.selector();
  std::set<std::string> kept;
  int checked = 0;
  for (const InstallationRequest& request : ValidationManager::sharedInstance()->installationRequests()) {
    Class& category = *Class::named(request.category);
    bool loads = false;
    category.forEachOwnMethod([&](const Method& method) { loads |= method.selector == selector; });
    const Ref<Object> receiver = Class::named(categoryTargetClassName(category))->instantiate();
    if (!loads || !receiver) continue;
    int calls = 0;
    const bool isReplaced = setScriptedAnswer(*receiver, selector, [&calls](auto) {
      ++calls;
      return nullptr;
    });
    if (!isReplaced) continue;
    messages::_accessibilityLoadAccessibilityInformation(receiver);
    ++checked;
    if (calls != 1) kept.insert(request.category);
  }
  EXPECT_EQ(kept, std::set<std::string>());
  EXPECT_GT(checked, 20);
}

}  // namespace

}  // namespace ax
