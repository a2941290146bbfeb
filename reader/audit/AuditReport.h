#pragma once

#include <nlohmann/json.hpp>
#include <set>
#include <string>
#include <vector>

#include "reader/audit/AuditRule.h"

namespace ax::reader {

// What one rule found on one screen.
struct AuditFinding {
  const AuditRule* rule;
  std::string file;
  std::string locale;
  Problem problem;
};

// What every rule found on every screen, in the order of the screens and then of the rules.
class AuditReport {
 public:
  // Looks at the screens of one more file; rules that are named in `without` are left out.
  void add(const Audit& audit, const std::set<std::string>& without);

  const std::vector<AuditFinding>& findings() const { return findings_; }
  // Whether no error was found; warnings do not count.
  bool holds() const;
  // A paragraph for each finding, with the reason of a rule where it is first broken, and a last line that
  // counts.
  std::string text() const;
  nlohmann::ordered_json json() const;

 private:
  std::vector<AuditFinding> findings_;
  std::size_t screens_ = 0;
  std::size_t elements_ = 0;
};

// The rules with their reasons, as a page in Markdown.
std::string auditRulesAsMarkdown();

}  // namespace ax::reader
