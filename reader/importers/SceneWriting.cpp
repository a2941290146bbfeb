#include "reader/importers/SceneWriting.h"

#include <cmath>
#include <cstdio>

#include "platform/formatting/IsoTime.h"

namespace ax::reader {

using Json = nlohmann::ordered_json;

namespace {

constexpr double screenWidth = 390;

Json rect(double y, double height) {
  return {{"rect", {0, y, screenWidth, height}}};
}

}  // namespace

Json sceneDate(double time) {
  constexpr std::size_t endOfSeconds = 19;  // of "2026-03-08T14:30:00"
  const double milliseconds = std::round(time * 1000);
  const double seconds = std::floor(milliseconds / 1000);
  std::string text = formatting::isoWithOffset(seconds);
  if (const int rest = static_cast<int>(milliseconds - seconds * 1000); rest != 0) {
    char fraction[8];
    std::snprintf(fraction, sizeof fraction, ".%03d", rest);
    text.insert(endOfSeconds, fraction);
  }
  return {{"date", text}};
}

Json sceneQuantity(double value, const std::string& unit) {
  return {{"quantity", {value, unit}}};
}

Json appText(const std::string& key) {
  return {{"localized", key}};
}

Json sceneReference(const std::string& id) {
  return {{"ref", id}};
}

Json sceneObject(const std::string& className, Json members, const std::string& id) {
  Json object = {{"class", className}};
  if (!id.empty()) object["id"] = id;
  object["set"] = std::move(members);
  return object;
}

Json sceneLabel(Json text) {
  return sceneObject("Label", {{"text", std::move(text)}});
}

void SceneRows::add(Json row, double height) {
  Json placed = {{"frame", rect(height_, height)}};
  placed.update(row["set"]);
  row["set"] = std::move(placed);
  rows_.push_back(std::move(row));
  height_ += height;
}

Json SceneRows::table() const {
  Json table = sceneObject("View", {{"frame", rect(0, height_)}});
  table["subviews"] = rows_;
  return table;
}

}  // namespace ax::reader
