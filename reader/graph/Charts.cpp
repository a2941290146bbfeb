#include "reader/graph/ChartDescription.h"

namespace ax::reader {

namespace {

void collect(const Snapshot& snapshot, const Node& node, bool (*wanted)(const Node&),
             std::vector<const Node*>& found) {
  if (wanted(node)) found.push_back(&node);
  for (const NodeId child : node.children) collect(snapshot, *snapshot.node(child), wanted, found);
}

}  // namespace

std::vector<const Node*> charts(const Snapshot& snapshot, const Node& top) {
  std::vector<const Node*> found;
  collect(
      snapshot, top, [](const Node& node) { return node.series.has_value(); }, found);
  return found;
}

std::vector<const Node*> charts(const Snapshot& snapshot) {
  std::vector<const Node*> found;
  for (const Node& node : snapshot.nodes()) {
    if (node.series) found.push_back(&node);
  }
  return found;
}

std::vector<const Node*> elementsOfChart(const Snapshot& snapshot, const Node& chart) {
  std::vector<const Node*> found;
  for (const NodeId child : chart.children) {
    collect(
        snapshot, *snapshot.node(child), [](const Node& node) { return node.isElement; }, found);
  }
  return found;
}

}  // namespace ax::reader
