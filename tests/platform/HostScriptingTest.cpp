#include <gtest/gtest.h>

#include <stdexcept>

#include "platform/foundation/String.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Number.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "tests/platform/AddedCategory.h"

namespace ax {

namespace {

const Message<Ref<String>(std::int64_t)> nameOf{"scriptingTestNameOf:"};
const Message<void(Ref<String>)> rename{"scriptingTestRename:"};
const Message<std::int64_t()> size{"scriptingTestSize"};

class Folder : public Object {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Folder>("ScriptingTest.Folder", Object::staticClass())
                               .instanceVariable<&Folder::owner>("_owner")
                               .method<&Folder::nameOf>("scriptingTestNameOf:")
                               .method<&Folder::rename>("scriptingTestRename:")
                               .method<&Folder::size>("scriptingTestSize")
                               .classMethod<&Folder::root>("scriptingTestRoot")
                               .conformsTo("ScriptingTestListing")
                               .build();
    return result;
  }
  Ref<String> nameOf(std::int64_t index) { return string("file " + std::to_string(index)); }
  void rename(Ref<String> name) { owner = name; }
  std::int64_t size() const { return 2; }
  static Ref<String> root() { return string("/"); }
  Ref<String> owner = string("nobody");
};

class Archive : public Folder {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Archive>("ScriptingTest.Archive", Folder::staticClass())
                               .method<&Archive::size>("scriptingTestSize")
                               .build();
    return result;
  }
  std::int64_t size() const { return 99; }
};

class FolderAccessibility : public SafeCategory {
 public:
  Ref<String> nameOf(std::int64_t index) {
    return string("spoken " + super(ax::nameOf, index)->description());
  }
};
Class& folderCategory() {
  return addCategory({"ScriptingTestFolderAccessibility",
                      "ScriptingTest.Folder",
                      {overrides<&FolderAccessibility::nameOf>(nameOf)}});
}

TEST(ScriptedAnswersTest, StandBelowGraftsForOneObject) {
  const Ref<Folder> plain = make<Folder>();
  const Ref<Folder> scripted = make<Archive>();
  const ScriptedAnswer echo = [](std::span<const Ref<Object>> arguments) {
    return string("answer " + arguments[0]->description());
  };
  EXPECT_TRUE(setScriptedAnswer(*scripted, nameOf.selector(), echo));
  EXPECT_EQ(nameOf(scripted, 7)->text(), "answer 7");
  EXPECT_EQ(nameOf(plain, 7)->text(), "file 7");
  graftCategory(folderCategory(), Folder::staticClass());
  EXPECT_EQ(nameOf(scripted, 7)->text(), "spoken answer 7");
  EXPECT_EQ(nameOf(plain, 7)->text(), "spoken file 7");
  const Ref<Folder> late = make<Folder>();
  EXPECT_TRUE(setScriptedAnswer(*late, nameOf.selector(), echo));
  EXPECT_EQ(nameOf(late, 8)->text(), "spoken answer 8") << "a script that comes after the graft";
}

TEST(ScriptedAnswersTest, ConvertRaiseAndReplace) {
  const Ref<Folder> folder = make<Archive>();
  EXPECT_FALSE(setScriptedAnswer(*folder, "scriptingTestNobodyDeclared"_key, nullptr));
  EXPECT_TRUE(setScriptedAnswer(*folder, size.selector(), [](auto) { return number(4.5); }));
  EXPECT_EQ(size(folder), 4);
  EXPECT_EQ(folder->safeIntForKey(size.selector()), 4);
  EXPECT_EQ(size(make<Archive>()), 99);
  EXPECT_EQ(size(make<Folder>()), 2);
  setScriptedAnswer(*folder, size.selector(), [](auto) { return string("many"); });
  EXPECT_EQ(size(folder), 0);
  setScriptedAnswer(*folder, size.selector(), [](auto) -> Ref<Object> { throw std::runtime_error("lost"); });
  EXPECT_THROW(size(folder), std::runtime_error);
  EXPECT_EQ(folder->safeValueForKey(size.selector()), nullptr);
  setScriptedAnswer(*folder, rename.selector(), [](auto) { return nullptr; });
  rename(folder, string("thief"));
  EXPECT_EQ(folder->owner->text(), "nobody");
}

class Vault : public Folder {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Vault>("ScriptingTest.Vault", Folder::staticClass())
                               .instanceVariable<&Vault::lock>("_lock")
                               .method<&Vault::size>("scriptingTestSize")
                               .method<&Vault::key>("_key")
                               .classMethod<&Vault::root>("scriptingTestRoot")
                               .conformsTo("ScriptingTestLocking")
                               .build();
    return result;
  }
  std::int64_t size() const { return 1; }
  Ref<String> key() { return string("key"); }
  static Ref<String> root() { return string("cellar"); }
  Ref<String> lock = string("lock");
};

TEST(HidingTest, TakesMembersOutOfReach) {
  Class& vaults = Vault::staticClass();
  const Ref<Vault> vault = make<Vault>();
  EXPECT_NE(vault->safeValueForKey("_lock"_key), nullptr);
  EXPECT_EQ(vault->safeIntForKey(size.selector()), 1);
  EXPECT_TRUE(vaults.conformsTo("ScriptingTestLocking"));
  EXPECT_TRUE(vaults.conformsTo("ScriptingTestListing")) << "adopted by the superclass";
  for (const char* member :
       {"_lock", "_key", "scriptingTestSize", "scriptingTestRoot", "ScriptingTestLocking"}) {
    EXPECT_TRUE(vaults.hideMember(member)) << member;
    EXPECT_FALSE(vaults.hideMember(member)) << member;
  }
  EXPECT_FALSE(vaults.hideMember("scriptingTestNameOf:")) << "declared by the superclass";
  EXPECT_EQ(vault->safeValueForKey("_lock"_key), nullptr);
  EXPECT_EQ(vault->safeValueForKey("_key"_key), nullptr);
  EXPECT_EQ(size(vault), 2) << "what is inherited comes through";
  EXPECT_EQ(vaults.safeValueForKey("scriptingTestRoot")->description(), "/");
  EXPECT_FALSE(vaults.conformsTo("ScriptingTestLocking"));
  EXPECT_TRUE(vaults.hasHiddenMember("_lock"_key));
  EXPECT_NE(vaults.instanceVariableEvenIfHidden("_lock"_key), nullptr);
  EXPECT_EQ(vault->lock->text(), "lock");
}

TEST(HidingTest, TakesAClassOutOfReach) {
  class Attic : public Folder {
   public:
    static Class& staticClass() {
      static Class& result = ClassBuilder<Attic>("ScriptingTest.Attic", Folder::staticClass()).build();
      return result;
    }
  };
  const Ref<Object> attic = make<Attic>();
  Attic::staticClass().hide();
  EXPECT_EQ(safeClassFromString("ScriptingTest.Attic"), nullptr);
  EXPECT_EQ(Class::namedEvenIfHidden("ScriptingTest.Attic"), &Attic::staticClass());
  EXPECT_FALSE(attic->isKindOf(safeClassFromString("ScriptingTest.Attic")));
  EXPECT_TRUE(attic->isKindOf(safeClassFromString("ScriptingTest.Folder")));
  EXPECT_EQ(size(attic), 2);
}

}  // namespace

}  // namespace ax
