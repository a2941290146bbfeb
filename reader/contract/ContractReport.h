#pragma once

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "platform/accessibility/ValidationManager.h"

namespace ax::reader {

// One check of the host contract with everybody who relies on it.
struct ContractFinding {
  std::string check;  // "CHWorkoutDetailMapView has instance variable _titleLabel"
  std::string expected;
  std::string found;
  bool passed = true;
  std::vector<std::string> categories = {};  // empty for a check of the bundle as a whole
  std::vector<std::string> screens = {};     // in the order of the categories, none twice
};

// What start-up found out about the host: each check once, however many categories made it, and how many
// categories are installed. A category whose host class is missing counts as a failed check of that class.
class ContractReport {
 public:
  // Of the process's manager, after start-up.
  static ContractReport ofProcess();
  explicit ContractReport(const ValidationManager& manager);

  std::size_t failures() const;
  // Whether every check passed.
  bool holds() const { return failures() == 0; }
  const std::string& target() const { return target_; }
  const std::vector<ContractFinding>& findings() const { return findings_; }
  // The screens of the failed checks, none twice.
  std::vector<std::string> screensAtRisk() const;
  std::size_t installed() const { return installed_; }
  std::size_t requested() const { return requested_; }

  // One line per check that passed, three per check that failed, then the sums.
  std::string text() const;
  nlohmann::ordered_json json() const;
  // The failed checks alone.
  nlohmann::ordered_json failuresJson() const;

 private:
  void add(const ContractCheck& check, const std::vector<std::string>& screens);

  std::string target_;
  std::vector<ContractFinding> findings_;
  std::size_t installed_ = 0;
  std::size_t requested_ = 0;
};

}  // namespace ax::reader
