#include "reader/contract/ContractReport.h"

#include <algorithm>

#include "platform/accessibility/CategoryRegistration.h"

namespace ax::reader {

namespace {

using Json = nlohmann::ordered_json;

void addOnce(std::vector<std::string>& list, const std::string& name) {
  if (std::find(list.begin(), list.end(), name) == list.end()) list.push_back(name);
}

std::string joined(const std::vector<std::string>& names) {
  std::string text;
  for (const std::string& name : names) text.append(text.empty() ? "" : ", ").append(name);
  return text;
}

std::string counted(std::size_t count, const std::string& one, const std::string& many) {
  return std::to_string(count) + " " + (count == 1 ? one : many);
}

std::vector<std::string> screensOf(const ContractCheck& check, const ValidationManager& manager) {
  if (check.category.empty()) return manager.validationTargetScreens();
  Class* category = Class::named(check.category);
  return category == nullptr ? std::vector<std::string>() : std::vector{categoryScreen(*category)};
}

// Of a category that stands but was not installed, the host lacks the class.
ContractCheck missingTarget(const std::string& category) {
  return {CheckKind::classExists, category, categoryTargetClassName(*Class::named(category)), "", "a class",
          "no such class",        false};
}

std::string lineOf(const ContractFinding& finding) {
  if (finding.passed) return "ok      " + finding.check + "\n";
  return "FAILED  " + finding.check + ": expected " + finding.expected + ", found " + finding.found +
         "\n          relied on by " +
         (finding.categories.empty() ? "the bundle as a whole" : joined(finding.categories)) +
         "\n          screens: " + joined(finding.screens) + "\n";
}

Json jsonOf(const ContractFinding& finding) {
  return {{"check", finding.check}, {"passed", finding.passed},         {"expected", finding.expected},
          {"found", finding.found}, {"categories", finding.categories}, {"screens", finding.screens}};
}

}  // namespace

ContractReport ContractReport::ofProcess() {
  return ContractReport(*ValidationManager::sharedInstance());
}

ContractReport::ContractReport(const ValidationManager& manager) : target_(manager.validationTargetName()) {
  for (const ContractCheck& check : manager.checks()) add(check, screensOf(check, manager));
  requested_ = manager.installationRequests().size();
  for (const InstallationRequest& request : manager.installationRequests()) {
    if (request.installed) {
      ++installed_;
    } else if (Class::named(request.category) != nullptr) {
      const ContractCheck missing = missingTarget(request.category);
      add(missing, screensOf(missing, manager));
    }
  }
}

void ContractReport::add(const ContractCheck& check, const std::vector<std::string>& screens) {
  const std::string description = check.description();
  auto found = std::find_if(findings_.begin(), findings_.end(), [&](const ContractFinding& finding) {
    return finding.check == description && finding.expected == check.expected;
  });
  if (found == findings_.end()) {
    findings_.push_back({description, check.expected, check.found, check.passed});
    found = findings_.end() - 1;
  }
  if (!check.category.empty()) addOnce(found->categories, check.category);
  for (const std::string& screen : screens) addOnce(found->screens, screen);
}

std::size_t ContractReport::failures() const {
  return static_cast<std::size_t>(
      std::count_if(findings_.begin(), findings_.end(), [](const auto& finding) { return !finding.passed; }));
}

std::vector<std::string> ContractReport::screensAtRisk() const {
  std::vector<std::string> screens;
  for (const ContractFinding& finding : findings_) {
    if (finding.passed) continue;
    for (const std::string& screen : finding.screens) addOnce(screens, screen);
  }
  return screens;
}

std::string ContractReport::text() const {
  std::string text = target_ + "\n";
  for (const ContractFinding& finding : findings_) text += lineOf(finding);
  text += counted(findings_.size() - failures(), "check", "checks") + " passed, " +
          std::to_string(failures()) + " failed; " + std::to_string(installed_) + " of " +
          counted(requested_, "category", "categories") + " installed\n";
  if (!holds()) text += "Screens that lose speech: " + joined(screensAtRisk()) + "\n";
  return text;
}

Json ContractReport::json() const {
  Json checks = Json::array();
  for (const ContractFinding& finding : findings_) checks.push_back(jsonOf(finding));
  return {{"target", target_},
          {"holds", holds()},
          {"installed", installed_},
          {"requested", requested_},
          {"screensAtRisk", screensAtRisk()},
          {"checks", std::move(checks)}};
}

Json ContractReport::failuresJson() const {
  Json failed = Json::array();
  for (const ContractFinding& finding : findings_) {
    if (!finding.passed) failed.push_back(jsonOf(finding));
  }
  return failed;
}

}  // namespace ax::reader
