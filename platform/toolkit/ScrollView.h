#pragma once

#include "platform/toolkit/View.h"

namespace ax {

// Shows a part of a larger content: the part that begins at the content offset.
class ScrollView : public View {
 public:
  static Class& staticClass();

  Point contentOffset() const { return boundsOrigin(); }
  void setContentOffset(Point offset) { setBoundsOrigin(offset); }
  Size contentSize() const { return contentSize_; }
  void setContentSize(Size size) { contentSize_ = size; }

 private:
  Size contentSize_;
};

}  // namespace ax
