#include "reader/audit/AuditReport.h"

#include <algorithm>

namespace ax::reader {

namespace {

const char* severityOf(const AuditRule& rule) {
  return rule.isError ? "error" : "warning";
}

std::string placeOf(const Problem& problem) {
  const std::string spoken = " \"" + problem.of + "\"";
  return problem.place == 0 ? "unspoken" + spoken : "element " + std::to_string(problem.place) + spoken;
}

std::string counted(std::size_t count, const std::string& noun) {
  return std::to_string(count) + " " + noun + (count == 1 ? "" : "s");
}

}  // namespace

void AuditReport::add(const Audit& audit, const std::set<std::string>& without) {
  for (const AuditScreen& screen : audit.screens) {
    ++screens_;
    elements_ += screen.elements.size();
    for (const AuditRule& rule : auditRules()) {
      if (without.contains(std::string(rule.name))) continue;
      Problems problems;
      rule.check(audit, screen, problems);
      for (Problem& problem : problems) {
        findings_.push_back({&rule, screen.file, screen.locale, std::move(problem)});
      }
    }
  }
}

bool AuditReport::holds() const {
  return std::ranges::none_of(findings_, [](const AuditFinding& finding) { return finding.rule->isError; });
}

std::string AuditReport::text() const {
  std::string text;
  std::set<const AuditRule*> explained;
  for (const AuditFinding& finding : findings_) {
    const auto& [rule, file, locale, problem] = finding;
    text.append(file).append(" [").append(locale).append("]: ").append(severityOf(*rule)).append(" ");
    text.append(rule->name)
        .append(": ")
        .append(placeOf(problem))
        .append(" (")
        .append(problem.object)
        .append(") ");
    text.append(problem.what).append("\n");
    if (explained.insert(rule).second) text.append("    ").append(rule->why).append("\n");
  }
  const auto errors = static_cast<std::size_t>(
      std::ranges::count_if(findings_, [](const AuditFinding& finding) { return finding.rule->isError; }));
  return text + counted(elements_, "element") + " on " + counted(screens_, "screen") + ": " +
         counted(errors, "error") + ", " + counted(findings_.size() - errors, "warning") + "\n";
}

nlohmann::ordered_json AuditReport::json() const {
  nlohmann::ordered_json list = nlohmann::ordered_json::array();
  for (const auto& [rule, file, locale, problem] : findings_) {
    nlohmann::ordered_json finding = {
        {"rule", rule->name},       {"severity", severityOf(*rule)}, {"file", file},
        {"locale", locale},         {"place", problem.place},        {"of", problem.of},
        {"object", problem.object}, {"what", problem.what},          {"why", rule->why}};
    if (problem.place == 0) finding["place"] = nullptr;
    list.push_back(std::move(finding));
  }
  return {{"screens", screens_}, {"elements", elements_}, {"findings", std::move(list)}};
}

std::string auditRulesAsMarkdown() {
  std::string page =
      "# What an audit looks for\n\n"
      "The rules of `axvelto audit`, in the order of its report, and why each matters to a listener. Made "
      "by\n"
      "`axvelto audit --rules`; a test compares it.\n\n"
      "| Rule | Severity | Finds | Why it matters |\n|---|---|---|---|\n";
  for (const AuditRule& rule : auditRules()) {
    page += "| " + std::string(rule.name) + " | " + severityOf(rule) + " | " + std::string(rule.finds) +
            " | " + std::string(rule.why) + " |\n";
  }
  return page;
}

}  // namespace ax::reader
