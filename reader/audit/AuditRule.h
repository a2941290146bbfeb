#pragma once

#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "reader/audit/AuditScreen.h"

// What a listener would stumble over, rule by rule.
namespace ax::reader {

// What one rule found wrong with one element, or with something on the screen that is none.
struct Problem {
  std::size_t place = 0;  // in reading order, from 1; 0 for what is no element
  std::string of;         // what is spoken there, or what stands there unspoken
  std::string object;     // the class, and the id where there is one: "Button \"sort\""
  std::string what;       // what is wrong with it
};
using Problems = std::vector<Problem>;

// One rule. `check` looks at one screen of the audit; it changes nothing and never fails.
struct AuditRule {
  std::string_view name;  // "no-label"
  bool isError;           // else a warning
  std::string_view finds;
  std::string_view why;  // it matters to a listener
  void (*check)(const Audit& audit, const AuditScreen& screen, Problems& problems);
};

// Every rule, in the order of the report.
std::span<const AuditRule> auditRules();

// "Button \"sort\"", or the class alone for an object without an id.
std::string nameOf(const std::string& className, const std::string& objectId);
Problem problemOf(const AuditedElement& element, std::string what);
// The label, the value and the hint; nil counts as empty.
std::string labelOf(const Node& node);
std::string valueOf(const Node& node);
std::string hintOf(const Node& node);
// Whether a listener can operate the element.
bool isOperable(const Node& node);

void findUnspokenTexts(const Audit&, const AuditScreen&, Problems&);
void findOtherWords(const Audit&, const AuditScreen&, Problems&);
void findMissingLabels(const Audit&, const AuditScreen&, Problems&);
void findRawKeys(const Audit&, const AuditScreen&, Problems&);
void findUntranslated(const Audit&, const AuditScreen&, Problems&);
void findAbbreviations(const Audit&, const AuditScreen&, Problems&);
void findRepeats(const Audit&, const AuditScreen&, Problems&);
void findRoleWords(const Audit&, const AuditScreen&, Problems&);
void findMissingAreas(const Audit&, const AuditScreen&, Problems&);
void findOutsideScreen(const Audit&, const AuditScreen&, Problems&);
void findSmallTargets(const Audit&, const AuditScreen&, Problems&);
void findOverlaps(const Audit&, const AuditScreen&, Problems&);
void findSameNames(const Audit&, const AuditScreen&, Problems&);
void findOutOfOrder(const Audit&, const AuditScreen&, Problems&);
void findWordlessCharts(const Audit&, const AuditScreen&, Problems&);
void findLongLines(const Audit&, const AuditScreen&, Problems&);

}  // namespace ax::reader
