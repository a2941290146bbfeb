#include "host/trends/TrendDetailSummaryView.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

static constexpr double lineHeight = 24;

Class& TrendDetailSummaryView::staticClass() {
  using T = TrendDetailSummaryView;
  static Class& result = ClassBuilder<T>("Velto.TrendDetailSummaryView", View::staticClass())
                             .property<&T::titleLabel, &T::setTitleLabel>("titleLabel")
                             .property<&T::summaryLabel, &T::setSummaryLabel>("summaryLabel")
                             .property<&T::coachingLabel, &T::setCoachingLabel>("coachingLabel")
                             .build();
  return result;
}

void TrendDetailSummaryView::layoutSubviews() {
  addUnplaced(*this, titleLabel_, {0, 0, frame().width, lineHeight});
  _accessibilityAddTrait(titleLabel_, TraitHeader);
  addUnplaced(*this, summaryLabel_, {0, lineHeight, frame().width, lineHeight});
  addUnplaced(*this, coachingLabel_, {0, 2 * lineHeight, frame().width, lineHeight});
}

static const RegisteredClass<TrendDetailSummaryView> registered;

}  // namespace ax::host
