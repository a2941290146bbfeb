#include "platform/formatting/IsoTime.h"
#include "reader/graph/ChartDescription.h"
#include "reader/snapshot/Charts.h"
#include "reader/text/TextJson.h"

namespace ax::reader {

using Json = nlohmann::ordered_json;

namespace {

Json numberAsJson(const std::optional<double>& number) {
  return number ? Json(*number) : Json();
}

Json axisAsJson(const DataSeriesAxis& axis) {
  Json positions = Json::array();
  for (const auto& [position, text] : axis.positions) {
    positions.push_back({{"position", position}, {"description", textAsJson(text)}});
  }
  return {{"title", textAsJson(axis.title)},
          {"unitLabel", textAsJson(axis.unitLabel)},
          {"minimum", numberAsJson(axis.minimum)},
          {"maximum", numberAsJson(axis.maximum)},
          {"values", axis.values},
          {"positions", positions}};
}

void addSeries(const DataSeries& series, Json& json) {
  json["type"] = series.type;
  json["supportsSummarization"] = series.supportsSummarization;
  json["supportsSonification"] = series.supportsSonification;
  json["axes"] = {axisAsJson(series.axes[horizontalAxis]), axisAsJson(series.axes[verticalAxis])};
}

Json elementsAsJson(const std::vector<const Node*>& elements) {
  Json json = Json::array();
  for (const Node* element : elements) {
    json.push_back({{"label", textAsJson(element->label)},
                    {"value", textAsJson(element->value)},
                    {"frame", rectAsJson(element->frame)}});
  }
  return json;
}

void addSlices(const DataSeries& series, Json& json) {
  json["secondsPerSlice"] = series.secondsPerSlice;
  json["hoursPerSlice"] = series.hoursPerSlice;
  Json slices = Json::array();
  for (const DataSlice& slice : series.slices) {
    slices.push_back({{"start", slice.start}, {"end", slice.end}});
    if (slice.startTime) slices.back()["from"] = formatting::isoWithOffset(*slice.startTime);
    if (slice.endTime) slices.back()["to"] = formatting::isoWithOffset(*slice.endTime);
    slices.back()["quantity"] = textAsJson(slice.quantity);
  }
  json["slices"] = std::move(slices);
}

}  // namespace

Json chartAsJson(const Snapshot& snapshot, const Node& chart) {
  Json json = {{"id", chart.objectId.empty() ? Json() : Json(chart.objectId)}, {"class", chart.className}};
  json["name"] = textAsJson(chart.series->name);
  if (chart.series->hasAxes) addSeries(*chart.series, json);
  json["elements"] = elementsAsJson(elementsOfChart(snapshot, chart));
  if (chart.series->usesSlices) addSlices(*chart.series, json);
  return json;
}

}  // namespace ax::reader
