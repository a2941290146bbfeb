#include <gtest/gtest.h>

#include "host/calendar/ActivityThreeRingCell.h"
#include "host/sharing/CHFriendDetailCells.h"
#include "host/workouts/CHWorkoutDetailExpandingHeaderView.h"
#include "host/workouts/CHWorkoutDetailSplitTableViewCell.h"
#include "host/workouts/CHWorkoutListTableHeaderView.h"
#include "platform/runtime/ClassBuilder.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/Members.h"
#include "tests/bundle/StartedBundle.h"

// Hosts whose members answer with the very object that is being asked, and hosts whose provider raises.
namespace ax {

namespace {

// A class of the host in which one member holds the object itself.
template <class Host, LiteralText Member>
class OwnPart : public Host {
 public:
  static Class& staticClass() {
    const std::string name = "OwnPart." + Host::staticClass().name() + std::string(Member.view());
    static Class& result = ClassBuilder<OwnPart>(name, Host::staticClass())
                               .template instanceVariable<&OwnPart::part_>(Member.view())
                               .build();
    return result;
  }
  static Ref<Object> made() {
    const Ref<OwnPart> object = make<OwnPart>();
    object->part_ = object;
    return object;
  }

 private:
  Weak<Object> part_;
};

TEST(OwnPartsTest, AddNothingToWhatTheirObjectsAnswer) {
  ASSERT_NO_FATAL_FAILURE(startBundle());
  using namespace host;
  for (const auto& made : {&OwnPart<ActivityThreeRingCell, "_dateLabel">::made,
                           &OwnPart<CHWorkoutListTableHeaderView, "_dateLabel">::made,
                           &OwnPart<CHWorkoutListTableHeaderView, "_detailLabel">::made,
                           &OwnPart<CHFriendDetailActionCell, "_actionTitleLabel">::made,
                           &OwnPart<CHFriendDetailGoalCell, "_titleLabel">::made,
                           &OwnPart<CHFriendDetailGoalCell, "_subtitleLabel">::made,
                           &OwnPart<CHWorkoutDetailSplitTableViewCell, "_unitLabel">::made,
                           &OwnPart<CHWorkoutDetailSplitTableViewCell, "_paceLabel">::made}) {
    const Ref<Object> object = made();
    const Ref<String> label = messages::accessibilityLabel(object);
    EXPECT_TRUE(isEmpty(label)) << object->isa().name() << plain(label);
  }
  const Ref<Object> header = OwnPart<CHWorkoutDetailExpandingHeaderView, "_expandButton">::made();
  EXPECT_EQ(messages::accessibilityActivationPoint(header), Point());
}

void raiseFor(Object&, Ref<String>) {
  throw std::runtime_error("no name");
}
void raiseForFlag(Object&, bool) {
  throw std::runtime_error("no flag");
}
Ref<String> raiseForTitle(Object&, Ref<Object>) {
  throw std::runtime_error("no title");
}

struct RaisingMethod {
  const char* name;
  void (*install)(ClassBuilder<Object>&);
  const char* title;  // what the achievement is called then
};
void PrintTo(const RaisingMethod& method, std::ostream* out) {
  *out << method.name;
}

class RaisingProviderTest : public testing::TestWithParam<RaisingMethod> {};

// The provider is made once in a process, so each of these is whole in one of its own alone.
TEST_P(RaisingProviderTest, CostsNoMoreThanTheTitle) {
  ASSERT_NO_FATAL_FAILURE(startBundle());
  Class& provider = *Class::named("ODUIAchievementLocalizationProvider");
  const Method before = *provider.ownMethod(Selector::find(GetParam().name));
  ClassBuilder<Object> builder(provider);
  GetParam().install(builder);
  const Ref<Object> cell = Class::named("CHAchievementCollectionViewCell")->instantiate();
  const Ref<Object> achievement = Class::named("ACHAchievement")->instantiate();
  setMember(*achievement, "title", string("Gold"));
  Message<void(Ref<Object>)>("setAchievement:")(cell, achievement);
  EXPECT_NO_THROW(EXPECT_EQ(labelOf(cell), GetParam().title));
  provider.addMethod(before);
}

INSTANTIATE_TEST_SUITE_P(
    OwnParts, RaisingProviderTest,
    testing::Values(
        RaisingMethod{"setName:", [](auto& provider) { provider.template method<&raiseFor>("setName:"); },
                      "Gold"},
        RaisingMethod{"setWheelchairUser:",
                      [](auto& provider) { provider.template method<&raiseForFlag>("setWheelchairUser:"); },
                      "Gold"},
        RaisingMethod{
            "titleForAchievement:",
            [](auto& provider) { provider.template method<&raiseForTitle>("titleForAchievement:"); },
            "(none)"}));

}  // namespace

}  // namespace ax
