#include "bench/Walk.h"

#include <memory>

#include "bench/Sides.h"
#include "platform/toolkit/AccessibilityMessages.h"
#include "platform/toolkit/Label.h"

// Label, traits and frame of every node of a screen: a root, rows in it, nine labels in each row.
namespace bench {

namespace {

using namespace ax;

Ref<View> screen(int nodes) {
  Ref<View> root = make<View>();
  root->setFrame({0, 0, 400, 60.0 * nodes / childrenPerRow});
  for (int made = 1; made < nodes;) {
    Ref<View> row = make<View>();
    row->setFrame({0, 6.0 * made, 400, 60});
    root->addSubview(row);
    ++made;
    for (int i = 0; i < childrenPerRow && made < nodes; ++i, ++made) {
      Ref<Label> label = make<Label>();
      label->setText(string("label " + std::to_string(made)));
      label->setFrame({40.0 * i, 0, 40, 60});
      row->addSubview(label);
    }
  }
  return root;
}

void visit(View& view, Sums& sums) {
  const Ref<String> label = messages::accessibilityLabel(view);
  if (label) sums.bytes += label->text().size();
  sums.traits |= messages::accessibilityTraits(view);
  sums.right += messages::accessibilityFrame(view).maxX();
  for (const Ref<View>& child : view.subviews()) visit(*child, sums);
}

// The same tree and the same answers as virtual functions.
class Node {
 public:
  virtual ~Node() = default;
  virtual Ref<String> label() const { return nullptr; }
  virtual Traits traits() const { return 0; }
  virtual Rect frame() const {
    Rect own = {0, 0, rect.width, rect.height};
    for (const Node* node = this; node != nullptr; node = node->parent) {
      own = own.movedBy({node->rect.x - node->origin.x, node->rect.y - node->origin.y});
    }
    return own;
  }
  void add(std::unique_ptr<Node> child) {
    child->parent = this;
    children.push_back(std::move(child));
  }
  Rect rect;
  Point origin;
  Node* parent = nullptr;
  std::vector<std::unique_ptr<Node>> children;
};

class TextNode final : public Node {
 public:
  explicit TextNode(std::string text) : text_(string(std::move(text))) {}
  Ref<String> label() const override { return text_; }
  Traits traits() const override { return TraitStaticText; }

 private:
  Ref<String> text_;
};

std::shared_ptr<Node> plainScreen(int nodes) {
  auto root = std::make_shared<Node>();
  root->rect = {0, 0, 400, 60.0 * nodes / childrenPerRow};
  for (int made = 1; made < nodes;) {
    auto row = std::make_unique<Node>();
    row->rect = {0, 6.0 * made, 400, 60};
    ++made;
    for (int i = 0; i < childrenPerRow && made < nodes; ++i, ++made) {
      auto text = std::make_unique<TextNode>("label " + std::to_string(made));
      text->rect = {40.0 * i, 0, 40, 60};
      row->add(std::move(text));
    }
    root->add(std::move(row));
  }
  return root;
}

void visit(const Node& node, Sums& sums) {
  const Ref<String> label = node.label();
  if (label) sums.bytes += label->text().size();
  sums.traits |= node.traits();
  sums.right += node.frame().maxX();
  for (const auto& child : node.children) visit(*child, sums);
}

struct WalkSides {
  WalkSides() {
    for (int nodes : walkSizes) {
      const std::string name = walkName(nodes);
      RegisteredSide(
          name, "ours",
          [nodes] {
            return [root = screen(nodes)] {
              Sums sums;
              visit(*root, sums);
              benchmark::DoNotOptimize(sums);
            };
          },
          nodes);
      RegisteredSide(
          name, "floor",
          [nodes] {
            return [root = plainScreen(nodes)] {
              Sums sums;
              visit(*root, sums);
              benchmark::DoNotOptimize(sums);
            };
          },
          nodes);
    }
  }
};
const WalkSides sides;

}  // namespace

}  // namespace bench
