#include "reader/audit/AuditRule.h"
#include "reader/snapshot/Charts.h"
#include "reader/speech/ChartWords.h"

// Charts.
namespace ax::reader {

namespace {

bool isEmpty(const std::optional<AttributedText>& text) {
  return !text || text->text.empty();
}

// A heading inside a chart, or right above it, names it as a title does.
bool isNamed(const AuditScreen& screen, const Node& chart) {
  if (!nameOfChart(screen.snapshot, chart).empty()) return true;
  const Node* before = nullptr;
  for (const Node& node : screen.snapshot.nodes()) {
    if (node.id >= chart.id) break;
    if (node.isElement) before = &node;
  }
  return before != nullptr && (before->role == Role::header || !isEmpty(before->label));
}

bool hasParts(const AuditScreen& screen, const Node& chart) {
  return chart.isElement || !chart.series->slices.empty() || !elementsOfChart(screen.snapshot, chart).empty();
}

// Values are nothing without a unit; where they lie is told by the title alone. The empty text is the unit of
// what needs none.
std::string missingWords(const AuditScreen& screen, const Node& chart) {
  std::string missing;
  const auto add = [&](const char* what) { missing += (missing.empty() ? "" : ", no ") + std::string(what); };
  if (!isNamed(screen, chart)) add("name");
  if (chart.series->hasAxes) {
    const auto& [horizontal, vertical] = chart.series->axes;
    if (isEmpty(horizontal.title)) add("title of the horizontal axis");
    if (isEmpty(vertical.title)) add("title of the vertical axis");
    if (!vertical.unitLabel) add("unit");
  }
  if (!hasParts(screen, chart)) add("elements");
  return missing;
}

}  // namespace

void findWordlessCharts(const Audit&, const AuditScreen& screen, Problems& problems) {
  for (const Node* chart : charts(screen.snapshot)) {
    const std::string missing = missingWords(screen, *chart);
    if (missing.empty()) continue;
    std::size_t place = 0;
    for (const AuditedElement& element : screen.elements) {
      if (element.node->id == chart->id) place = element.place;
    }
    const AuditedElement element{chart, place, labelOf(*chart)};
    problems.push_back(problemOf(element, "has no " + missing));
  }
}

}  // namespace ax::reader
