#include <gtest/gtest.h>

#include <fstream>
#include <set>

#include "host/core/HostApp.h"
#include "platform/accessibility/CategoryRegistration.h"
#include "reader/contract/ContractReport.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/contract/InChild.h"
#include "tests/contract/OwnProcess.h"
#include "tests/tour/Samples.h"

// The host contract with each of its rows taken away in turn. Every row gets a process of its own, since what
// is taken away and what start-up installs stays for the life of a process.
namespace ax {

namespace {

using reader::ContractFinding;
using reader::ContractReport;

std::vector<ContractCheck> rowsOfHealthyHost() {
  std::string error;
  const auto bundle = LoadedBundle::open(tour::modulePath(), "AXVeltoGlue", error);
  EXPECT_NE(bundle, nullptr) << error;
  if (bundle) bundle->start();
  return ValidationManager::sharedInstance()->checks();
}

// The class or member that a row is about.
std::string subjectOf(const ContractCheck& row) {
  const bool isClass = row.kind == CheckKind::classExists || row.kind == CheckKind::kindOfClass;
  return isClass ? row.className : row.className + "." + row.member;
}

// The member may be declared above the class that the row names.
bool takeAway(const ContractCheck& row) {
  Class* named = Class::namedEvenIfHidden(row.className);
  if (named == nullptr) return false;
  if (row.kind == CheckKind::classExists || row.kind == CheckKind::kindOfClass) {
    named->hide();
    return true;
  }
  for (Class* c = named; c != nullptr; c = c->superclass()) {
    if (c->hideMember(row.member)) return true;
  }
  return false;
}

bool isSame(const ContractCheck& a, const ContractCheck& b) {
  return a.kind == b.kind && a.category == b.category && a.className == b.className && a.member == b.member &&
         a.expected == b.expected;
}

std::string faultWithout(const ContractCheck& row) {
  if (!takeAway(row)) return "there is nothing to take away";
  for (const auto& sample : tour::sampleScenes()) {
    try {
      tour::Presented(sample, "");
    } catch (const reader::Fault& fault) {
      return fault.text();
    }
  }
  const Ref<ValidationManager> manager = ValidationManager::sharedInstance();
  if (manager->validationTargetName() != "AX Velto")
    return "reported under " + manager->validationTargetName();
  for (const InstallationRequest& request : manager->installationRequests()) {
    const bool targetIsGone =
        Class::named(categoryTargetClassName(*Class::named(request.category))) == nullptr;
    if (request.installed == targetIsGone) return request.category + " is not as it should be";
  }
  std::size_t reported = 0;
  for (const ContractCheck& check : manager->failedChecks()) {
    if (check.found.empty() || check.expected.empty()) return check.description() + " does not say what";
    if (isSame(check, row)) ++reported;
  }
  const bool categoryIsGone =
      !row.category.empty() && Class::named(categoryTargetClassName(*Class::named(row.category))) == nullptr;
  return reported == (categoryIsGone ? 0 : 1) ? "" : "reported " + std::to_string(reported) + " times";
}

// In the form of checks.txt: each category in the order of installation, and under it what it checks.
std::string contractTable(const std::vector<ContractCheck>& rows) {
  std::string text = "(start-up)\n";
  const auto append = [&](std::string_view category) {
    for (const ContractCheck& row : rows) {
      if (row.category != category) continue;
      const bool hasType = row.kind == CheckKind::instanceVariable || row.kind == CheckKind::instanceMethod ||
                           row.kind == CheckKind::classMethod;
      text += "  " + row.description() + (hasType ? ": " + row.expected : "") + "\n";
    }
  };
  append("");
  for (const InstallationRequest& request : ValidationManager::sharedInstance()->installationRequests()) {
    text += request.category + "\n";
    append(request.category);
  }
  return text;
}

}  // namespace

TEST(ContractRowsTest, AHealthyHostHoldsThemAll) {
  const std::vector<ContractCheck> rows = rowsOfHealthyHost();
  std::ifstream table(tour::samplesFolder().parent_path() / "tests/contract/checks.txt");
  const std::string expected{std::istreambuf_iterator<char>(table), {}};
  EXPECT_EQ(contractTable(rows), expected);
  const ContractReport report = ContractReport::ofProcess();
  for (const ContractFinding& finding : report.findings()) {
    EXPECT_TRUE(finding.passed) << finding.check << ": expected " << finding.expected << ", found "
                                << finding.found;
  }
  EXPECT_EQ(report.installed(), categoryCount());
  EXPECT_EQ(report.requested(), categoryCount());
}

// In shares, so that they can run side by side.
constexpr std::size_t shares = 4;
class ContractRowTest : public testing::TestWithParam<std::size_t> {};

TEST_P(ContractRowTest, IsOneThatTheAppLivesWithout) {
  if (ranInOwnProcess()) return;
  std::vector<ContractCheck> rows;
  // The rows are read in a child, so that this process stays without a started bundle.
  const std::string listed = inChild([] {
    std::string subjects;
    for (const ContractCheck& row : rowsOfHealthyHost()) {
      subjects += std::to_string(static_cast<int>(row.kind)) + "\t" + row.category + "\t" + row.className +
                  "\t" + row.member + "\t" + row.expected + "\n";
    }
    return subjects;
  });
  std::istringstream lines(listed);
  for (std::string line; std::getline(lines, line);) {
    std::istringstream fields(line);
    ContractCheck row{};
    std::string kind;
    std::getline(fields, kind, '\t');
    row.kind = static_cast<CheckKind>(std::stoi(kind));
    std::getline(fields, row.category, '\t');
    std::getline(fields, row.className, '\t');
    std::getline(fields, row.member, '\t');
    std::getline(fields, row.expected, '\t');
    rows.push_back(row);
  }
  ASSERT_GT(rows.size(), 150u);
  for (std::size_t i = GetParam(); i < rows.size(); i += shares) {
    const ContractCheck& row = rows[i];
    EXPECT_EQ(inChild([&] { return faultWithout(row); }), "")
        << row.category << ": without " << subjectOf(row);
  }
}

INSTANTIATE_TEST_SUITE_P(Shares, ContractRowTest, testing::Range<std::size_t>(0, shares));

}  // namespace ax
