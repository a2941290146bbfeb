#include "platform/runtime/Message.h"

#include <gtest/gtest.h>

#include <array>
#include <atomic>
#include <stdexcept>
#include <thread>

#include "platform/foundation/String.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Number.h"

namespace ax {

namespace {

const Message<std::int64_t(std::int64_t)> add{"MessageTestAdd:"};
const Message<Ref<String>()> title{"MessageTestTitle"};
const Message<void(Ref<String>)> setTitle{"setMessageTestTitle:"};
const Message<bool(std::function<bool(bool)>)> ask{"MessageTestAsk:"};
const Message<Rect()> frame{"MessageTestFrame"};
const Message<Ref<Object>()> raise{"MessageTestRaise"};
const Message<Ref<String>()> kind{"MessageTestKind"};

class Adder : public Object {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Adder>("MessageTest.Adder", Object::staticClass())
                               .method<&Adder::addTo>("MessageTestAdd:")
                               .property<&Adder::title, &Adder::setTitle>("MessageTestTitle")
                               .method<&Adder::ask>("MessageTestAsk:")
                               .method<&Adder::raise>("MessageTestRaise")
                               .classMethod<&Adder::kind>("MessageTestKind")
                               .build();
    return result;
  }
  std::int64_t addTo(std::int64_t value) { return total += value; }
  const Ref<Object>& title() const { return title_; }
  void setTitle(Ref<String> text) { title_ = text; }
  bool ask(std::function<bool(bool)> block) { return block && block(true); }
  Ref<Object> raise() { throw std::runtime_error("raised"); }
  static Ref<String> kind() { return string("adder"); }

  std::int64_t total = 0;
  Ref<Object> title_;
};

TEST(MessageTest, CallsWithTypedArguments) {
  const Ref<Adder> adder = make<Adder>();
  EXPECT_EQ(add(adder, 40), 40);
  EXPECT_EQ(add(*adder, 2), 42);
  EXPECT_TRUE(ask(adder, [](bool yes) { return yes; }));
  setTitle(adder, string("sum"));
  EXPECT_EQ(title(adder)->text(), "sum");
  EXPECT_EQ(kind(Adder::staticClass())->text(), "adder");
  EXPECT_TRUE(respondsTo(*adder, title));
  EXPECT_FALSE(respondsTo(*adder, kind));
}

TEST(MessageTest, YieldsNothingWhereNothingFits) {
  const Ref<Adder> nobody;
  EXPECT_EQ(add(nobody, 1), 0);
  EXPECT_EQ(frame(nullptr), Rect());
  const Ref<String> text = string("text");
  EXPECT_EQ(title(text), nullptr);
  EXPECT_EQ(frame(text), Rect());
  const Ref<Adder> adder = make<Adder>();
  const Message<double(std::int64_t)> otherResult{"MessageTestAdd:"};
  const Message<std::int64_t(std::int32_t)> otherArgument{"MessageTestAdd:"};
  EXPECT_EQ(otherResult(adder, 1), 0);
  EXPECT_EQ(otherArgument(adder, 1), 0);
  EXPECT_EQ(adder->total, 0) << "a method is not called with another type than its own";
  EXPECT_EQ(kind(adder), nullptr) << "an instance does not answer class methods";
  setTitle(nobody, nullptr);
}

TEST(MessageTest, NarrowsObjectsToItsOwnType) {
  const Ref<Adder> adder = make<Adder>();
  adder->title_ = number(3);
  EXPECT_EQ(title(adder), nullptr) << "the answer is no String";
  const Message<void(Ref<Object>)> setAnything{"setMessageTestTitle:"};
  setAnything(adder, number(1));
  EXPECT_EQ(adder->title_, nullptr) << "the argument is no String";
}

TEST(MessageTest, LetsThroughWhatMethodsRaise) {
  const Ref<Adder> adder = make<Adder>();
  EXPECT_THROW(raise(adder), std::runtime_error);
}

// Nobody has sent these before, and their receivers live on the threads that send.
TEST(MessageTest, FindsItsSelectorOnTheThreadThatSendsFirst) {
  static const Message<std::int64_t(std::int64_t)> first{"MessageTestAdd:"};
  static const Message<Ref<String>()> unanswered{"MessageTestNeverRegistered"};
  Adder::staticClass();
  std::atomic<int> ready = 0;
  std::atomic<int> wrong = 0;
  std::array<std::thread, 4> threads;
  for (std::thread& thread : threads) {
    thread = std::thread([&] {
      const Ref<Adder> adder = make<Adder>();
      for (++ready; ready < 4;) std::this_thread::yield();
      if (first(adder, 2) != 2 || first.call(*adder, adder->isa().lookUp("MessageTestAdd:"_key), 3) != 5)
        ++wrong;
      if (unanswered(adder) || "MessageTestNeverRegistered"_key != unanswered.selector()) ++wrong;
    });
  }
  for (std::thread& thread : threads) thread.join();
  EXPECT_EQ(wrong, 0);
}

TEST(MessageTest, ThatNobodyUsedIsOfNoMethodsType) {
  const Ref<Adder> adder = make<Adder>();
  const Message<std::int64_t(std::int64_t)> calledFirst{"MessageTestAdd:"};
  const Message<std::int64_t(std::int64_t)> calledWithNothing{"MessageTestAdd:"};
  EXPECT_EQ(calledFirst.call(*adder, adder->isa().lookUp(add.selector()), 4), 4);
  EXPECT_EQ(calledWithNothing.call(*adder, adder->isa().lookUp(kind.selector()), 4), 0);
  EXPECT_EQ(adder->isa().lookUp(Selector()).function, nullptr) << "the nil selector answers nothing";
  EXPECT_FALSE(adder->isa().readerForKey(Selector()).isReadable());
}

TEST(MessageTest, KeepsItsObjectsCounted) {
  const Ref<Adder> adder = make<Adder>();
  Ref<String> text = string("counted");
  const Weak<String> weak = text;
  setTitle(adder, text);
  EXPECT_EQ(title(adder), text);
  text = nullptr;
  EXPECT_TRUE(weak);
  setTitle(adder, nullptr);
  EXPECT_FALSE(weak);
}

TEST(MethodTest, IsInvokedWithBoxedArguments) {
  const Ref<Adder> adder = make<Adder>();
  const auto invoke = [&](Selector selector, std::vector<Ref<Object>> arguments) {
    const Method& method = adder->isa().lookUp(selector);
    return method.signature->invoke(*adder, method, arguments);
  };
  EXPECT_EQ(unboxInt(invoke(add.selector(), {number(5.9)})), 5);
  EXPECT_EQ(unboxInt(invoke(add.selector(), {})), 5) << "a missing argument is 0";
  EXPECT_EQ(unboxInt(invoke(add.selector(), {string("7")})), 5);
  EXPECT_EQ(invoke(setTitle.selector(), {string("boxed")}), nullptr);
  EXPECT_EQ(invoke(title.selector(), {})->description(), "boxed");
  EXPECT_FALSE(unboxBool(invoke(ask.selector(), {nullptr}))) << "blocks cannot be boxed";
}

TEST(MethodTest, KnowsItsSignatureFromItsType) {
  const auto codes = [](const auto& message) {
    return std::vector<std::string>(message.signature().encodings.begin(),
                                    message.signature().encodings.end());
  };
  using Codes = std::vector<std::string>;
  EXPECT_EQ(codes(add), (Codes{"q", "q"}));
  EXPECT_EQ(codes(setTitle), (Codes{"v", "@"}));
  EXPECT_EQ(codes(ask), (Codes{"B", "@?"}));
  EXPECT_EQ(codes(frame), (Codes{"{Rect={Point=dd}{Size=dd}}"}));
  const Message<double(const Ref<Adder>&, std::int32_t, Selector, Point)> mixed{"MessageTestMixed::::"};
  EXPECT_EQ(codes(mixed), (Codes{"d", "@", "i", ":", "{Point=dd}"}));
}

}  // namespace

}  // namespace ax
