#include "host/trends/TrendListHeaderView.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

static constexpr double lineHeight = 24;

Class& TrendListHeaderView::staticClass() {
  using T = TrendListHeaderView;
  static Class& result = ClassBuilder<T>("Velto.TrendListHeaderView", View::staticClass())
                             .property<&T::titleLabel, &T::setTitleLabel>("titleLabel")
                             .property<&T::linkView, &T::setLinkView>("linkView")
                             .build();
  return result;
}

void TrendListHeaderView::layoutSubviews() {
  addUnplaced(*this, titleLabel_, {0, 0, frame().width, lineHeight});
  _accessibilityAddTrait(titleLabel_, TraitHeader);
  addUnplaced(*this, linkView_, {0, lineHeight, frame().width, lineHeight});
}

static const RegisteredClass<TrendListHeaderView> registered;

}  // namespace ax::host
