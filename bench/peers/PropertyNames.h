#pragma once

namespace bench {

// Read by turns, in batches of a multiple of their number.
inline constexpr const char* propertyNames[] = {"titleLabel",
                                                "valueLabel",
                                                "distanceLabel",
                                                "durationLabel",
                                                "activeEnergyLabel",
                                                "paceLabel",
                                                "weatherConditionImageView",
                                                "numberOfWorkoutsLabel"};

}  // namespace bench
