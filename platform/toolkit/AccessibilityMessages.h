#pragma once

#include "platform/foundation/Array.h"
#include "platform/foundation/String.h"
#include "platform/runtime/Message.h"
#include "platform/toolkit/Traits.h"

// The accessibility properties as messages: what a screen reader asks, what categories override, and what
// sets them. Every object that the toolkit shows answers them; a String answers those of labels.
namespace ax::messages {

inline const Message<bool()> isAccessibilityElement{"isAccessibilityElement"};
inline const Message<Ref<String>()> accessibilityLabel{"accessibilityLabel"};
inline const Message<Ref<String>()> accessibilityValue{"accessibilityValue"};
inline const Message<Ref<String>()> accessibilityHint{"accessibilityHint"};
inline const Message<Traits()> accessibilityTraits{"accessibilityTraits"};
inline const Message<Rect()> accessibilityFrame{"accessibilityFrame"};
inline const Message<Ref<Array>()> accessibilityElements{"accessibilityElements"};
inline const Message<Ref<Object>()> accessibilityContainer{"accessibilityContainer"};
inline const Message<Point()> accessibilityActivationPoint{"accessibilityActivationPoint"};
inline const Message<Ref<String>()> accessibilityUserDefinedLabel{"accessibilityUserDefinedLabel"};
inline const Message<std::int64_t()> accessibilityContainerType{"accessibilityContainerType"};
inline const Message<Ref<Object>()> accessibilityPath{"accessibilityPath"};
inline const Message<bool()> accessibilityViewIsModal{"accessibilityViewIsModal"};
inline const Message<bool()> accessibilityActivate{"accessibilityActivate"};
inline const Message<void()> accessibilityIncrement{"accessibilityIncrement"};
inline const Message<void()> accessibilityDecrement{"accessibilityDecrement"};
// 1 expanded, 2 collapsed, 0 neither.
inline const Message<std::int64_t()> _accessibilityExpandedStatus{"_accessibilityExpandedStatus"};
// The element under a point in the receiver's own space; the second argument is the event, which may be nil.
inline const Message<Ref<Object>(Point, Ref<Object>)> _accessibilityHitTest{
    "_accessibilityHitTest:withEvent:"};

inline const Message<void(bool)> setIsAccessibilityElement{"setIsAccessibilityElement:"};
inline const Message<void(Ref<String>)> setAccessibilityLabel{"setAccessibilityLabel:"};
inline const Message<void(Ref<String>)> setAccessibilityValue{"setAccessibilityValue:"};
inline const Message<void(Ref<String>)> setAccessibilityHint{"setAccessibilityHint:"};
inline const Message<void(Traits)> setAccessibilityTraits{"setAccessibilityTraits:"};
inline const Message<void(Rect)> setAccessibilityFrame{"setAccessibilityFrame:"};
inline const Message<void(Ref<Array>)> setAccessibilityElements{"setAccessibilityElements:"};
inline const Message<void(Ref<Object>)> setAccessibilityContainer{"setAccessibilityContainer:"};

// The hook in which a category sets up labels, traits and elements once.
inline const Message<void()> _accessibilityLoadAccessibilityInformation{
    "_accessibilityLoadAccessibilityInformation"};

// Life-cycle methods of views and controllers.
inline const Message<void()> layoutSubviews{"layoutSubviews"};
inline const Message<void()> loadView{"loadView"};
inline const Message<void()> viewDidLoad{"viewDidLoad"};

}  // namespace ax::messages
