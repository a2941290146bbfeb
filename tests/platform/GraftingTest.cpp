#include "platform/runtime/Grafting.h"

#include <gtest/gtest.h>

#include <array>
#include <atomic>
#include <stdexcept>
#include <string>
#include <thread>

#include "platform/foundation/String.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/KeyReading.h"
#include "tests/platform/AddedCategory.h"

namespace ax {

namespace {

using Text = Ref<String>;

const Message<Text()> word{"graftingTestWord"};
const Message<Text()> inherited{"graftingTestInherited"};
const Message<Text()> classWord{"graftingTestClassWord"};
const Message<Text()> added{"_axGraftingTestAdded"};
const Message<Text()> both{"graftingTestBoth"};
const Message<std::int64_t(std::int64_t)> countDown{"graftingTestCountDown:"};

Text operator+(const Text& left, const char* right) {
  return string((left ? left->text() : "nil") + right);
}

// One pair of classes per test, told apart by a number, since a graft is for good.
template <int N>
class Base : public Object {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Base>("GraftingTest.Base" + std::to_string(N), Object::staticClass())
                               .template method<&Base::word>("graftingTestWord")
                               .template method<&Base::inherited>("graftingTestInherited")
                               .template method<&Base::countDown>("graftingTestCountDown:")
                               .template classMethod<&Base::classWord>("graftingTestClassWord")
                               .build();
    return result;
  }
  Text word() { return string("base"); }
  Text inherited() { return string("base"); }
  static Text classWord() { return string("Base"); }
  std::int64_t countDown(std::int64_t from) { return from <= 0 ? 0 : ax::countDown(*this, from - 1) + 1; }
};

template <int N>
class Derived : public Base<N> {
 public:
  static Class& staticClass() {
    static Class& result =
        ClassBuilder<Derived>("GraftingTest.Derived" + std::to_string(N), Base<N>::staticClass())
            .template method<&Derived::word>("graftingTestWord")
            .build();
    return result;
  }
  // What host code does: it calls its own superclass's method through the runtime.
  Text word() {
    return ax::word.call(*this, Base<N>::staticClass().lookUp(ax::word.selector())) + ">derived";
  }
};

template <const char* Mark>
class Marking : public SafeCategory {
 public:
  Text word() { return super(ax::word) + Mark; }
  Text inherited() { return super(ax::inherited) + Mark; }
  Text classWord() { return super(ax::classWord) + Mark; }
  Text added() { return super(ax::added) + Mark; }
  // Asks super for another message than the one it answers.
  Text both() { return super(ax::word) + "&" + super(ax::inherited)->text().c_str(); }
  std::int64_t countDown(std::int64_t from) { return super(ax::countDown, from) + 100; }
};

constexpr char onBase[] = "+B";
constexpr char onDerived[] = "+D";
constexpr char second[] = "+2";

template <const char* Mark>
Class& category(int number, const std::string& target) {
  using C = Marking<Mark>;
  return addCategory({"GraftingTest" + std::string(Mark) + std::to_string(number),
                      target,
                      {overrides<&C::word>(word), overrides<&C::inherited>(inherited),
                       overrides<&C::added>(added), overrides<&C::both>(both),
                       overrides<&C::countDown>(countDown), overridesClassMethod<&C::classWord>(classWord)}});
}

template <int N>
void expectBothCategoriesTakePart() {
  const Ref<Base<N>> base = make<Base<N>>();
  const Ref<Base<N>> derived = make<Derived<N>>();
  EXPECT_EQ(word(base)->text(), "base+B");
  EXPECT_EQ(word(derived)->text(), "base+B>derived+D");
  EXPECT_EQ(inherited(base)->text(), "base+B");
  EXPECT_EQ(inherited(derived)->text(), "base+B+D") << "a method that the target only inherits";
  EXPECT_EQ(added(derived)->text(), "nil+B+D") << "a method of the categories alone";
  EXPECT_EQ(both(derived)->text(), "base+B>derived&base+B");
  EXPECT_EQ(classWord(Base<N>::staticClass())->text(), "Base+B");
  EXPECT_EQ(classWord(Derived<N>::staticClass())->text(), "Base+B+D");
  EXPECT_EQ(derived->safeValueForKey("graftingTestWord"_key)->description(), "base+B>derived+D");
  EXPECT_EQ(countDown(base, 3), 403) << "the host's own recursion passes the override each time, no more";
}

TEST(GraftingTest, ResolvesSuperWhenTheSuperclassComesFirst) {
  Class& base = Base<1>::staticClass();
  Class& derived = Derived<1>::staticClass();
  graftCategory(category<onBase>(1, base.name()), base);
  graftCategory(category<onDerived>(1, derived.name()), derived);
  expectBothCategoriesTakePart<1>();
}

TEST(GraftingTest, ResolvesSuperWhenTheSubclassComesFirst) {
  Class& base = Base<2>::staticClass();
  Class& derived = Derived<2>::staticClass();
  const Ref<Derived<2>> asked = make<Derived<2>>();
  EXPECT_EQ(word(asked)->text(), "base>derived");
  EXPECT_EQ(asked->safeValueForKey(word.selector())->description(), "base>derived");
  graftCategory(category<onDerived>(2, derived.name()), derived);
  EXPECT_EQ(inherited(asked)->text(), "base+D");
  EXPECT_EQ(asked->safeValueForKey(word.selector())->description(), "base>derived+D");
  EXPECT_EQ(classWord(derived)->text(), "Base+D");
  EXPECT_EQ(classWord(base)->text(), "Base");
  graftCategory(category<onBase>(2, base.name()), base);
  expectBothCategoriesTakePart<2>();
}

TEST(GraftingTest, StacksTwoCategoriesOnOneClass) {
  Class& base = Base<3>::staticClass();
  EXPECT_TRUE(graftCategory(category<onBase>(3, base.name()), base));
  Class& upper = category<second>(3, base.name());
  EXPECT_TRUE(graftCategory(upper, base));
  EXPECT_FALSE(graftCategory(upper, base)) << "a category is grafted once";
  EXPECT_EQ(word(make<Derived<3>>())->text(), "base+B+2>derived");
  EXPECT_EQ(inherited(make<Derived<3>>())->text(), "base+B+2");
  EXPECT_EQ(added(make<Base<3>>())->text(), "nil+B+2");
  EXPECT_EQ(both(make<Base<3>>())->text(), "base+B&base+B");
  EXPECT_EQ(classWord(Derived<3>::staticClass())->text(), "Base+B+2");
}

TEST(GraftingTest, LeavesTheCategorysOwnMethodsBehind) {
  Class& base = Base<4>::staticClass();
  graftCategory(category<onBase>(4, base.name()), base);
  EXPECT_EQ(base.safeValueForKey("safeCategoryTargetClassName"), nullptr);
  EXPECT_EQ(base.safeValueForKey("safeCategoryBaseClass"), nullptr);
  Class& category = *Class::named("GraftingTest+B4");
  EXPECT_EQ(category.safeValueForKey("safeCategoryTargetClassName")->description(), base.name());
  EXPECT_EQ(cast<Class>(category.safeValueForKey("safeCategoryBaseClass")).get(),
            Class::named("SafeCategory"));
  EXPECT_EQ(category.superclass()->name(), "__GraftingTest+B4_super");
}

TEST(GraftingTest, LetsOtherThreadsSendMeanwhile) {
  Class& base = Base<6>::staticClass();
  std::atomic<bool> ends = false;
  std::atomic<int> missed = 0;
  std::thread sender([&] {
    while (!ends) {
      if (base.metaclass().lookUp(classWord.selector()).function == nullptr) ++missed;
      if (base.lookUp(word.selector()).function == nullptr) ++missed;
    }
  });
  graftCategory(category<onBase>(6, base.name()), base);
  graftCategory(category<second>(6, base.name()), base);
  ends = true;
  sender.join();
  EXPECT_EQ(missed, 0);
  EXPECT_EQ(classWord(base)->text(), "Base+B+2") << "nobody keeps what was looked up before";
  EXPECT_EQ(word(make<Base<6>>())->text(), "base+B+2");
}

// Three threads send what asks super for another message, while eight categories are put onto the class.
template <std::size_t N>
class Stacked : public SafeCategory {
 public:
  Text word() { return super(ax::word); }
  Text inherited() { return super(ax::word); }
  Text both() { return super(ax::inherited); }
};

template <std::size_t... N>
std::array<Class*, sizeof...(N)> stackedCategories(const std::string& target, std::index_sequence<N...>) {
  const auto make = [&]<std::size_t I>(std::integral_constant<std::size_t, I>) {
    using C = Stacked<I>;
    Class& category = addCategory(
        {"GraftingTestStacked" + std::to_string(I),
         target,
         {overrides<&C::word>(word), overrides<&C::inherited>(inherited), overrides<&C::both>(both)}});
    // So many that grafting takes its time.
    for (int i = 0; i < 300; ++i) {
      Method more = *category.ownMethod(word.selector());
      more.selector = Selector::intern("graftingTestMore" + std::to_string(i));
      category.addMethod(more);
    }
    return &category;
  };
  return {make(std::integral_constant<std::size_t, N>())...};
}

TEST(GraftingTest, ResolvesSuperOnOtherThreadsMeanwhile) {
  Class& base = Base<7>::staticClass();
  const auto categories = stackedCategories(base.name(), std::make_index_sequence<8>());
  std::atomic<bool> ends = false;
  std::atomic<int> ready = 0;
  std::atomic<int> wrong = 0;
  const auto sendOn = [&] {
    const Ref<Base<7>> own = make<Base<7>>();
    for (++ready; !ends;) {
      const Text answer = both(own);
      if (answer && answer->text() != "base") ++wrong;
      if (inherited(own)->text() != "base") ++wrong;
    }
  };
  std::array<std::thread, 3> senders;
  for (std::thread& sender : senders) sender = std::thread(sendOn);
  while (ready < 3) std::this_thread::yield();
  for (Class* category : categories) EXPECT_TRUE(graftCategory(*category, base));
  ends = true;
  for (std::thread& sender : senders) sender.join();
  EXPECT_EQ(wrong, 0);
  EXPECT_EQ(both(make<Base<7>>())->text(), "base");
}

// A host whose methods have another type than the categories answer.
const Message<std::int64_t(Text)> countedWord{"graftingTestWord"};
const Message<std::int64_t(Text)> countedClassWord{"graftingTestClassWord"};
std::int64_t countLetters(Object&, const Method&, Ref<Object> text) {
  return static_cast<std::int64_t>(text ? text->description().size() : 0);
}

void changeTypes(Class& owner) {
  using registration::record;
  owner.addMethod(record<std::int64_t, Text>(word.selector(), &countLetters));
  owner.metaclass().addMethod(record<std::int64_t, Text>(classWord.selector(), &countLetters));
}

std::vector<std::string> namesLeftBy(const Class& category) {
  std::vector<std::string> names;
  for (const LeftToHost& left : graftOf(category)->leftToHost) {
    EXPECT_EQ(left.hostMethod->signature, &countedWord.signature());
    names.push_back((left.isClassMethod ? "+" : "-") + std::string(left.override->selector.name()));
  }
  return names;
}
const std::vector<std::string> bothWords = {"-graftingTestWord", "+graftingTestClassWord"};

template <int N>
void expectBaseKeepsItsTypes() {
  const Ref<Base<N>> base = make<Base<N>>();
  EXPECT_EQ(countedWord(base, string("four")), 4);
  EXPECT_EQ(countedClassWord(Base<N>::staticClass(), string("five5")), 5);
  EXPECT_EQ(inherited(base)->text(), "base+B") << "the rest of the category is there";
  const Ref<Base<N>> derived = make<Derived<N>>();
  EXPECT_EQ(word(derived)->text().back(), 'D') << "the subclass's own method is of the category's type";
  EXPECT_EQ(inherited(derived)->text(), "base+B+D");
  EXPECT_EQ(countedClassWord(Derived<N>::staticClass(), string("six")), 3) << "inherited";
}

TEST(GraftingTest, LeavesMethodsOfAnotherTypeToTheHost) {
  changeTypes(Base<8>::staticClass());
  Class& onBaseFirst = category<onBase>(8, Base<8>::staticClass().name());
  Class& onDerivedThen = category<onDerived>(8, Derived<8>::staticClass().name());
  graftCategory(onBaseFirst, Base<8>::staticClass());
  graftCategory(onDerivedThen, Derived<8>::staticClass());
  expectBaseKeepsItsTypes<8>();
  EXPECT_EQ(namesLeftBy(onBaseFirst), bothWords);
  EXPECT_EQ(namesLeftBy(onDerivedThen), (std::vector<std::string>{"+graftingTestClassWord"}));
}

TEST(GraftingTest, LeavesThemInTheOtherOrderToo) {
  changeTypes(Base<9>::staticClass());
  Class& onDerivedFirst = category<onDerived>(9, Derived<9>::staticClass().name());
  Class& onBaseThen = category<onBase>(9, Base<9>::staticClass().name());
  graftCategory(onDerivedFirst, Derived<9>::staticClass());
  graftCategory(onBaseThen, Base<9>::staticClass());
  expectBaseKeepsItsTypes<9>();
  EXPECT_EQ(namesLeftBy(onBaseThen), bothWords);
  EXPECT_EQ(namesLeftBy(onDerivedFirst), (std::vector<std::string>{"+graftingTestClassWord"}));
}

// The superclass's method is what the category expects, the subclass changed it.
TEST(GraftingTest, LeavesToASubclassWhatItChanged) {
  changeTypes(Derived<10>::staticClass());
  Class& lower = category<onDerived>(10, Derived<10>::staticClass().name());
  graftCategory(category<onBase>(10, Base<10>::staticClass().name()), Base<10>::staticClass());
  graftCategory(lower, Derived<10>::staticClass());
  const Ref<Base<10>> derived = make<Derived<10>>();
  EXPECT_EQ(countedWord(derived, string("four")), 4);
  EXPECT_EQ(word(make<Base<10>>())->text(), "base+B");
  EXPECT_EQ(both(derived)->text(), "nil&base+B") << "super reaches the host's method, which has another type";
  EXPECT_EQ(namesLeftBy(lower), bothWords);
}

class Viewed : public SafeCategory {
 public:
  Text word() { return super(ax::word) + "+V"; }
};

TEST(GraftingTest, ShowsAnObjectAsACategory) {
  const Selector name = "GraftingTestViewed"_key;
  const Ref<Object> derived = make<Derived<5>>();
  const std::size_t before = castMismatches();
  testing::internal::CaptureStderr();
  EXPECT_FALSE(castAsSafeCategory<Viewed>(name, derived)) << "there is no such category yet";
  Class& viewed =
      addCategory({std::string(name.name()), "GraftingTest.Derived5", {overrides<&Viewed::word>(word)}});
  EXPECT_FALSE(castAsSafeCategory<Viewed>(name, derived)) << "not grafted yet";
  graftCategory(viewed, Derived<5>::staticClass());
  bool mismatch = true;
  EXPECT_EQ(castAsSafeCategory<Viewed>(name, derived, &mismatch)->word()->text(), "base>derived+V");
  EXPECT_FALSE(mismatch);
  EXPECT_FALSE(castAsSafeCategory<Viewed>(name, make<Base<5>>(), &mismatch));
  EXPECT_TRUE(mismatch);
  EXPECT_FALSE(castAsSafeCategory<Viewed>(name, nullptr, &mismatch));
  EXPECT_FALSE(mismatch);
  testing::internal::GetCapturedStderr();
  EXPECT_EQ(castMismatches(), before + 3);
}

// A host method that raises, and a category that raises by itself, by way of another object, or not at all.
class Raising : public Base<11> {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Raising>("GraftingTest.Raising", Base<11>::staticClass())
                               .method<&Raising::inherited>("graftingTestInherited")
                               .build();
    return result;
  }
  Text inherited() { throw std::runtime_error("the host"); }
};
class OnRaising : public SafeCategory {
 public:
  Text inherited() { return super(ax::inherited); }
  Text word() { return ax::inherited(make<Raising>()); }
  std::int64_t countDown(std::int64_t from) { return super(ax::countDown, from) + std::stoi("no number"); }
};
TEST(GraftingTest, LetsNothingOutButWhatSuperRaises) {
  using C = OnRaising;
  Class& category = addCategory({"GraftingTestOnRaising",
                                 "GraftingTest.Raising",
                                 {overrides<&C::inherited>(inherited), overrides<&C::word>(word),
                                  overrides<&C::countDown>(countDown)}});
  graftCategory(category, Raising::staticClass());
  const Ref<Object> object = make<Raising>();
  EXPECT_THROW(inherited(object), std::runtime_error);
  EXPECT_EQ(word(object), nullptr) << "another object's method has raised";
  EXPECT_EQ(countDown(object, 3), 0) << "and here the category itself";
}

}  // namespace

}  // namespace ax
