#pragma once

#include "platform/toolkit/View.h"

namespace ax {

// Shows a part of a larger content: the part that begins at the content offset.
class ScrollView : public View {
 public:
  static Class& staticClass();

  Point contentOffset() const { return contentOffset_; }
  void setContentOffset(Point offset) { contentOffset_ = offset; }
  Size contentSize() const { return contentSize_; }
  void setContentSize(Size size) { contentSize_ = size; }
  Point boundsOrigin() const override { return contentOffset_; }

 private:
  Point contentOffset_;
  Size contentSize_;
};

}  // namespace ax
