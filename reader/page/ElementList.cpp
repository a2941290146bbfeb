#include "reader/page/ElementList.h"

#include "platform/formatting/Numbers.h"
#include "reader/page/ChartFigure.h"
#include "reader/page/ChartPlayer.h"
#include "reader/page/ElementLine.h"

namespace ax::reader {

namespace {

// Nodes that need no more than the row of a table: a name and a value.
bool isPlain(const Node& node) {
  const bool isText = node.role == Role::element || node.role == Role::staticText;
  const bool hasMore = (node.hint && !node.hint->text.empty()) || (node.traits & ~TraitStaticText) != 0 ||
                       node.series || !node.children.empty() || node.states.expanded ||
                       node.states.collapsed || node.states.modal;
  return node.isElement && isText && !hasMore;
}

class ListWriter {
 public:
  ListWriter(Markup& html, const Snapshot& snapshot, const ReadingOrder& order, const PlaceOnPage& place)
      : html_(html), snapshot_(snapshot), order_(order), place_(place) {}

  void writeList(const std::vector<NodeId>& ids) {
    html_.open("ol", {{"class", "elements"}, {"role", "list"}});
    for (const NodeId id : ids) writeItem(*snapshot_.node(id));
    html_.close();
  }

 private:
  std::string idOf(const Node& node) const {
    return place_.id + "-" + std::to_string(node.id - snapshot_.nodes().front().id + 1);
  }

  void writeNumber(const char* element, const Node& node) {
    const std::size_t number = order_.numberOf(node);
    if (number == 0) return;
    html_.element(element, {{"class", "number"}}, formatting::plainIntegerString(std::int64_t(number)));
  }

  void writeItem(const Node& node) {
    html_.open("li", {{"id", idOf(node)}});
    writeNumber("span", node);
    html_.open("div", {{"class", "line"}});
    if (node.isElement) addElementLine(html_, node, idOf(node), place_.headingLevel);
    if (node.series) {
      writeChart(node);
    } else if (!node.isElement) {
      writeGroup(node);
    } else if (!node.children.empty()) {
      writeList(node.children);
    }
    html_.close().close();
  }

  void writeGroup(const Node& node) {
    const std::string name = nameOf(node);
    const std::string id = idOf(node) + "-name";
    html_.open("div", {{"class", "group"},
                       {"role", "group"},
                       {"aria-labelledby", name.empty() ? std::nullopt : std::optional(id)}});
    if (!name.empty()) html_.element("p", {{"class", "caption"}, {"id", id}}, name);
    addStateWords(html_, node);
    writeList(node.children);
    html_.close();
  }

  void writeChart(const Node& chart) {
    openChartFigure(html_, snapshot_, chart, idOf(chart));
    if (place_.hasSound) addChartPlayer(html_, snapshot_, chart);
    std::vector<NodeId> lines;
    std::vector<const Node*> rows;
    for (const NodeId id : chart.children) {
      const Node& child = *snapshot_.node(id);
      const bool isRow = isPlain(child);
      if (isRow) writeLines(lines);
      if (!isRow) writeRows(rows);
      if (isRow) rows.push_back(&child);
      if (!isRow) lines.push_back(id);
    }
    writeLines(lines);
    writeRows(rows);
    if (chart.children.empty()) addSliceTable(html_, *chart.series);
    html_.close();
  }

  void writeLines(std::vector<NodeId>& lines) {
    if (!lines.empty()) writeList(lines);
    lines.clear();
  }

  void writeRows(std::vector<const Node*>& rows) {
    if (rows.empty()) return;
    ChartTable table(html_, rows);
    for (const Node* row : rows) {
      html_.open("tr", {{"id", idOf(*row)}});
      writeNumber("td", *row);
      table.addCells(*row);
      html_.close();
    }
    table.close();
    rows.clear();
  }

  Markup& html_;
  const Snapshot& snapshot_;
  const ReadingOrder& order_;
  const PlaceOnPage& place_;
};

}  // namespace

void addElementList(Markup& html, const Snapshot& snapshot, const ReadingOrder& order,
                    const PlaceOnPage& place) {
  ListWriter(html, snapshot, order, place).writeList(snapshot.topNodes());
}

}  // namespace ax::reader
