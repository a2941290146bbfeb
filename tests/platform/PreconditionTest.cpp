#include "platform/runtime/Precondition.h"

#include <gtest/gtest.h>

#include <thread>

#include "platform/accessibility/Notifications.h"
#include "platform/foundation/BackgroundQueue.h"
#include "platform/foundation/Bundle.h"
#include "platform/foundation/Environment.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Message.h"

namespace ax {

namespace {

const Message<Ref<Object>()> anything{"preconditionTestAnything"};

class Hasty : public Object {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Hasty>("PreconditionTest.Hasty", Object::staticClass()).build();
    return result;
  }
  Hasty() { anything(*this); }
};

class Clinging : public Object {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Clinging>("PreconditionTest.Clinging", Object::staticClass()).build();
    return result;
  }
  ~Clinging() override { kept() = Ref<Object>(this); }
  static Ref<Object>& kept() {
    static auto* const handle = new Ref<Object>;
    return *handle;
  }
  Ref<Object> part;
};

// Each breaks what a header asks, and dies of the advice.
class Preconditions : public testing::Test {
 protected:
  void SetUp() override {
    if (!checksPreconditions) GTEST_SKIP() << "an optimized build checks nothing";
    GTEST_FLAG_SET(death_test_style, "threadsafe");
  }
};
using PreconditionDeathTest = Preconditions;

TEST_F(PreconditionDeathTest, AnObjectAnswersNothingFromItsConstructor) {
  EXPECT_DEATH(make<Hasty>(), "Object.h:[0-9]+: .*send nothing to it from its constructor");
}

TEST_F(PreconditionDeathTest, HandlesAreCounted) {
  EXPECT_DEATH(make<Clinging>(), "its destructor must leave none behind");
  EXPECT_DEATH((void)Ref<Object>()->description(), "the handle is nil");
}

TEST_F(PreconditionDeathTest, NamesAreNew) {
  EXPECT_DEATH(Class::add("View", &Object::staticClass(), nullptr), "choose another name");
  EXPECT_DEATH(ClassBuilder<Clinging>(Clinging::staticClass())
                   .instanceVariable<&Clinging::part>("_part")
                   .instanceVariable<&Clinging::part>("_part"),
               "register it once");
}

TEST_F(PreconditionDeathTest, TheMainThreadAloneReports) {
  EXPECT_DEATH(std::thread([] { postNotification(LayoutChangedNotification); }).join(),
               "belong to the main thread");
  EXPECT_DEATH(std::thread([] { (void)platformString("list.separator"); }).join(), "of the main thread");
  EXPECT_DEATH(std::thread([] { setEnvironment({}); }).join(), "set it there");
}

TEST_F(PreconditionDeathTest, ATaskWaitsForNoOther) {
  EXPECT_DEATH(
      {
        dispatchInBackground([] { waitForBackgroundTasks(); });
        waitForBackgroundTasks();
      },
      "dispatch what is to follow");
}

}  // namespace

}  // namespace ax
