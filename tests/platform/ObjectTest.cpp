#include "platform/runtime/Object.h"

#include <gtest/gtest.h>

#include "platform/foundation/Array.h"
#include "platform/foundation/String.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Weak.h"

namespace ax {

namespace {

int living = 0;
const char staticKey = 0;
const char otherStaticKey = 0;
const char weakKey = 0;

class Counted : public Object {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Counted>("ObjectTest.Counted", Object::staticClass()).build();
    return result;
  }
  Counted() { ++living; }
  ~Counted() override {
    --living;
    if (atEnd) atEnd(*this);
  }
  std::function<void(Counted&)> atEnd;
};

TEST(SelectorTest, IsInternedByItsWholeText) {
  const Selector selector = Selector::intern("_titleLabel");
  EXPECT_EQ(selector, Selector::intern(std::string("_title") + "Label"));
  EXPECT_EQ(selector, "_titleLabel"_key);
  EXPECT_EQ(selector, selectorFromString("_titleLabel"));
  EXPECT_NE(selector, Selector::intern("_titlelabel"));
  EXPECT_NE(Selector::intern(std::string_view("a\0b", 3)), Selector::intern("a"));
  EXPECT_EQ(Selector::find("ObjectTest that nobody interned"), Selector());
  EXPECT_EQ(Selector::find("_titleLabel").name(), "_titleLabel");
}

TEST(SelectorTest, StaysWhereItIsWhenTheTableGrows) {
  std::vector<Selector> all;
  for (int i = 0; i < 9000; ++i) all.push_back(Selector::intern("ObjectTest.grow" + std::to_string(i)));
  for (int i = 0; i < 9000; ++i) {
    ASSERT_EQ(Selector::find("ObjectTest.grow" + std::to_string(i)), all[i]);
  }
}

TEST(ObjectTest, EndsWithItsLastHandle) {
  Ref<Counted> first = make<Counted>();
  Ref<Object> second = first;
  const Weak<Counted> weak = first;
  const Ref<Counted>& itself = first;
  first = itself;
  EXPECT_EQ(living, 1);
  first = nullptr;
  EXPECT_EQ(living, 1);
  EXPECT_EQ(weak.lock(), second);
  second = Ref<Object>();
  EXPECT_EQ(living, 0);
  EXPECT_EQ(weak.lock(), nullptr);
  EXPECT_FALSE(weak);
}

TEST(ObjectTest, IsGoneForWeakHandlesBeforeItEnds) {
  Ref<Counted> object = make<Counted>();
  Weak<Counted> weak = object;
  bool wasNil = false;
  object->atEnd = [&](Counted& self) {
    wasNil = weak.get() == nullptr;
    const Ref<Object> again(&self);
  };
  object = nullptr;
  EXPECT_TRUE(wasNil);
  EXPECT_EQ(living, 0) << "a handle made while the object ends must not end it twice";
}

TEST(ObjectTest, GivesNoWeakHandleToItselfWhileItEnds) {
  Weak<Counted> kept;
  Ref<Counted> object = make<Counted>();
  object->atEnd = [&](Counted& self) { kept = Weak<Counted>(self); };
  object = nullptr;
  EXPECT_FALSE(kept);
  EXPECT_EQ(kept.lock(), nullptr);
}

TEST(ObjectTest, IsWholeWhileItsValuesEnd) {
  std::string seen;
  const auto look = [&](Counted& owner) {
    return [&seen, &owner](Counted&) {
      const Ref<Object> other = getAssociatedObject(owner, &otherStaticKey);
      seen += (other ? other->description() : "nil") + " " + owner.isa().name() + ";";
      EXPECT_TRUE(owner.atEnd) << "its own members are there";
      EXPECT_EQ(getAssociatedObject(owner, &staticKey), nullptr) << "the value that ends is gone from it";
      EXPECT_FALSE(Weak<Counted>(owner));
      setAssociatedObject(owner, &weakKey, string("late"));
    };
  };
  Ref<Counted> owner = make<Counted>();
  owner->atEnd = [](Counted& self) { setAssociatedObject(self, &staticKey, string("later still")); };
  Ref<Counted> value = make<Counted>();
  value->atEnd = look(*owner);
  setAssociatedObject(*owner, &staticKey, std::move(value));
  setAssociatedObject(*owner, &otherStaticKey, string("other"));
  owner = nullptr;
  EXPECT_EQ(seen, "other ObjectTest.Counted;");
  EXPECT_EQ(living, 0);
}

TEST(ObjectTest, KeepsValuesUntilItEnds) {
  Ref<Counted> owner = make<Counted>();
  Ref<Counted> value = make<Counted>();
  owner->_accessibilitySetRetainedValueForKey(value, "kAXObjectTest"_key);
  setAssociatedObject(*owner, &staticKey, make<Counted>());
  setAssociatedObject(*owner, &otherStaticKey, value);
  EXPECT_EQ(owner->_accessibilityValueForKey("kAXObjectTest"_key), value);
  EXPECT_NE(getAssociatedObject(*owner, &staticKey), value);
  EXPECT_EQ(getAssociatedObject(*owner, &otherStaticKey), value);
  EXPECT_EQ(living, 3);

  setAssociatedObject(*owner, &staticKey, nullptr);
  EXPECT_EQ(getAssociatedObject(*owner, &staticKey), nullptr);
  EXPECT_EQ(living, 2);
  owner->_accessibilitySetRetainedValueForKey(nullptr, "kAXObjectTest"_key);
  owner->_accessibilitySetRetainedValueForKey(nullptr, "kAXObjectTest"_key);
  EXPECT_EQ(owner->_accessibilityValueForKey("kAXObjectTest"_key), nullptr);
  EXPECT_EQ(getAssociatedObject(*owner, &otherStaticKey), value) << "the last entry outlives one before it";
  value = nullptr;
  EXPECT_EQ(living, 2);
  owner = nullptr;
  EXPECT_EQ(living, 0);
}

TEST(ObjectTest, StoresIntoItselfWhileAValueEnds) {
  Ref<Counted> owner = make<Counted>();
  Ref<Counted> value = make<Counted>();
  value->atEnd = [&](Counted&) { setAssociatedObject(*owner, &staticKey, string("later")); };
  setAssociatedObject(*owner, &staticKey, std::move(value));
  setAssociatedObject(*owner, &staticKey, nullptr);
  EXPECT_EQ(getAssociatedObject(*owner, &staticKey)->description(), "later");
}

TEST(ObjectTest, CopiesWhatCanChange) {
  const Ref<Counted> owner = make<Counted>();
  const Ref<MutableArray> list = make<MutableArray>(Array::Items{string("one")});
  const Ref<String> text = string("text");
  setAssociatedCopiedObject(*owner, &staticKey, list);
  setAssociatedCopiedObject(*owner, &otherStaticKey, text);
  owner->_accessibilitySetRetainedValueForKey(list, "kAXObjectTest"_key);
  list->axSafelyAddObject(string("two"));
  EXPECT_EQ(cast<Array>(getAssociatedObject(*owner, &staticKey))->count(), 1u);
  EXPECT_EQ(cast<Array>(owner->_accessibilityValueForKey("kAXObjectTest"_key))->count(), 2u);
  EXPECT_EQ(getAssociatedObject(*owner, &otherStaticKey), text);
  setAssociatedCopiedObject(*owner, &staticKey, nullptr);
  EXPECT_EQ(getAssociatedObject(*owner, &staticKey), nullptr);
}

TEST(ObjectTest, IsCastToItsClassesAlone) {
  const Ref<Object> text = string("text");
  EXPECT_EQ(cast<String>(text), text);
  EXPECT_EQ(cast<Array>(text), nullptr);
  EXPECT_EQ(cast<Array>(Ref<Object>()), nullptr);
  EXPECT_FALSE(text->isKindOf(safeClassFromString("ObjectTest.NoSuchClass")));
  const Ref<Object> classObject(&String::staticClass());
  EXPECT_EQ(cast<Class>(classObject), classObject);
  EXPECT_EQ(cast<Class>(text), nullptr);
  EXPECT_EQ(cast<String>(classObject), nullptr) << "a class is none of its instances";
}

}  // namespace

}  // namespace ax
