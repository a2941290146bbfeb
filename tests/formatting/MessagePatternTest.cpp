#include "platform/formatting/MessagePattern.h"

#include <gtest/gtest.h>

#include "platform/formatting/StringTable.h"
#include "tests/formatting/RegionScope.h"

namespace ax::formatting {

using std::string;

TEST(MessagePattern, fillsPlacesInAnyOrder) {
  const RegionScope scope("en_US");
  EXPECT_EQ(formatMessage("{1} before {0}, {1}", {string("a"), string("b")}), "b before a, b");
  EXPECT_EQ(formatMessage("{0} of {1}", {std::int64_t{1500}, 2.5}), "1,500 of 2.5");
  EXPECT_EQ(formatMessage("nothing to fill", {string("unused")}), "nothing to fill");
  EXPECT_EQ(formatMessage("", {}), "");
  EXPECT_EQ(formatMessage("{0} and {1}", {string("one")}), "one and {1}");
  EXPECT_EQ(formatMessage("{0}", {string("{1} isn't a place")}), "{1} isn't a place");
  EXPECT_EQ(formatMessage("it''s {0}, '{0}'", {string("Grüße 🏃")}), "it's Grüße 🏃, {0}");
  EXPECT_EQ(formatMessage("{10}", std::vector<MessageArgument>(11, string("x"))), "x");
}

TEST(MessagePattern, choosesPluralForms) {
  const char* const days = "{0, plural, =0 {no days} one {# day} other {# days}} for {1}";
  const RegionScope english("en_US");
  EXPECT_EQ(formatMessage(days, {std::int64_t{0}, string("Ada")}), "no days for Ada");
  EXPECT_EQ(formatMessage(days, {std::int64_t{1}, string("Ada")}), "1 day for Ada");
  EXPECT_EQ(formatMessage(days, {std::int64_t{1200}, string("Ada")}), "1,200 days for Ada");
  EXPECT_EQ(formatMessage(days, {1.5, string("Ada")}), "1.5 days for Ada");
  const char* const forms = "{0, plural, zero {z} one {o} two {t} few {f} many {m} other {x}}";
  const RegionScope arabic("ar_EG");
  string all;
  for (const std::int64_t count : {0, 1, 2, 3, 11, 100}) all += formatMessage(forms, {count});
  EXPECT_EQ(all, "zotfmx");
}

TEST(MessagePattern, givesNothingForWhatCannotBeFilled) {
  const RegionScope scope("en_US");
  for (const char* pattern : {"{0", "{0} }{", "{name}", "{0, plural, one {# day}}", "{0, nonsense}", "{}"}) {
    EXPECT_EQ(formatMessage(pattern, {std::int64_t{1}}), "") << pattern;
  }
  EXPECT_EQ(formatMessage("{0, plural, other {# days}}", {string("many")}), "");
}

namespace {

string tableFolder() {
  static const int here = 0;
  return resourceFolderBeside(&here, "../share/axvelto-tests/Table");
}

}  // namespace

TEST(StringTable, fallsBackFromLocaleToLanguageToRoot) {
  const StringTable table(tableFolder());
  const RegionScope austria("de_AT");
  ASSERT_NE(table.find("greeting.hello"), nullptr);
  EXPECT_EQ(*table.find("greeting.hello"), "Grüß Gott, {0}");
  EXPECT_EQ(*table.find("only.english"), "English only");
  EXPECT_EQ(*table.find("empty"), "");
  EXPECT_EQ(table.find("missing"), nullptr);
  const RegionScope japan("ja_JP");
  EXPECT_EQ(*table.find("greeting.hello"), "Hello, {0}");
}

TEST(StringTable, answersTheSameTextForAKeyAndLanguage) {
  const StringTable table(tableFolder());
  const RegionScope german("de_DE");
  const string* const text = table.find("greeting.hello");
  const RegionScope english("en_US");
  EXPECT_NE(table.find("greeting.hello"), text);
  setCurrentRegion({"de_CH", "UTC"});
  EXPECT_EQ(table.find("greeting.hello"), text);
  EXPECT_EQ(table.find("greeting.hello", "de"), text);
  EXPECT_EQ(table.find("greeting.hello", "de-DE"), text);
}

TEST(StringTable, listsTheKeysOfEachFile) {
  const StringTable table(tableFolder());
  EXPECT_EQ(table.keys(), (std::vector<string>{"empty", "greeting.hello", "only.english", "zebra"}));
  EXPECT_EQ(table.keys("de"), std::vector<string>{"greeting.hello"});
  EXPECT_TRUE(table.keys("fr").empty());
  EXPECT_TRUE(table.keys("../Table/de").empty());
}

TEST(StringTable, withoutAFolderIsEmpty) {
  const StringTable table("/nonexistent");
  EXPECT_EQ(table.find("greeting.hello"), nullptr);
  EXPECT_TRUE(table.keys().empty());
  int onTheStack = 0;
  EXPECT_EQ(resourceFolderBeside(&onTheStack, "x"), "");
}

}  // namespace ax::formatting
