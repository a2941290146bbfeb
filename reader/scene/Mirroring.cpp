#include "reader/scene/Mirroring.h"

#include "platform/runtime/KeyReading.h"
#include "platform/toolkit/ScrollView.h"
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

void mirrorParts(View& view) {
  const double width = view.frame().width;
  const bool turns = width > 0 && !hasPages(view);
  for (const Ref<View>& part : view.subviews()) {
    if (turns) turnAround(*part, width);
    mirrorParts(*part);
  }
  if (!turns || view.layerIfAny() == nullptr) return;
  for (const Ref<Layer>& part : view.layerIfAny()->sublayers()) turnAround(*part, width);
}

}  // namespace

void mirror(const Ref<Object>& screen) {
  const bool isController = cast<ViewController>(screen.get()) != nullptr;
  const Ref<View> view = isController ? safeUIViewForKey(screen, "view"_key) : cast<View>(screen);
  if (view) mirrorParts(*view);
}

}  // namespace ax::reader
