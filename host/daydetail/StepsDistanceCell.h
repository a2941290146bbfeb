#pragma once

#include "platform/toolkit/Label.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// A day's steps, distance and flights climbed: three captions, each over its figure.
class StepsDistanceCell : public TableViewCell {
 public:
  static Class& staticClass();

  // Makes the labels that are missing and puts all of them into the cell.
  void setupSubviews();
  // Sets the cell up at its first layout pass.
  void layoutSubviews() override;

 private:
  Ref<Label> stepsTitle_, stepsValue_;
  Ref<Label> distanceTitle_, distanceValue_;
  Ref<Label> flightsTitle_, flightsValue_;
  bool isSetUp_ = false;
};

}  // namespace ax::host
