#include "reader/page/ChartFigure.h"

#include <algorithm>

#include "reader/graph/ChartDescription.h"
#include "reader/page/ElementLine.h"
#include "reader/picture/ScreenPicture.h"
#include "reader/speech/ChartWords.h"
#include "reader/speech/SpokenTime.h"
#include "reader/text/ReaderStrings.h"

namespace ax::reader {

namespace {

void openTable(Markup& html, const std::string& caption, const std::vector<std::string>& columns) {
  html.open("table").element("caption", {}, caption);
  html.open("thead").open("tr");
  for (const std::string& column : columns) html.element("th", {{"scope", "col"}}, column);
  html.close().close().open("tbody");
}

std::string countText(std::string_view key, std::size_t count) {
  return readerText(key, {static_cast<std::int64_t>(count)});
}

}  // namespace

std::string captionOf(const Snapshot& snapshot, const Node& chart) {
  const std::string name = nameOfChart(snapshot, chart);
  return name.empty() ? readerText("chart.untitled") : name;
}

void openChartFigure(Markup& html, const Snapshot& snapshot, const Node& chart, const std::string& id) {
  html.open("figure", {{"class", "chart"}, {"aria-labelledby", id + "-caption"}});
  html.element("span", {{"class", "role"}, {"aria-hidden", "true"}}, readerText("role.chart"));
  html.element("figcaption", {{"id", id + "-caption"}}, captionOf(snapshot, chart));
  html.raw(chartPicture(snapshot, chart, headingOf(snapshot, chart)));
}

void addSliceTable(Markup& html, const DataSeries& series) {
  if (series.slices.empty()) return;
  openTable(html, countText("chart.slices", series.slices.size()),
            {readerText("page.time"), readerText("page.value")});
  for (const DataSlice& slice : series.slices) {
    const bool isTold = slice.quantity && !slice.quantity->text.empty();
    html.open("tr").element("th", {{"scope", "row"}}, spokenSpan(slice));
    html.element("td", {}, isTold ? withSpokenTimes(slice.quantity) : readerText("chart.no.data")).close();
  }
  html.close().close();
}

ChartTable::ChartTable(Markup& html, const std::vector<const Node*>& rows)
    : html_(html), hasValues_(std::ranges::any_of(rows, [](const Node* row) {
        return row->value && !row->value->text.empty();
      })) {
  std::vector<std::string> columns = {readerText("page.number"), readerText("page.name")};
  if (hasValues_) columns.push_back(readerText("page.value"));
  openTable(html, countText("chart.elements", rows.size()), columns);
}

void ChartTable::addCells(const Node& row) {
  html_.element("th", {{"scope", "row"}}, nameOf(row));
  if (hasValues_) html_.element("td", {}, withSpokenTimes(row.value));
}

void ChartTable::close() {
  html_.close().close();
}

}  // namespace ax::reader
