#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <random>

#include "platform/runtime/Number.h"
#include "platform/toolkit/AccessibilityElement.h"
#include "platform/toolkit/ElementTree.h"
#include "platform/toolkit/Label.h"
#include "platform/toolkit/SpokenText.h"
#include "tests/formatting/RegionScope.h"

// Composed texts, walks and orders over many small cases made with a fixed seed.
namespace ax {

namespace {

using Random = std::mt19937;

// Some text of the alphabets that take one to four bytes a character, without the separator's own comma.
std::string someText(Random& random) {
  static constexpr const char* pieces[] = {"a", "12", "é", "ß", "、", "日", "م", "🏃", " ", "'"};
  std::string text;
  for (auto i = random() % 5; i > 0; --i) text += pieces[random() % std::size(pieces)];
  return text;
}

// A part with up to three marks, and the marks' texts by their names.
Ref<String> somePart(Random& random, int number, std::map<std::string, std::string>& marks) {
  const std::string text = someText(random);
  if (random() % 3 == 0) return string(text);
  const auto marked = make<AccessibilityAttributedString>(text);
  for (unsigned i = 0; i < random() % 4; ++i) {
    const TextRange range = {random() % (text.size() + 1), random() % (text.size() + 2)};
    const std::string name = "mark" + std::to_string(number) + "." + std::to_string(i);
    marked->setAttributeForKeyWithRange(ax::number(true), Selector::intern(name), range);
    const std::string covered = text.substr(range.location, range.length);
    if (!covered.empty()) marks[name] = covered;
  }
  return marked;
}

TEST(ComposedTextTest, KeepsEveryMarkOnItsOwnText) {
  Random random(1);
  for (int round = 0; round < 2000; ++round) {
    const RegionScope scope(round % 2 == 0 ? "en_US" : "ja_JP");
    const std::string separator = round % 2 == 0 ? ", " : "、";
    std::map<std::string, std::string> marks;
    Array::Items parts;
    std::string expected;
    for (int i = 0; i < 5; ++i) {
      const Ref<String> part = somePart(random, i, marks);
      parts.push_back(part);
      if (part->text().empty()) continue;
      expected += (expected.empty() ? "" : separator) + part->text();
    }
    const auto at = [&](std::size_t i) { return cast<String>(parts[i]); };
    const Ref<String> joined =
        stringForVariables({at(0), at(1), at(2), at(3), at(4), stringForVariablesSentinel});
    ASSERT_EQ(joined->text(), expected);
    ASSERT_EQ(labelForElements(array(parts))->text(), expected) << "both join alike";
    std::map<std::string, std::string> found;
    if (const auto* marked = cast<AccessibilityAttributedString>(joined.get())) {
      for (const TextAttribute& mark : marked->attributes())
        found[std::string(mark.key.name())] = marked->text().substr(mark.range.location, mark.range.length);
    }
    ASSERT_EQ(found, marks) << expected;
  }
}

// A tree of views, and now and then a layer; some hidden, some labels, some listing their elements.
struct SomeTree {
  explicit SomeTree(unsigned seed) : random(seed) { grow(root, 0, true); }

  void grow(const Ref<View>& parent, int depth, bool isShown) {
    for (unsigned i = 0; i < random() % 4 && depth < 4; ++i) {
      const bool isLabel = random() % 3 == 0;
      const Ref<View> child = isLabel ? Ref<View>(make<Label>()) : make<View>();
      const bool isHidden = random() % 6 == 0;
      child->setHidden(isHidden);
      child->setFrame({static_cast<double>(random() % 9) * 10, static_cast<double>(random() % 9) * 10,
                       static_cast<double>(random() % 40), static_cast<double>(random() % 40)});
      all.push_back(child);
      if (isLabel) {
        cast<Label>(child.get())->setText(string("n" + std::to_string(all.size())));
        if (isShown && !isHidden) spoken += (spoken.empty() ? "n" : ", n") + std::to_string(all.size());
      }
      parent->addSubview(child);
      // Below a label nothing is spoken.
      grow(child, depth + 1, isShown && !isHidden && !isLabel);
    }
  }

  Random random;
  Ref<View> root = make<View>();
  std::vector<Ref<View>> all;  // without the root
  std::string spoken;
};

TEST(WalkTest, MeetsEveryViewOnceAndSpeaksWhatShows) {
  const RegionScope scope("en_US");
  std::size_t views = 0;
  for (unsigned seed = 0; seed < 300; ++seed) {
    SomeTree tree(seed);
    const auto any = [](Object&) { return true; };
    const Ref<Array> walked = _accessibilityFindSubviewDescendantsPassingTest(tree.root, any);
    ASSERT_EQ(walked->items(), (Array::Items{tree.all.begin(), tree.all.end()})) << seed;
    ASSERT_TRUE(_accessibilityFindUnsortedDescendantsPassingTest(tree.root, any)->isEqual(*walked)) << seed;
    ASSERT_EQ(stringForAllChildren(tree.root)->text(), tree.spoken) << seed;
    for (const Ref<View>& view : tree.all) {
      ASSERT_EQ(_accessibilityFindAncestor(
                    view, [&](Object& object) { return &object == tree.root.get(); }, false),
                tree.root);
    }
    views += tree.all.size();
  }
  EXPECT_GT(views, 1000u);
}

TEST(WalkTest, FollowsAListInPlaceOfTheViews) {
  const RegionScope scope("en_US");
  for (unsigned seed = 0; seed < 100; ++seed) {
    SomeTree tree(seed);
    if (tree.all.empty()) continue;
    const auto element = make<AccessibilityElement>();
    messages::setAccessibilityLabel(element, string("listed"));
    messages::setAccessibilityElements(tree.root, array({element}));
    EXPECT_EQ(stringForAllChildren(tree.root)->text(), "listed");
    const auto any = [](Object&) { return true; };
    EXPECT_EQ(_accessibilityFindUnsortedDescendantsPassingTest(tree.root, any)->count(), 1u);
    EXPECT_EQ(_accessibilityFindSubviewDescendantsPassingTest(tree.root, any)->count(), tree.all.size());
  }
}

TEST(ScreenOrderTest, IsAPermutationThatDependsOnThePlacesAlone) {
  Random random(5);
  for (unsigned seed = 0; seed < 300; ++seed) {
    const RegionScope scope(seed % 2 == 0 ? "en_US" : "ar_EG");
    SomeTree tree(seed);
    Array::Items flat(tree.all.begin(), tree.all.end());
    const Ref<Array> sorted = sortedByGeometry(*array(flat));
    ASSERT_TRUE(std::is_permutation(flat.begin(), flat.end(), sorted->begin(), sorted->end()));
    for (const Ref<View>& view : tree.all) view->setFrame({view->frame().x, view->frame().y, 10, 20});
    const Ref<Array> straight = sortedByGeometry(*array(flat));
    ASSERT_EQ(sortedByGeometry(*straight)->items(), straight->items()) << "what is in order stays so";
    std::shuffle(flat.begin(), flat.end(), random);
    const Ref<Array> again = sortedByGeometry(*array(flat));
    for (std::size_t i = 0; i < flat.size(); ++i) {
      ASSERT_EQ(messages::accessibilityFrame(again->at(i)).y, messages::accessibilityFrame(straight->at(i)).y)
          << seed;
    }
  }
}

TEST(ScreenOrderTest, ComparesEachPairOppositely) {
  for (unsigned seed = 0; seed < 100; ++seed) {
    const RegionScope scope(seed % 2 == 0 ? "en_US" : "ar_EG");
    SomeTree tree(seed);
    for (const Ref<View>& a : tree.all) {
      ASSERT_EQ(accessibilityCompareGeometry(*a, *a), 0);
      for (const Ref<View>& b : tree.all)
        ASSERT_EQ(accessibilityCompareGeometry(*a, *b), -accessibilityCompareGeometry(*b, *a)) << seed;
    }
  }
}

TEST(ScreenOrderTest, MirrorsWithTheLanguage) {
  Random random(9);
  for (int round = 0; round < 100; ++round) {
    Array::Items leftward;
    Array::Items rightward;
    for (int i = 0; i < 12; ++i) {
      const Rect frame = {static_cast<double>(random() % 1000), static_cast<double>(random() % 4) * 100, 10,
                          10};
      for (Array::Items* items : {&leftward, &rightward}) {
        const auto view = make<View>();
        const double x = items == &leftward ? -frame.maxX() : frame.x;
        view->setFrame({x, frame.y, frame.width, frame.height});
        items->push_back(view);
      }
    }
    const auto order = [](const Array::Items& items, const char* locale) {
      const RegionScope scope(locale);
      std::vector<std::ptrdiff_t> places;
      const Ref<Array> sorted = sortedByGeometry(*array(items));
      for (const Ref<Object>& item : *sorted)
        places.push_back(std::find(items.begin(), items.end(), item) - items.begin());
      return places;
    };
    ASSERT_EQ(order(rightward, "en_US"), order(leftward, "ar_EG")) << round;
  }
}

}  // namespace

}  // namespace ax
