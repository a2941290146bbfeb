#include "host/core/Layout.h"

#include "platform/formatting/Region.h"

namespace ax::host {

void addUnplaced(View& parent, std::initializer_list<Ref<View>> parts) {
  for (const Ref<View>& part : parts) {
    if (part && part->superview() == nullptr) parent.addSubview(part);
  }
}

void addUnplaced(View& parent, const Ref<View>& part, Rect frame) {
  if (!part || part->superview() != nullptr) return;
  if (part->frame() == Rect()) part->setFrame(frame);
  parent.addSubview(part);
}

Rect inDirection(const View& view, Rect frame) {
  if (formatting::currentLanguageIsRightToLeft()) frame.x = view.frame().width - frame.maxX();
  return frame;
}

Rect columnOf(const View& view, std::size_t index, std::size_t count) {
  const double width = view.frame().width / static_cast<double>(count);
  return {static_cast<double>(index) * width, 0, width, view.frame().height};
}

}  // namespace ax::host
