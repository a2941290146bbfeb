#pragma once

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "reader/importers/WorkoutFileReader.h"

namespace ax::reader::testing {

using Json = nlohmann::ordered_json;

// A workout file of text that must be readable.
inline WorkoutFile fileOf(const std::string& text) {
  WorkoutFileResult result = readWorkoutFile(text, "test");
  EXPECT_TRUE(std::holds_alternative<WorkoutFile>(result)) << text;
  return std::get<WorkoutFile>(std::move(result));
}

inline void collect(const Json& json, const std::string& className, std::vector<Json>& found) {
  if (json.is_object() && json.contains("class") && json["class"] == className) found.push_back(json["set"]);
  if (!json.is_structured()) return;
  for (const Json& item : json) collect(item, className, found);
}

// What is set on every object of a class in a scene's screen, in order.
inline std::vector<Json> all(const Json& scene, const std::string& className) {
  std::vector<Json> found;
  collect(scene["screen"], className, found);
  return found;
}

}  // namespace ax::reader::testing
