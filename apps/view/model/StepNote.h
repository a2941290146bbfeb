#pragma once

#include <optional>

#include "apps/view/model/ChartTour.h"

namespace ax::view {

// How one step of a chart sounds.
struct StepNote {
  double height = 0;  // between the ends of the vertical axis, from 0 to 1
  double place = 0;   // along the horizontal axis, from 0 to 1
  bool operator==(const StepNote&) const = default;
};

// The note of a chart's step: that of its value; of a bar that stands for several, their average. Nothing
// for a step without a figure, and where steps and values cannot be matched. `chart` is an item with a
// series, `steps` are those of stepsOfChart, `at` is one of them.
std::optional<StepNote> noteOfStep(const ScreenModel& model, const Item& chart,
                                   const std::vector<ChartStep>& steps, std::size_t at);

}  // namespace ax::view
