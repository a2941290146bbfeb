#include "reader/contract/ContractReport.h"

#include <gtest/gtest.h>

#include "tests/platform/AddedCategory.h"

namespace ax::reader {
namespace {

void checkTitle(const Contract& contract) {
  contract.of("View").instanceVariable("_title", "String");
  contract.exists();
}

// Two categories with the same check, and one whose host class is missing.
void addCategories() {
  addCategory({"ReportTestMetricAccessibility", "Label", {}, checkTitle, "Trends"});
  addCategory({"ReportTestLoadingAccessibility", "Label", {}, checkTitle, "Loading"});
  addCategory({"ReportTestHeaderAccessibility", "Tests.NoSuchHeader", {}, checkTitle, "Trends"});
}

TEST(ContractReportTest, GroupsChecksAndNamesTheScreens) {
  addCategories();
  const Ref<ValidationManager> manager = make<ValidationManager>();
  manager->performValidationsWithPreValidationHandlerPostValidationHandlerSafeCategoryInstallationHandler(
      [](ValidationManager& m) { return m.validateClass("Button"); },
      [](ValidationManager& m) {
        m.setValidationTargetName(string("Target"));
        return true;
      },
      nullptr,
      [](ValidationManager& m) {
        for (const char* name : {"ReportTestMetricAccessibility", "ReportTestLoadingAccessibility",
                                 "ReportTestHeaderAccessibility", "ReportTestNotBuiltYetAccessibility"}) {
          m.installSafeCategoryCanInteractWithTargetClass(name, true);
        }
      });
  const ContractReport report(*manager);
  EXPECT_FALSE(report.holds());
  EXPECT_EQ(report.text(),
            "Target\n"
            "ok      Button exists\n"
            "FAILED  View has instance variable _title: expected String, found no such member\n"
            "          relied on by ReportTestMetricAccessibility, ReportTestLoadingAccessibility\n"
            "          screens: Trends, Loading\n"
            "ok      Label exists\n"
            "FAILED  Tests.NoSuchHeader exists: expected a class, found no such class\n"
            "          relied on by ReportTestHeaderAccessibility\n"
            "          screens: Trends\n"
            "2 checks passed, 2 failed; 2 of 4 categories installed\n"
            "Screens that lose speech: Trends, Loading\n");
  const nlohmann::ordered_json json = report.json();
  EXPECT_EQ(json["checks"][1]["screens"].dump(), R"(["Trends","Loading"])");
  EXPECT_EQ(json["installed"], 2);
}

TEST(ContractReportTest, ChecksOfTheWholeBundleNameTheirScreens) {
  const Ref<ValidationManager> manager = make<ValidationManager>();
  manager->setValidationTargetScreens({"Month calendar", "Week palette"});
  manager->validateClass("Tests.NoSuchCache");
  const ContractReport report(*manager);
  EXPECT_NE(report.text().find("relied on by the bundle as a whole\n"
                               "          screens: Month calendar, Week palette\n"),
            std::string::npos);
}

double hostsOwn(Object&, const Method&, bool) {
  return 0;
}
Ref<Object> categorys(Object&, const Method&) {
  return nullptr;
}

TEST(ContractReportTest, TellsWhatIsLeftToTheHost) {
  const Selector selector = Selector::intern("testsChangedMethod");
  Class& host = Class::add("Tests.ChangedHost", &Object::staticClass(), nullptr);
  host.addMethod(registration::record<double, bool>(selector, &hostsOwn));
  addCategory({"ReportTestMonthAccessibility", "Tests.ChangedHost", {}, nullptr, "Month calendar"})
      .addMethod(registration::record<Ref<Object>>(selector, &categorys));
  const Ref<ValidationManager> manager = make<ValidationManager>();
  manager->installSafeCategoryCanInteractWithTargetClass("ReportTestMonthAccessibility", true);
  EXPECT_EQ(ContractReport(*manager).text(),
            "\n"
            "FAILED  Tests.ChangedHost takes override of instance method testsChangedMethod: expected @, "
            "found d B, "
            "left to the host\n"
            "          relied on by ReportTestMonthAccessibility\n"
            "          screens: Month calendar\n"
            "0 checks passed, 1 failed; 1 of 1 category installed\n"
            "Screens that lose speech: Month calendar\n");
}

}  // namespace
}  // namespace ax::reader
