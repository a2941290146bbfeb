#include "reader/snapshot/Charts.h"

namespace ax::reader {

namespace {

void collectElements(const Snapshot& snapshot, const Node& node, std::vector<const Node*>& found) {
  if (node.isElement) found.push_back(&node);
  for (const NodeId child : node.children) collectElements(snapshot, *snapshot.node(child), found);
}

}  // namespace

std::vector<const Node*> charts(const Snapshot& snapshot) {
  std::vector<const Node*> found;
  for (const Node& node : snapshot.nodes()) {
    if (node.series) found.push_back(&node);
  }
  return found;
}

std::vector<const Node*> elementsOfChart(const Snapshot& snapshot, const Node& chart) {
  std::vector<const Node*> found;
  for (const NodeId child : chart.children) collectElements(snapshot, *snapshot.node(child), found);
  return found;
}

}  // namespace ax::reader
