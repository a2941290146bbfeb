#include <gtest/gtest.h>

#include <algorithm>
#include <sstream>

#include "host/core/HostApp.h"
#include "platform/accessibility/BundleLoader.h"
#include "platform/accessibility/ValidationManager.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Grafting.h"
#include "reader/contract/ContractReport.h"
#include "tests/contract/InChild.h"
#include "tests/contract/OwnProcess.h"
#include "tests/tour/Samples.h"

// A host that gave the methods another type which the bundle overrides: it runs on as if there were no
// bundle.
namespace ax {

namespace {

struct Overridden {
  std::string category;
  std::string target;
  std::string selector;
  bool isClassMethod;
};

std::unique_ptr<LoadedBundle> openModule() {
  std::string error;
  return LoadedBundle::open(tour::modulePath(), "AXVeltoGlue", error);
}

Class& tableOf(Class& owner, const Overridden& row) {
  return row.isClassMethod ? owner.metaclass() : owner;
}

Class& targetOf(const Overridden& row) {
  return *Class::named(row.target);
}

std::vector<Overridden> overridesOfInstalledCategories() {
  std::vector<Overridden> rows;
  for (Class* category : Class::all()) {
    if (graftOf(*category) == nullptr) continue;
    for (const bool isClassMethod : {false, true}) {
      const Class& table = isClassMethod ? category->metaclass() : *category;
      table.forEachOwnMethod([&](const Method& method) {
        rows.push_back({category->name(), graftOf(*category)->target->name(),
                        std::string(method.selector.name()), isClassMethod});
      });
    }
  }
  return rows;
}

// The type that every method is changed to, and what it answers.
using Changed = double(Ref<Object>, double);
double changedMethod(Object&, const Method&, Ref<Object>, double given) {
  return given + 1;
}

// Where the host declares the method, which may be above the target; where it does not, its superclass does
// from now on.
void changeSignature(const Overridden& row) {
  const Selector selector = Selector::intern(row.selector);
  Class* declaring = &tableOf(targetOf(row), row);
  const Method& declared = declaring->lookUp(selector);
  Class& owner = declared.function != nullptr ? const_cast<Class&>(*declared.owner)
                                              : tableOf(*targetOf(row).superclass(), row);
  owner.addMethod(registration::record<double, Ref<Object>, double>(selector, &changedMethod));
}

// What the host's own sends of the changed type yield: to an instance where one can be made.
double sentByHost(const Overridden& row) {
  const Message<Changed> message(row.selector);
  Class& target = targetOf(row);
  if (row.isClassMethod) return message(target, nullptr, 41);
  if (const Ref<Object> instance = target.instantiate()) return message(instance, nullptr, 41);
  const Ref<Object> any = make<Object>();
  return message.call(*any, target.lookUp(message.selector()), nullptr, 41);
}

bool isLeftToHost(const Overridden& row) {
  const CategoryGraft* graft = graftOf(*Class::named(row.category));
  return graft != nullptr &&
         std::any_of(graft->leftToHost.begin(), graft->leftToHost.end(), [&](const LeftToHost& left) {
           return left.override->selector.name() == row.selector && left.isClassMethod == row.isClassMethod;
         });
}

std::size_t entriesOf(const Overridden& row) {
  const CategoryGraft& graft = *graftOf(*Class::named(row.category));
  return graft.methods.size() + graft.leftToHost.size();
}

bool isReported(const Overridden& row) {
  const std::vector<ContractCheck> failed = ValidationManager::sharedInstance()->failedChecks();
  return std::any_of(failed.begin(), failed.end(), [&](const ContractCheck& check) {
    return check.category == row.category && check.member == row.selector &&
           check.found == "d @ d, left to the host" &&
           (check.kind == CheckKind::overriddenClassMethod) == row.isClassMethod;
  });
}

std::string faultAfterChange(const std::vector<Overridden>& changed) {
  const auto bundle = openModule();
  for (const Overridden& row : changed) changeSignature(row);
  bundle->start();
  const std::vector<Overridden> all = overridesOfInstalledCategories();
  std::string faults;
  for (const Overridden& row : changed) {
    const auto expect = [&](bool holds, const char* fault) {
      if (!holds) faults += row.category + " " + row.selector + ": " + fault + "\n";
    };
    expect(sentByHost(row) == 42, "the host's own send is not answered");
    expect(isLeftToHost(row), "it is not left to the host");
    expect(isReported(row), "the report does not say so");
    const auto siblings = std::count_if(
        all.begin(), all.end(), [&](const Overridden& other) { return other.category == row.category; });
    expect(entriesOf(row) == static_cast<std::size_t>(siblings), "the rest of the category is not grafted");
  }
  return faults;
}

// One row a line, read in a child, so that this process stays without a module.
std::vector<Overridden> allOverrides() {
  std::istringstream lines(inChild([] {
    openModule()->start();
    std::string text;
    for (const Overridden& row : overridesOfInstalledCategories())
      text += row.category + " " + row.target + " " + row.selector + " " + std::to_string(row.isClassMethod) +
              "\n";
    return text;
  }));
  std::vector<Overridden> rows;
  for (Overridden row; lines >> row.category >> row.target >> row.selector >> row.isClassMethod;)
    rows.push_back(row);
  return rows;
}

TEST(ChangedSignatureTest, IsLeftToTheHostInEveryRow) {
  if (ranInOwnProcess()) return;
  const std::vector<Overridden> rows = allOverrides();
  ASSERT_GT(rows.size(), 200u);
  ASSERT_TRUE(std::any_of(rows.begin(), rows.end(), [](const Overridden& row) { return row.isClassMethod; }));
  for (const Overridden& row : rows) {
    const auto fault = [&row] { return faultAfterChange({row}); };
    EXPECT_EQ(inChild(fault), "") << row.category << " " << row.selector;
  }
}

TEST(ChangedSignatureTest, OfAllMethodsAtOnceLeavesTheScreensStanding) {
  if (ranInOwnProcess()) return;
  const std::vector<Overridden> rows = allOverrides();
  EXPECT_EQ(inChild([&rows] {
              const std::string fault = faultAfterChange(rows);
              for (const auto& sample : tour::sampleScenes()) tour::Presented(sample, "");
              return fault;
            }),
            "");
}

}  // namespace

}  // namespace ax
