#pragma once

#include <nlohmann/json.hpp>
#include <optional>
#include <vector>

#include "apps/axvelto/Command.h"
#include "apps/shared/ShownScene.h"

namespace ax::app {

// What a scene did when it ran.
struct Outcome {
  nlohmann::ordered_json document;                             // what `ask` prints
  nlohmann::ordered_json whole;                                // what a scene may expect of the whole
  std::vector<std::optional<nlohmann::ordered_json>> replies;  // of each step
};

// Reads what the screen says when it is presented, as far as the scene expects it, and then runs the steps.
Outcome runScene(ShownScene& shown);

// Whether everything is as the scene expects. What differs goes to standard error, a line each: its pointer,
// what was expected and what was found.
bool holds(const reader::Scene& scene, const Outcome& outcome);

// Writes the outcome into the scene's file as what it expects, keeping the layout. Members that an
// expectation leaves out stay out. Throws a Fault for a file that cannot be written.
ExitCode accept(const reader::Scene& scene, const Outcome& outcome);

}  // namespace ax::app
