#include "platform/formatting/MessagePattern.h"

#include <gtest/gtest.h>

#include <cmath>

#include "platform/formatting/StringTable.h"
#include "tests/formatting/RegionScope.h"

namespace ax::formatting {

using std::string;

TEST(MessagePatternTest, FillsPlacesInAnyOrder) {
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

TEST(MessagePatternTest, ChoosesPluralForms) {
  const char* const days = "{0, plural, one {# day} other {# days}} for {1}";
  const RegionScope english("en_US");
  EXPECT_EQ(formatMessage(days, {std::int64_t{0}, string("Ada")}), "0 days for Ada");
  EXPECT_EQ(formatMessage(days, {std::int64_t{1}, string("Ada")}), "1 day for Ada");
  EXPECT_EQ(formatMessage(days, {std::int64_t{1200}, string("Ada")}), "1,200 days for Ada");
  EXPECT_EQ(formatMessage(days, {1.5, string("Ada")}), "1.5 days for Ada");
  const char* const forms = "{0, plural, zero {z} one {o} two {t} few {f} many {m} other {x}}";
  const RegionScope arabic("ar_EG");
  string all;
  for (const std::int64_t count : {0, 1, 2, 3, 11, 100}) all += formatMessage(forms, {count});
  EXPECT_EQ(all, "zotfmx");
}

TEST(MessagePatternTest, AgreesWithANumberThatWasWrittenBefore) {
  const char* const days = "{0, plural, one {# day} other {# days}}";
  const RegionScope english("en_US");
  EXPECT_EQ(formatMessage(days, {decimalNumber(1.004, 2)}), "1 day") << "by what is seen";
  EXPECT_EQ(formatMessage(days, {decimalNumber(0.996, 0)}), "1 day");
  EXPECT_EQ(formatMessage(days, {decimalNumber(1.04, 2)}), "1.04 days");
  EXPECT_EQ(formatMessage(days, {percentNumber(0.01)}), "1% day");
  EXPECT_EQ(formatMessage(days, {string("1")}), "1 days") << "a text is no number, whatever it looks like";
  EXPECT_EQ(formatMessage(days, {string()}), "");
  const RegionScope french("fr_FR");
  EXPECT_EQ(
      formatMessage("{0, plural, one {# jour} many {# de jours} other {# jours}}", {decimalNumber(1.5, 2)}),
      "1,5 jour");
}

TEST(MessagePatternTest, AgreesWithTheNumberThatATextEndsWith) {
  const RegionScope scope("ar_EG");
  const char* const days = "{0, plural, zero {z#} one {o} two {t} few {f#} many {m#} other {x#}}";
  const auto fraction = [](std::int64_t amount, std::int64_t goal) {
    return filledMessage("{0} / {1}", std::vector<MessageArgument>{amount, goal});
  };
  EXPECT_EQ(formatMessage(days, {fraction(1, 5)}), "f١ / ٥");
  EXPECT_EQ(formatMessage(days, {fraction(5, 1)}), "x٥ / ١") << "the amount is not lost with the goal";
  EXPECT_EQ(formatMessage(days, {filledMessage("{0}", std::vector<MessageArgument>{std::int64_t{1}})}), "o");
  EXPECT_EQ(formatMessage(days, {filledMessage("{0}!", std::vector<MessageArgument>{std::int64_t{3}})}),
            "x٣!");
}

TEST(MessagePatternTest, SaysASignEvenWhereTheNumberIsAWord) {
  const char* const days = "{0, plural, zero {#} one {يوم} two {يومان} few {# أيام} many {#} other {#}}";
  const RegionScope scope("ar_EG");
  EXPECT_EQ(formatMessage(days, {std::int64_t{-1}}), "ناقص يوم");
  EXPECT_EQ(formatMessage(days, {decimalNumber(-3, 2)}), "\u061C\u2212٣ أيام");
}

TEST(MessagePatternTest, PutsNumbersInTheirUnit) {
  const RegionScope scope("en_US");
  const char* const pattern = "{0, unit, 1} a day";
  const CountedNoun mile{"miles", "{0, plural, one {# mile} other {# miles}}"};
  EXPECT_EQ(formatMessage(pattern, {decimalNumber(1, 2), mile}), "1 mile a day");
  EXPECT_EQ(formatMessage(pattern, {std::int64_t{1200}, mile}), "1,200 miles a day");
  EXPECT_EQ(formatMessage(pattern, {string("--"), mile}), "-- miles a day");
  EXPECT_EQ(formatMessage(pattern, {1.5, string("km")}), "1.5 km a day");
  EXPECT_EQ(formatMessage(pattern, {1.5, string()}), "1.5 a day");
  EXPECT_EQ(formatMessage(pattern, {1.5}), "{1} a day");
  EXPECT_EQ(formatMessage("in {1}", {1.5, mile}), "in miles");
}

TEST(MessagePatternTest, SaysNoValueWithoutANoun) {
  const double none = std::nan("");
  const char* const days = "for {0, plural, one {# day} other {# days}}";
  const CountedNoun mile{"miles", "{0, plural, one {# mile} other {# miles}}"};
  const RegionScope scope("en_US");
  EXPECT_EQ(formatMessage(days, {none}), "no value");
  EXPECT_EQ(formatMessage(days, {decimalNumber(-HUGE_VAL, 0)}), "no value");
  EXPECT_EQ(formatMessage("{1}, {0, plural, one {# day} other {# days}}", {none, string("Ada")}),
            "Ada, no value");
  EXPECT_EQ(formatMessage("{0, unit, 1}", {decimalNumber(none, 2), mile}), "no value");
  EXPECT_EQ(formatMessage("{0, unit, 1}", {none, string("km")}), "no value");
  EXPECT_EQ(formatMessage("{0, number, percent}", {none}), "no value");
}

TEST(MessagePatternTest, KeepsTheNounBehindATextThatIsReady) {
  using Arguments = std::vector<MessageArgument>;
  const CountedNoun mile{"miles", "{0, plural, one {# mile} other {# miles}}"};
  const RegionScope scope("en_US");
  const NumberText ready = filledMessage("{0}", Arguments{string("349")});
  EXPECT_FALSE(ready.isNoValue || ready.operands);
  EXPECT_EQ(formatMessage("{0, plural, one {# day} other {# days}}", {ready}), "349 days");
  EXPECT_EQ(formatMessage("{0, unit, 1}", {ready, mile}), "349 miles");
  EXPECT_EQ(formatMessage("{0, unit, 1}", {ready, string("km")}), "349 km");
  const NumberText line = filledMessage("{0}: {1}", Arguments{string("Steps"), std::nan("")});
  EXPECT_EQ(line.text, "Steps: no value");
  EXPECT_FALSE(line.isNoValue) << "the text is not lost in what stands around it";
}

TEST(MessagePatternTest, GivesNothingForWhatCannotBeFilled) {
  const RegionScope scope("en_US");
  for (const char* pattern : {"{0", "{0} }{", "{name}", "{0, plural, one {# day}}", "{0, nonsense}", "{}",
                              "{0, select, 1 {day} other {days}}", "{0, plural, =1 {a day} other {days}}",
                              "{0, unit}", "{0, unit, x}", "{0, number, #0}"}) {
    EXPECT_EQ(formatMessage(pattern, {std::int64_t{1}}), "") << pattern;
  }
}

namespace {

string tableFolder() {
  static const int here = 0;
  return resourceFolderBeside(&here, "../share/axvelto-tests/Table");
}

}  // namespace

TEST(StringTableTest, FallsBackFromLocaleToLanguageToRoot) {
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

TEST(StringTableTest, AnswersTheSameTextForAKeyAndLanguage) {
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

TEST(StringTableTest, ListsTheKeysOfEachFile) {
  const StringTable table(tableFolder());
  EXPECT_EQ(table.keys(), (std::vector<string>{"empty", "greeting.hello", "only.english", "zebra"}));
  EXPECT_EQ(table.keys("de"), std::vector<string>{"greeting.hello"});
  EXPECT_TRUE(table.keys("fr").empty());
  EXPECT_TRUE(table.keys("../Table/de").empty());
}

TEST(StringTableTest, WithoutAFolderIsEmpty) {
  const StringTable table("/nonexistent");
  EXPECT_EQ(table.find("greeting.hello"), nullptr);
  EXPECT_TRUE(table.keys().empty());
  int onTheStack = 0;
  EXPECT_EQ(resourceFolderBeside(&onTheStack, "x"), "");
}

}  // namespace ax::formatting
