#include "reader/scene/Mirroring.h"

#include "platform/runtime/KeyReading.h"
#include "platform/toolkit/ScrollView.h"
#include "platform/toolkit/TreeDepth.h"
#include "platform/toolkit/ViewController.h"

namespace ax::reader {

namespace {

template <class T>
void turnAround(T& part, double width) {
  const Rect frame = part.frame();
  if (frame != Rect()) part.setFrame({width - frame.maxX(), frame.y, frame.width, frame.height});
}

bool hasPages(View& view) {
  const ScrollView* scroll = cast<ScrollView>(&view);
  return scroll != nullptr && scroll->contentSize().width > scroll->frame().width;
}

void mirrorParts(View& view, const PlacedTest& isPlaced, std::size_t level) {
  if (!isWithinDepth(level)) return;
  const double width = view.frame().width;
  const bool turns = width > 0 && view.changesSides() && !hasPages(view);
  for (const Ref<View>& part : view.subviews()) {
    if (turns && isPlaced(*part) && part->changesSides()) turnAround(*part, width);
    mirrorParts(*part, isPlaced, level + 1);
  }
  if (!turns || view.layerIfAny() == nullptr) return;
  for (const Ref<Layer>& part : view.layerIfAny()->sublayers()) {
    if (isPlaced(*part)) turnAround(*part, width);
  }
}

}  // namespace

void mirror(const Ref<Object>& screen, const PlacedTest& isPlaced) {
  const bool isController = cast<ViewController>(screen.get()) != nullptr;
  const Ref<View> view = isController ? safeUIViewForKey(screen, "view"_key) : cast<View>(screen);
  if (view) mirrorParts(*view, isPlaced, 0);
}

}  // namespace ax::reader
