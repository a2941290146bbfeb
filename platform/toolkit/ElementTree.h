#pragma once

#include <functional>

#include "platform/foundation/Array.h"
#include "platform/runtime/KeyReading.h"
#include "platform/toolkit/Responder.h"

// Where elements stand among each other and on the screen. Main thread only; nil receivers have no
// relatives, no frame, and are not visible.
namespace ax {

using ElementTest = std::function<bool(Object&)>;

// Ancestors are followed through accessibilityContainer: a view's superview, a layer's superlayer and then
// its view, an element's container. Containers that form a ring are each asked, and then there are no more.
// Neither up nor down is anything followed further than deepestLevel, nor more than mostObjects met.
Ref<Object> _accessibilityAncestorIsKindOf(Receiver receiver, const Class* ancestorClass);
Ref<Object> _accessibilityFindAncestor(Receiver receiver, const ElementTest& test, bool startWithSelf);

// Views below the receiver, depth first in subview order.
Ref<Array> _accessibilityFindSubviewDescendantsPassingTest(Receiver receiver, const ElementTest& test);
// Accessibility descendants: what `accessibilityElements` lists where there is a list, else subviews and
// sublayers.
Ref<Array> _accessibilityFindUnsortedDescendantsPassingTest(Receiver receiver, const ElementTest& test);
// Visits the accessibility descendants, each before its own; a visit that answers false keeps the walk out of
// that one. What lists itself, or something that it lies in, is not visited once more.
void visitDescendants(Receiver parent, const ElementTest& visit);

// Not hidden and not transparent, up to the root or to the first that was marked as visible and as
// overriding invisibility.
bool _accessibilityViewIsVisible(Receiver receiver);

// The subviews and the layers drawn in a view, in the order in which the host added them, subviews first.
std::vector<Ref<Object>> drawnChildren(Object& parent);

// The union of the elements' frames, in screen space; the zero rect for none.
Rect frameForElements(const Ref<Array>& elements);
// The rect, given in the view's space, in screen space; unchanged without a view.
Rect convertFrameToScreenCoordinates(Rect rect, Receiver view);

// -1, 0 or 1: by rows from top to bottom, then in the direction of the language. Two elements stand in one
// row when the upper one's middle lies below the lower one's top.
int accessibilityCompareGeometry(Object& a, Object& b);
// A new list in that order; elements in the same place keep theirs.
Ref<Array> sortedByGeometry(const Array& elements);

}  // namespace ax
