#include "host/trends/TrendPairTableViewCell.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& TrendPairTableViewCell::staticClass() {
  using T = TrendPairTableViewCell;
  static Class& result = ClassBuilder<T>("Velto.TrendPairTableViewCell", TableViewCell::staticClass())
                             .property<&T::leadingView, &T::setLeadingView>("leadingView")
                             .property<&T::trailingView, &T::setTrailingView>("trailingView")
                             .property<&T::leadingButton, &T::setLeadingButton>("leadingButton")
                             .property<&T::trailingButton, &T::setTrailingButton>("trailingButton")
                             .build();
  return result;
}

void TrendPairTableViewCell::layoutSubviews() {
  addUnplaced(*contentView(), leadingView_, inDirection(*this, columnOf(*this, 0, 2)));
  addUnplaced(*contentView(), trailingView_, inDirection(*this, columnOf(*this, 1, 2)));
  addUnplaced(*contentView(), leadingButton_, inDirection(*this, columnOf(*this, 0, 2)));
  addUnplaced(*contentView(), trailingButton_, inDirection(*this, columnOf(*this, 1, 2)));
}

static const RegisteredClass<TrendPairTableViewCell> registered;

}  // namespace ax::host
