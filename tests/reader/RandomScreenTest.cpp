#include "tests/reader/RandomScreen.h"

#include <gtest/gtest.h>

#include <map>
#include <optional>
#include <set>

#include "reader/transcript/Transcript.h"
#include "reader/transcript/TreeJson.h"
#include "tests/formatting/RegionScope.h"

namespace ax::reader::testing {
namespace {

constexpr unsigned screens = 100;

// From the top nodes down, by the ids of the children alone.
void walkDown(const Snapshot& snapshot, const std::vector<NodeId>& ids, NodeId parent,
              std::vector<NodeId>& met) {
  for (const NodeId id : ids) {
    const Node* node = snapshot.node(id);
    ASSERT_NE(node, nullptr) << id;
    EXPECT_EQ(node->parent, parent);
    met.push_back(id);
    walkDown(snapshot, node->children, id, met);
  }
}

std::size_t countOf(const nlohmann::ordered_json& tree) {
  std::size_t count = 0;
  for (const auto& node : tree) count += 1 + (node.contains("children") ? countOf(node["children"]) : 0);
  return count;
}

TEST(RandomScreenTest, SpeaksEverythingThatIsSeenOnceAndInOrder) {
  for (unsigned seed = 0; seed < screens; ++seed) {
    const RandomScreen screen(seed);
    const Snapshot snapshot = takeSnapshot(screen.root());
    ASSERT_EQ(labels(snapshot), screen.spoken()) << seed;
    EXPECT_EQ(snapshot.timesRaised(), 0u);
  }
}

TEST(RandomScreenTest, IsReadFromTheOtherSideInArabic) {
  const RegionScope region("ar_EG");
  for (unsigned seed = 0; seed < screens; ++seed) {
    const RandomScreen screen(seed, true);
    ASSERT_EQ(labels(takeSnapshot(screen.root())), screen.spoken()) << seed;
  }
}

TEST(RandomScreenTest, LosesNoNodeOnTheWayDown) {
  for (unsigned seed = 0; seed < screens; ++seed) {
    const RandomScreen screen(seed);
    const Snapshot snapshot = takeSnapshot(screen.root());
    std::vector<NodeId> met, all;
    walkDown(snapshot, snapshot.topNodes(), 0, met);
    for (const Node& node : snapshot.nodes()) {
      all.push_back(node.id);
      EXPECT_NE(node.isElement, !node.children.empty()) << "an empty section, seed " << seed;
    }
    ASSERT_EQ(met, all) << seed;
    EXPECT_EQ(countOf(treeAsJson(snapshot)), all.size());
    EXPECT_EQ(transcript(snapshot, "T").size(), std::max<std::size_t>(labels(snapshot).size(), 1) + 1);
  }
}

TEST(RandomScreenTest, SaysTheSameAgainUnderNewIds) {
  std::set<NodeId> used;
  std::size_t nodes = 0;
  for (unsigned seed = 0; seed < screens; ++seed) {
    const RandomScreen screen(seed);
    const Snapshot first = takeSnapshot(screen.root()), second = takeSnapshot(screen.root());
    ASSERT_EQ(labels(first), labels(second)) << seed;
    for (std::size_t i = 0; i < first.nodes().size(); ++i) {
      EXPECT_EQ(first.nodes()[i].frame, second.nodes()[i].frame);
      EXPECT_EQ(first.object(first.nodes()[i].id).get(), second.object(second.nodes()[i].id).get());
      EXPECT_EQ(second.perform(Action::activate, first.nodes()[i].id), ActionResult::unavailable);
      used.insert({first.nodes()[i].id, second.nodes()[i].id});
    }
    nodes += first.nodes().size() * 2;
  }
  EXPECT_EQ(used.size(), nodes);
}

using NodesOfViews = std::map<const Object*, const Node*>;

// The element that is drawn last over a point.
const Node* drawnLast(const NodesOfViews& nodes, const Ref<View>& view, Point point) {
  const auto own = nodes.find(view.get());
  const Node* last = own != nodes.end() && own->second->frame.contains(point) ? own->second : nullptr;
  for (const Ref<View>& child : view->subviews()) {
    if (const Node* over = drawnLast(nodes, child, point)) last = over;
  }
  return last;
}

TEST(RandomScreenTest, FindsWhatIsDrawnLastUnderAPoint) {
  for (unsigned seed = 0; seed < screens; ++seed) {
    const RandomScreen screen(seed);
    const Snapshot snapshot = takeSnapshot(screen.root());
    NodesOfViews nodes;
    for (const Node& node : snapshot.nodes()) {
      if (node.isElement) nodes[snapshot.object(node.id).get()] = &node;
    }
    for (double x = 5; x < 600; x += 90) {
      for (double y = 5; y < 600; y += 90) {
        const Node* expected = drawnLast(nodes, screen.root(), {x, y});
        ASSERT_EQ(snapshot.hitTest({x, y}), expected) << seed << ": " << x << ", " << y;
      }
    }
  }
}

TEST(RandomScreenTest, ActsOnNothingThatIsGone) {
  for (unsigned seed = 0; seed < screens; ++seed) {
    std::optional<RandomScreen> screen(std::in_place, seed);
    for (const Ref<View>& speaker : screen->speakers()) {
      _setAccessibilityActivateBlock(speaker, [] { return true; });
    }
    const Snapshot snapshot = takeSnapshot(screen->root());
    for (const ActionResult outcome : {ActionResult::done, ActionResult::gone}) {
      for (const Node& node : snapshot.nodes()) {
        const ActionResult result = snapshot.perform(Action::activate, node.id);
        EXPECT_EQ(result, node.isElement ? outcome : ActionResult::unavailable) << seed;
      }
      screen.reset();
    }
    EXPECT_EQ(snapshot.hitTest({50, 50}), nullptr);
    EXPECT_FALSE(transcript(snapshot, "T").empty()) << "the words outlive the objects";
  }
}

}  // namespace
}  // namespace ax::reader::testing
