#include <gtest/gtest.h>

#include "platform/runtime/ClassBuilder.h"
#include "reader/transcript/Transcript.h"
#include "tests/reader/ScreenPieces.h"

namespace ax::reader::testing {
namespace {

using Labels = std::vector<std::string>;

// Covers the rest while it is up.
class Shade : public View {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Shade>("ModalTestShade", View::staticClass())
                               .method<&Shade::isModal>("accessibilityViewIsModal")
                               .build();
    return result;
  }
  bool isModal() { return isUp; }
  bool isUp = true;
};

TEST(ModalTest, TheInnermostOfNestedOnesHoldsTheReader) {
  const Ref<Shade> inner = view<Shade>({label("Sure?")});
  const Ref<Shade> outer = view<Shade>({label("Share"), view({inner}), label("Cancel", {0, 900, 10, 10})});
  const Ref<View> screen = view({label("behind"), view({view({outer})})});
  EXPECT_EQ(labels(takeSnapshot(screen)), Labels{"Sure?"});
  inner->isUp = false;
  EXPECT_EQ(labels(takeSnapshot(screen)), (Labels{"Share", "Sure?", "Cancel"}));
  outer->isUp = false;
  EXPECT_EQ(labels(takeSnapshot(screen)), (Labels{"behind", "Share", "Sure?", "Cancel"}));
}

TEST(ModalTest, WhatIsDrawnLastIsInFrontWhereverItStands) {
  const Ref<Shade> low = view<Shade>({label("low")}, {0, 600, 400, 200});
  const Ref<Shade> high = view<Shade>({label("high")}, {0, 0, 400, 200});
  const Ref<View> screen = view({low, high});
  EXPECT_EQ(labels(takeSnapshot(screen)), Labels{"high"});
  low->removeFromSuperview();
  screen->addSubview(low);
  EXPECT_EQ(labels(takeSnapshot(screen)), Labels{"low"});
}

TEST(ModalTest, OneThatCannotBeSeenCoversNothing) {
  const Ref<View> hidden = view({view<Shade>({label("in a hidden view")})});
  hidden->setHidden(true);
  const Ref<Shade> faded = view<Shade>({label("faded")});
  faded->setAlpha(0);
  const Ref<View> screen = view({label("read"), hidden, faded});
  const Snapshot snapshot = takeSnapshot(screen);
  EXPECT_EQ(labels(snapshot), Labels{"read"});
  EXPECT_EQ(snapshot.hitTest({5, 5})->label->text, "read");
}

TEST(ModalTest, TheScreenItselfAndAnElementCanBeOne) {
  const Snapshot whole = takeSnapshot(view<Shade>({label("a"), label("b", {0, 40, 10, 10})}));
  EXPECT_EQ(transcript(whole, "T"), (Labels{"Screen: T", "a, covers the rest of the screen", "b"}));

  const Ref<Shade> sheet = view<Shade>({label("inside")});
  messages::setIsAccessibilityElement(sheet, true);
  messages::setAccessibilityLabel(sheet, string("Please wait"));
  const Snapshot one = takeSnapshot(view({label("behind"), sheet}));
  EXPECT_EQ(transcript(one, "T"), (Labels{"Screen: T", "Please wait, covers the rest of the screen"}));
  EXPECT_EQ(one.hitTest({5, 5})->label->text, "Please wait");
}

TEST(ModalTest, ItsElementsAreThoseThatItLists) {
  const Ref<Shade> sheet = view<Shade>({label("drawn")});
  messages::setAccessibilityElements(sheet, array({element("listed", sheet)}));
  EXPECT_EQ(labels(takeSnapshot(view({label("behind"), sheet}))), Labels{"listed"});
  messages::setAccessibilityElements(sheet, array({}));
  EXPECT_EQ(transcript(takeSnapshot(view({label("behind"), sheet})), "T"),
            (Labels{"Screen: T", "Nothing to speak"}));
}

TEST(SnapshotActionsTest, AnElementMayTakeItselfAway) {
  Ref<Label> closing = label("Close");
  const Ref<View> screen = view({closing, label("stays", {0, 40, 10, 10})});
  _setAccessibilityActivateBlock(closing, [&] {
    closing->removeFromSuperview();
    closing = nullptr;
    return true;
  });
  const Snapshot snapshot = takeSnapshot(screen);
  const NodeId close = snapshot.nodes()[0].id;
  EXPECT_EQ(snapshot.perform(Action::activate, close), ActionResult::done);
  EXPECT_EQ(snapshot.perform(Action::activate, close), ActionResult::gone);
  EXPECT_EQ(labels(takeSnapshot(screen)), Labels{"stays"});
}

}  // namespace
}  // namespace ax::reader::testing
