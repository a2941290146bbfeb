#include "host/trends/TrendingUpTableViewCell.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& TrendingUpTableViewCell::staticClass() {
  using T = TrendingUpTableViewCell;
  static Class& result = ClassBuilder<T>("Velto.TrendingUpTableViewCell", TableViewCell::staticClass())
                             .property<&T::leadingView, &T::setLeadingView>("leadingView")
                             .property<&T::trailingView, &T::setTrailingView>("trailingView")
                             .build();
  return result;
}

void TrendingUpTableViewCell::layoutSubviews() {
  addUnplaced(*contentView(), leadingView_, inDirection(*this, columnOf(*this, 0, 2)));
  addUnplaced(*contentView(), trailingView_, inDirection(*this, columnOf(*this, 1, 2)));
}

static const RegisteredClass<TrendingUpTableViewCell> registered;

}  // namespace ax::host
