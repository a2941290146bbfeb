#pragma once

#include "platform/toolkit/Label.h"

namespace ax::host {

// Covers a screen while its data arrive, with a word in the middle.
class LoadingView : public View {
 public:
  static Class& staticClass();

  void layoutSubviews() override;

 private:
  Ref<Label> label_;
};

}  // namespace ax::host
