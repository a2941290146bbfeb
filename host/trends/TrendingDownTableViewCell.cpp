#include "host/trends/TrendingDownTableViewCell.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& TrendingDownTableViewCell::staticClass() {
  using T = TrendingDownTableViewCell;
  static Class& result = ClassBuilder<T>("Velto.TrendingDownTableViewCell", TableViewCell::staticClass())
                             .property<&T::view, &T::setView>("view")
                             .property<&T::detailLabel, &T::setDetailLabel>("detailLabel")
                             .build();
  return result;
}

void TrendingDownTableViewCell::layoutSubviews() {
  const double height = frame().height / 2;
  addUnplaced(*contentView(), view_, {0, 0, frame().width, height});
  addUnplaced(*contentView(), detailLabel_, {0, height, frame().width, height});
}

static const RegisteredClass<TrendingDownTableViewCell> registered;

}  // namespace ax::host
