#pragma once

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

// Pieces of scenes, as they are written.
namespace ax::reader {

// An instant to the millisecond, with the offset of the current time zone.
nlohmann::ordered_json sceneDate(double time);
// Not rounded: the app does so once, where it shows the figure.
nlohmann::ordered_json sceneQuantity(double value, const std::string& unit);
// A text of the app's own, by its key.
nlohmann::ordered_json appText(const std::string& key);
nlohmann::ordered_json sceneReference(const std::string& id);

// `members` is an object, in the order in which its keys are to be set. No id when `id` is empty.
nlohmann::ordered_json sceneObject(const std::string& className, nlohmann::ordered_json members,
                                   const std::string& id = {});
nlohmann::ordered_json sceneLabel(nlohmann::ordered_json text);

// The rows of a table, one below the other.
class SceneRows {
 public:
  // Gives the row, an object, its frame.
  void add(nlohmann::ordered_json row, double height);
  // The table, as high as its rows.
  nlohmann::ordered_json table() const;

 private:
  std::vector<nlohmann::ordered_json> rows_;
  double height_ = 0;
};

}  // namespace ax::reader
