#include "platform/runtime/KeyReading.h"

#include <gtest/gtest.h>

#include <stdexcept>

#include "platform/foundation/Array.h"
#include "platform/foundation/String.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Number.h"
#include "platform/runtime/Value.h"
#include "platform/toolkit/Label.h"

namespace ax {

namespace {

class Clock : public Object {
 public:
  static Class& staticClass();

  void wind() { ++windings; }
  Ref<String> zone() const { return string("UTC"); }
  std::int64_t broken() { throw std::runtime_error("no spring"); }
  Ref<String> title() const { return string("exact"); }
  Ref<String> nameForHour(std::int64_t) { return string("noon"); }
  static Ref<String> sharedName() { return string("Big Clock"); }

  Ref<Label> label = make<Label>();
  Ref<Array> hands = array({string("hour"), string("minute")});
  Ref<String> maker = string("maker");
  Ref<Clock> twin;
  Weak<Clock> owner;
  std::uint64_t ticks = ~std::uint64_t(0);
  std::int32_t hour = -7;
  double speed = 1.5;
  bool runs = true;
  Rect face = {1, 2, 3, 4};
  Selector action = Selector::intern("tick:");
  int windings = 0;
};

class Alarm : public Clock {
 public:
  static Class& staticClass();
  Ref<String> zone() const { return string("CET"); }
};

Class& Clock::staticClass() {
  static Class& result = ClassBuilder<Clock>("KeyReadingTest.Clock", Object::staticClass())
                             .instanceVariable<&Clock::label>("_label")
                             .instanceVariable<&Clock::hands>("_hands")
                             .instanceVariable<&Clock::maker>("_maker")
                             .instanceVariable<&Clock::twin>("_twin")
                             .instanceVariable<&Clock::owner>("_owner")
                             .instanceVariable<&Clock::ticks>("_ticks")
                             .instanceVariable<&Clock::hour>("_hour")
                             .instanceVariable<&Clock::speed>("_speed")
                             .instanceVariable<&Clock::runs>("_runs")
                             .instanceVariable<&Clock::face>("_face")
                             .instanceVariable<&Clock::action>("_action")
                             .method<&Clock::wind>("wind")
                             .method<&Clock::zone>("zone")
                             .method<&Clock::broken>("broken")
                             .method<&Clock::zone>("_broken")
                             .method<&Clock::title>("title")
                             .method<&Clock::zone>("_title")
                             .method<&Clock::nameForHour>("nameForHour:")
                             .classMethod<&Clock::sharedName>("sharedName")
                             .build();
  return result;
}

Class& Alarm::staticClass() {
  static Class& result =
      ClassBuilder<Alarm>("KeyReadingTest.Alarm", Clock::staticClass()).method<&Alarm::zone>("zone").build();
  return result;
}

TEST(KeyReadingTest, FindsMembersAndMethodsByTheirExactName) {
  const Ref<Clock> clock = make<Alarm>();
  EXPECT_EQ(clock->safeValueForKey("_label"_key), clock->label);
  EXPECT_EQ(clock->safeValueForKey("_label"), clock->label);
  EXPECT_EQ(clock->safeValueForKey("zone"_key)->description(), "CET");
  EXPECT_EQ(make<Clock>()->safeValueForKey("zone"_key)->description(), "UTC");
  for (const char* missing :
       {"label", "_Label", "Zone", "KeyReadingTest nobody named this", "", "sharedName"}) {
    EXPECT_EQ(clock->safeValueForKey(missing), nullptr) << missing;
    EXPECT_EQ(clock->safeValueForKey(Selector::intern(missing)), nullptr) << missing;
  }
  EXPECT_EQ(clock->safeValueForKey(Key()), nullptr);
}

TEST(KeyReadingTest, NeverCallsWhatOnlyActsOrWantsArguments) {
  const Ref<Clock> clock = make<Clock>();
  EXPECT_EQ(clock->safeValueForKey("wind"_key), nullptr);
  EXPECT_FALSE(clock->safeBoolForKey("wind"_key));
  EXPECT_EQ(clock->windings, 0);
  EXPECT_EQ(clock->safeValueForKey("nameForHour:"_key), nullptr);
  EXPECT_EQ(clock->safeValueForKey("nameForHour"_key), nullptr);
}

TEST(KeyReadingTest, AbsorbsWhatMethodsRaise) {
  const Ref<Clock> clock = make<Clock>();
  EXPECT_EQ(clock->safeValueForKey("broken"_key), nullptr);
  EXPECT_EQ(clock->safeIntForKey("broken"_key), 0);
  EXPECT_EQ(clock->safeValueForKeyPath("broken.description"), nullptr);
  int stored = 0;
  performSafeBlock([&] {
    stored = 1;
    clock->broken();
    stored = 2;
  });
  EXPECT_EQ(stored, 1);
}

TEST(KeyReadingTest, BoxesScalars) {
  const Ref<Clock> clock = make<Clock>();
  EXPECT_EQ(clock->safeIntForKey("_hour"_key), -7);
  EXPECT_DOUBLE_EQ(clock->safeDoubleForKey("_hour"_key), -7);
  EXPECT_EQ(clock->safeIntForKey("_speed"_key), 1);
  EXPECT_TRUE(clock->safeBoolForKey("_speed"_key));
  EXPECT_TRUE(clock->safeBoolForKey("_runs"_key));
  EXPECT_EQ(cast<Number>(clock->safeValueForKey("_ticks"_key))->unsignedValue(), clock->ticks);
  EXPECT_EQ(unboxRect(clock->safeValueForKey("_face"_key)), (Rect{1, 2, 3, 4}));
  EXPECT_EQ(unboxPoint(clock->safeValueForKey("_face"_key)), Point()) << "another kind of value";
  EXPECT_EQ(unboxSelector(clock->safeValueForKey("_action"_key)), "tick:"_key);
  clock->action = Selector();
  EXPECT_EQ(clock->safeValueForKey("_action"_key), nullptr);
  EXPECT_EQ(clock->safeDoubleForKey("_label"_key), 0) << "an object is no number";
}

TEST(KeyReadingTest, IsNilForAnotherKind) {
  const Ref<Clock> clock = make<Clock>();
  EXPECT_EQ(safeArrayForKey(clock, "_hands"_key), clock->hands);
  EXPECT_EQ(safeStringForKey(clock, "_maker"_key), clock->maker);
  EXPECT_EQ(safeUIViewForKey(clock, "_label"_key), clock->label);
  EXPECT_EQ(safeArrayForKey(clock, "_label"_key), nullptr);
  EXPECT_EQ(safeStringForKey(clock, "_hour"_key), nullptr);
  EXPECT_EQ(safeUIViewForKey(clock, "_hands"_key), nullptr);
  const Ref<Clock> nobody;
  EXPECT_EQ(safeUIViewForKey(nobody, "_label"_key), nullptr);
  EXPECT_EQ(safeIntForKey(nobody, "_hour"_key), 0);
}

TEST(KeyReadingTest, FollowsPaths) {
  const Ref<Clock> clock = make<Clock>();
  clock->twin = make<Alarm>();
  clock->twin->owner = clock;
  EXPECT_EQ(clock->safeValueForKeyPath("_twin._owner._twin.zone")->description(), "CET");
  EXPECT_EQ(clock->safeValueForKeyPath("_maker"), clock->maker);
  for (const char* path : {"_twin._twin.zone", "_twin.nothing.zone", "_twin..zone", "_twin.", ".", ""}) {
    EXPECT_EQ(clock->safeValueForKeyPath(path), nullptr) << path;
  }
  EXPECT_EQ(clock->twin->safeValueForKey("_owner"_key), clock) << "a weak member reads as its object";
}

TEST(KeyReadingTest, TakesTheMemberWithAnUnderscoreInAPath) {
  const Ref<Clock> clock = make<Clock>();
  clock->twin = make<Alarm>();
  EXPECT_EQ(clock->safeValueForKeyPath("twin.zone")->description(), "CET");
  EXPECT_EQ(clock->safeValueForKeyPath("twin.maker"), clock->twin->maker);
  EXPECT_EQ(clock->safeValueForKey("maker"), nullptr) << "a plain read is exact";
  EXPECT_EQ(clock->safeValueForKeyPath("title")->description(), "exact") << "the exact name goes first";
  EXPECT_EQ(clock->safeValueForKeyPath("broken"), nullptr) << "what raises is a member all the same";
  EXPECT_EQ(clock->safeValueForKeyPath("wind"), nullptr);
}

// A literal's class is asked for before it is there, while it is, and when it is hidden.
TEST(ClassesTest, AreFoundByNameAsTheyComeAndGo) {
  const auto byLiteral = [] { return safeClassFromString("KeyReadingTest.Late"_key); };
  EXPECT_EQ(byLiteral(), nullptr);
  EXPECT_EQ(safeClassFromString("KeyReadingTest.Late"), nullptr);
  EXPECT_EQ(safeClassFromString(Selector()), nullptr);
  Class& late = Class::add("KeyReadingTest.Late", &Object::staticClass(), nullptr);
  EXPECT_EQ(byLiteral(), &late);
  EXPECT_EQ(safeClassFromString(std::string("KeyReadingTest.") + "Late"), &late);
  late.hide();
  EXPECT_EQ(byLiteral(), nullptr);
  EXPECT_EQ(safeClassFromString("KeyReadingTest.Late"), nullptr);
  EXPECT_EQ(Class::namedEvenIfHidden("KeyReadingTest.Late"), &late);
}

TEST(KeyReadingTest, AsksClassesForTheirClassMethods) {
  Class& clocks = Clock::staticClass();
  EXPECT_EQ(clocks.safeValueForKey("sharedName"_key)->description(), "Big Clock");
  EXPECT_EQ(safeStringForKey(Alarm::staticClass(), "sharedName"_key)->text(), "Big Clock");
  EXPECT_EQ(clocks.safeValueForKey("zone"_key), nullptr);
  EXPECT_EQ(clocks.safeValueForKey("_label"_key), nullptr);
}

TEST(KeyReadingTest, WritesOnlyWhatFits) {
  const Ref<Clock> clock = make<Clock>();
  const auto write = [&](const char* name, const Ref<Object>& value) {
    return clock->isa().instanceVariable(Selector::find(name))->write(*clock, value);
  };
  EXPECT_TRUE(write("_hour", number(11.9)));
  EXPECT_EQ(clock->hour, 11);
  EXPECT_FALSE(write("_hour", string("noon")));
  EXPECT_EQ(clock->hour, 11);
  EXPECT_FALSE(write("_face", box(Point{1, 1})));
  EXPECT_EQ(clock->face.width, 3);
  EXPECT_FALSE(write("_maker", number(1)));
  EXPECT_EQ(clock->maker->text(), "maker") << "a value of the wrong kind leaves the member alone";
  EXPECT_TRUE(write("_ticks", number(~std::uint64_t(0) - 1)));
  EXPECT_EQ(clock->ticks, ~std::uint64_t(0) - 1);
  EXPECT_TRUE(write("_maker", nullptr));
  EXPECT_EQ(clock->maker, nullptr);
  EXPECT_TRUE(write("_runs", nullptr));
  EXPECT_FALSE(clock->runs);
}

TEST(CastsTest, CountAndReportMismatches) {
  const std::size_t before = castMismatches();
  const Ref<Object> clock = make<Clock>();
  bool mismatch = true;
  EXPECT_EQ(castAsClass<Clock>(clock, &mismatch), clock);
  EXPECT_FALSE(mismatch);
  EXPECT_EQ(castAsClass<Label>(Ref<Object>(), &mismatch), nullptr);
  EXPECT_FALSE(mismatch) << "nil is of every class";
  EXPECT_EQ(safeClass("KeyReadingTest.Clock"_key, clock, &mismatch), clock);
  EXPECT_FALSE(mismatch);
  EXPECT_EQ(castMismatches(), before);
  testing::internal::CaptureStderr();
  EXPECT_EQ(castAsClass<Label>(clock, &mismatch), nullptr);
  EXPECT_TRUE(mismatch);
  EXPECT_EQ(safeClass("KeyReadingTest.NoSuchClass"_key, clock), nullptr);
  testing::internal::GetCapturedStderr();
  EXPECT_EQ(castMismatches(), before + 2);
}

}  // namespace

}  // namespace ax
