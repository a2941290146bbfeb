#pragma once

#include <initializer_list>
#include <string>
#include <vector>

#include "platform/toolkit/AccessibilityElement.h"
#include "platform/toolkit/Control.h"
#include "platform/toolkit/Label.h"
#include "platform/toolkit/ViewController.h"
#include "reader/snapshot/Snapshot.h"

// Small screens for the reader's tests.
namespace ax::reader::testing {

inline Ref<Label> label(const std::string& text, Rect frame = {0, 0, 100, 20}) {
  Ref<Label> result = make<Label>();
  result->setText(string(text));
  result->setFrame(frame);
  return result;
}

inline Ref<Button> button(const std::string& title, Rect frame = {0, 0, 100, 20}) {
  Ref<Button> result = make<Button>();
  result->setTitle(string(title));
  result->setFrame(frame);
  return result;
}

template <class T = View>
Ref<T> view(std::initializer_list<Ref<View>> subviews, Rect frame = {0, 0, 400, 800}) {
  Ref<T> result = make<T>();
  result->setFrame(frame);
  for (const Ref<View>& subview : subviews) result->addSubview(subview);
  return result;
}

inline Ref<AccessibilityElement> element(const std::string& text, Receiver container = nullptr) {
  Ref<AccessibilityElement> result = AccessibilityElement::initWithAccessibilityContainer(container);
  messages::setAccessibilityLabel(result, string(text));
  return result;
}

// The labels of the elements, in reading order.
inline std::vector<std::string> labels(const Snapshot& snapshot) {
  std::vector<std::string> all;
  for (const Node& node : snapshot.nodes()) {
    if (node.isElement) all.push_back(node.label ? node.label->text : "(nil)");
  }
  return all;
}

}  // namespace ax::reader::testing
