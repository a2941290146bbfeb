#include "host/core/Layout.h"

#include <algorithm>

#include "platform/formatting/Region.h"

namespace ax::host {

void addUnplaced(View& parent, std::initializer_list<Ref<View>> parts) {
  for (const Ref<View>& part : parts) {
    if (part && part->superview() == nullptr) parent.addSubview(part);
  }
}

void addUnplaced(View& parent, const Ref<View>& part, Rect frame) {
  if (!part || part->superview() != nullptr) return;
  if (part->frame().isEmpty()) part->setFrame(frame);
  parent.addSubview(part);
}

void showIn(View& parent, const Ref<View>& part, Rect frame) {
  if (!part) return;
  if (part->frame().isEmpty()) part->setFrame(inDirection(parent, frame));
  if (part->superview() == nullptr) parent.addSubview(part);
}

void stackIn(View& parent, Size size, std::initializer_list<Ref<View>> parts) {
  const double height = size.height / static_cast<double>(std::max<std::size_t>(parts.size(), 1));
  double top = 0;
  for (const Ref<View>& part : parts) {
    showIn(parent, part, {0, top, size.width, height});
    top += height;
  }
}

void stackIn(View& parent, std::initializer_list<Ref<View>> parts) {
  stackIn(parent, {parent.frame().width, parent.frame().height}, parts);
}

void stackIn(TableViewCell& cell, std::initializer_list<Ref<View>> parts) {
  stackIn(*cell.contentView(), {cell.frame().width, cell.frame().height}, parts);
}

Rect inDirection(const View& view, Rect frame) {
  const bool turns = view.changesSides() && formatting::currentLanguageIsRightToLeft();
  if (turns) frame.x = view.frame().width - frame.maxX();
  return frame;
}

Rect columnOf(const View& view, std::size_t index, std::size_t count) {
  const double width = view.frame().width / static_cast<double>(count);
  return {static_cast<double>(index) * width, 0, width, view.frame().height};
}

}  // namespace ax::host
