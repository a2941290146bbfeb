#pragma once

#include <algorithm>
#include <random>

#include "tests/reader/ScreenPieces.h"

namespace ax::reader::testing {

// A tree of views made by chance, whose reading order is known because it is laid out in that order: every
// child fills one place of a grid, row after row, and only then are the children shuffled for drawing.
class RandomScreen {
 public:
  explicit RandomScreen(unsigned seed, bool isRightToLeft = false)
      : random_(seed), isRightToLeft_(isRightToLeft) {
    root_ = group(0, true);
  }

  const Ref<View>& root() const { return root_; }
  // The labels of all that can be seen, in reading order.
  const std::vector<std::string>& spoken() const { return spoken_; }
  // Every view that speaks, seen or not.
  const std::vector<Ref<View>>& speakers() const { return speakers_; }

 private:
  int upTo(int most) { return std::uniform_int_distribution(0, most)(random_); }

  Ref<View> group(int depth, bool isSeen) {
    const Ref<View> result = view({}, {0, 0, 300, 300});
    const int columns = 1 + upTo(2);
    std::vector<Ref<View>> children;
    for (int place = 0, count = 1 + upTo(5); place < count; ++place) {
      const Ref<View> child = part(depth + 1, isSeen);
      const int column = isRightToLeft_ ? columns - 1 - place % columns : place % columns;
      child->setFrame({column * 100.0, place / columns * 100.0, 100, 100});
      children.push_back(child);
    }
    std::shuffle(children.begin(), children.end(), random_);
    for (const Ref<View>& child : children) result->addSubview(child);
    return result;
  }

  Ref<View> part(int depth, bool isSeen) {
    const int kind = upTo(9);
    const bool isShown = isSeen && kind != 0;
    const bool isGroup = depth < 5 && kind % 2 == 0;
    Ref<View> result = isGroup ? group(depth, isShown) : speaker(isShown);
    if (kind == 0 && upTo(1) == 0) {
      result->setHidden(true);
    } else if (kind == 0) {
      result->setAlpha(0);
    } else if (kind == 8 && isGroup) {
      messages::setAccessibilityLabel(result, string("section"));
    }
    return result;
  }

  // A label, or a cell that speaks for what is in it.
  Ref<View> speaker(bool isSeen) {
    const std::string name = "speaker " + std::to_string(speakers_.size());
    Ref<View> result = label(name);
    if (upTo(3) == 0) {
      result = view({label("never spoken by itself")});
      messages::setIsAccessibilityElement(result, true);
      messages::setAccessibilityLabel(result, string(name));
    }
    if (isSeen) spoken_.push_back(name);
    speakers_.push_back(result);
    return result;
  }

  std::mt19937 random_;
  const bool isRightToLeft_;
  Ref<View> root_;
  std::vector<std::string> spoken_;
  std::vector<Ref<View>> speakers_;
};

}  // namespace ax::reader::testing
