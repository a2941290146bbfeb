#pragma once

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "reader/importers/WorkoutFileReader.h"
#include "reader/importers/WorkoutScene.h"

namespace ax::reader::testing {

using Json = nlohmann::ordered_json;

// A workout file of text that must be readable.
inline WorkoutFile fileOf(const std::string& text) {
  WorkoutFileResult result = readWorkoutFile(text, "test");
  EXPECT_TRUE(std::holds_alternative<WorkoutFile>(result)) << text;
  return std::get<WorkoutFile>(std::move(result));
}

// The scene of a file's one workout, or of its several.
inline Json sceneOfFile(const WorkoutFile& file, const WorkoutSceneOptions& options = {}) {
  return file.activities.size() == 1 ? workoutScene(file.activities.front(), options)
                                     : workoutListScene(file.activities, options);
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

// The value under a title in a scene's pairs of figures; null when no pair has it.
inline Json figure(const Json& scene, const std::string& titleKey) {
  for (const Json& pair : all(scene, "CHWorkoutDetailTwoValueTableViewCell")) {
    for (const auto& [title, value] : {std::pair("title1", "value1"), std::pair("title2", "value2")}) {
      if (pair[title].is_object() && pair[title]["localized"] == titleKey) return pair[value];
    }
  }
  return nullptr;
}

}  // namespace ax::reader::testing
