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

inline const SafeMessage<Rect()> frame{"frame"};
inline const SafeMessage<Rect()> bounds{"bounds"};
inline const SafeMessage<Point()> center{"center"};
inline const SafeMessage<bool()> isHidden{"isHidden"};
inline const SafeMessage<Ref<Array>()> subviews{"subviews"};
inline const SafeMessage<Ref<Layer>()> layer{"layer"};
inline const SafeMessage<Ref<Array>()> sublayers{"sublayers"};
inline const SafeMessage<double()> opacity{"opacity"};
inline const SafeMessage<Ref<String>()> text{"text"};
inline const SafeMessage<Ref<String>()> title{"title"};
inline const SafeMessage<Ref<String>()> string{"string"};
inline const SafeMessage<Ref<Image>()> image{"image"};
inline const SafeMessage<Ref<View>()> contentView{"contentView"};
inline const SafeMessage<Ref<Label>()> textLabel{"textLabel"};
inline const SafeMessage<Ref<ImageView>()> imageView{"imageView"};
inline const SafeMessage<Ref<View>()> view{"view"};
inline const SafeMessage<Ref<NavigationItem>()> navigationItem{"navigationItem"};
inline const SafeMessage<Ref<Array>()> rightBarButtonItems{"rightBarButtonItems"};
inline const SafeMessage<Selector()> action{"action"};
inline const SafeMessage<std::int64_t()> currentPage{"currentPage"};
inline const SafeMessage<void(std::int64_t)> setCurrentPage{"setCurrentPage:"};
inline const SafeMessage<Point()> contentOffset{"contentOffset"};
inline const SafeMessage<void(Point)> setContentOffset{"setContentOffset:"};
inline const SafeMessage<void(Rect)> setAccessibilityFrameInContainerSpace{
    "setAccessibilityFrameInContainerSpace:"};

inline const SafeMessage<Ref<String>()> unitString{"unitString"};
// Of a quantity.
inline const SafeMessage<double(Ref<Unit>)> doubleValueForUnit{"doubleValueForUnit:"};
inline const SafeMessage<bool(Ref<Unit>)> isCompatibleWithUnit{"isCompatibleWithUnit:"};

}  // namespace ax::messages
