#pragma once

#include "platform/foundation/Array.h"
#include "platform/foundation/String.h"
#include "platform/runtime/Geometry.h"
#include "platform/runtime/SafeMessage.h"

namespace ax {
class Image;
class ImageView;
class Label;
class Layer;
class NavigationItem;
class Unit;
class View;
}  // namespace ax

// What the system's own classes answer besides accessibility. A host may derive from them and answer
// differently, so whoever works on objects of the host sends these instead of calling the C++ members. What
// the host raises counts as nil, NO or 0, and so does an object of another class than the message names.
// Include the class's own header where the answer is used.
namespace ax::messages {

inline constinit const SafeMessage<Rect()> frame{"frame"};
inline constinit const SafeMessage<Rect()> bounds{"bounds"};
inline constinit const SafeMessage<Point()> center{"center"};
inline constinit const SafeMessage<bool()> isHidden{"isHidden"};
inline constinit const SafeMessage<Ref<Array>()> subviews{"subviews"};
inline constinit const SafeMessage<Ref<Layer>()> layer{"layer"};
inline constinit const SafeMessage<Ref<Array>()> sublayers{"sublayers"};
inline constinit const SafeMessage<double()> opacity{"opacity"};
inline constinit const SafeMessage<Ref<String>()> text{"text"};
inline constinit const SafeMessage<Ref<String>()> title{"title"};
inline constinit const SafeMessage<Ref<String>()> string{"string"};
inline constinit const SafeMessage<Ref<Image>()> image{"image"};
inline constinit const SafeMessage<Ref<View>()> contentView{"contentView"};
inline constinit const SafeMessage<Ref<Label>()> textLabel{"textLabel"};
inline constinit const SafeMessage<Ref<ImageView>()> imageView{"imageView"};
inline constinit const SafeMessage<Ref<View>()> view{"view"};
inline constinit const SafeMessage<Ref<NavigationItem>()> navigationItem{"navigationItem"};
inline constinit const SafeMessage<Ref<Array>()> rightBarButtonItems{"rightBarButtonItems"};
inline constinit const SafeMessage<Selector()> action{"action"};
inline constinit const SafeMessage<std::int64_t()> currentPage{"currentPage"};
inline constinit const SafeMessage<void(std::int64_t)> setCurrentPage{"setCurrentPage:"};
inline constinit const SafeMessage<Point()> contentOffset{"contentOffset"};
inline constinit const SafeMessage<void(Point)> setContentOffset{"setContentOffset:"};
inline constinit const SafeMessage<void(Rect)> setAccessibilityFrameInContainerSpace{
    "setAccessibilityFrameInContainerSpace:"};

inline constinit const SafeMessage<Ref<String>()> unitString{"unitString"};
// Of a quantity.
inline constinit const SafeMessage<double(Ref<Unit>)> doubleValueForUnit{"doubleValueForUnit:"};
inline constinit const SafeMessage<bool(Ref<Unit>)> isCompatibleWithUnit{"isCompatibleWithUnit:"};

}  // namespace ax::messages
