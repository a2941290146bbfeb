#pragma once

#include "platform/foundation/Array.h"
#include "platform/foundation/String.h"
#include "platform/runtime/Message.h"
#include "platform/toolkit/Traits.h"

// The accessibility properties as messages: what a screen reader asks, what categories override, and what
// sets them. Every object that the toolkit shows answers them; a String answers those of labels.
namespace ax {
enum ExpandedStatus : std::int64_t { notExpandable = 0, isExpanded = 1, isCollapsed = 2 };
}

namespace ax::messages {

inline constinit const Message<bool()> isAccessibilityElement{"isAccessibilityElement"};
inline constinit const Message<Ref<String>()> accessibilityLabel{"accessibilityLabel"};
inline constinit const Message<Ref<String>()> accessibilityValue{"accessibilityValue"};
inline constinit const Message<Ref<String>()> accessibilityHint{"accessibilityHint"};
inline constinit const Message<Traits()> accessibilityTraits{"accessibilityTraits"};
inline constinit const Message<Rect()> accessibilityFrame{"accessibilityFrame"};
inline constinit const Message<Ref<Array>()> accessibilityElements{"accessibilityElements"};
inline constinit const Message<Ref<Object>()> accessibilityContainer{"accessibilityContainer"};
inline constinit const Message<Point()> accessibilityActivationPoint{"accessibilityActivationPoint"};
inline constinit const Message<Ref<String>()> accessibilityUserDefinedLabel{"accessibilityUserDefinedLabel"};
inline constinit const Message<std::int64_t()> accessibilityContainerType{"accessibilityContainerType"};
inline constinit const Message<Ref<Object>()> accessibilityPath{"accessibilityPath"};
inline constinit const Message<bool()> accessibilityViewIsModal{"accessibilityViewIsModal"};
inline constinit const Message<bool()> accessibilityActivate{"accessibilityActivate"};
inline constinit const Message<void()> accessibilityIncrement{"accessibilityIncrement"};
inline constinit const Message<void()> accessibilityDecrement{"accessibilityDecrement"};
// An ExpandedStatus.
inline constinit const Message<std::int64_t()> _accessibilityExpandedStatus{"_accessibilityExpandedStatus"};
// The element under a point in the receiver's own space; the second argument is the event, which may be nil.
inline constinit const Message<Ref<Object>(Point, Ref<Object>)> _accessibilityHitTest{
    "_accessibilityHitTest:withEvent:"};

inline constinit const Message<void(bool)> setIsAccessibilityElement{"setIsAccessibilityElement:"};
inline constinit const Message<void(Ref<String>)> setAccessibilityLabel{"setAccessibilityLabel:"};
inline constinit const Message<void(Ref<String>)> setAccessibilityValue{"setAccessibilityValue:"};
inline constinit const Message<void(Ref<String>)> setAccessibilityHint{"setAccessibilityHint:"};
inline constinit const Message<void(Traits)> setAccessibilityTraits{"setAccessibilityTraits:"};
inline constinit const Message<void(Rect)> setAccessibilityFrame{"setAccessibilityFrame:"};
inline constinit const Message<void(Ref<Array>)> setAccessibilityElements{"setAccessibilityElements:"};
inline constinit const Message<void(Ref<Object>)> setAccessibilityContainer{"setAccessibilityContainer:"};

// The hook in which a category sets up labels, traits and elements once.
inline constinit const Message<void()> _accessibilityLoadAccessibilityInformation{
    "_accessibilityLoadAccessibilityInformation"};

// Life-cycle methods of views and controllers.
inline constinit const Message<void()> layoutSubviews{"layoutSubviews"};
inline constinit const Message<void()> loadView{"loadView"};
inline constinit const Message<void()> viewDidLoad{"viewDidLoad"};

}  // namespace ax::messages
