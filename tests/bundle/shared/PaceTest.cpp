#include <gtest/gtest.h>

#include <chrono>

#include "platform/foundation/AttributedString.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

namespace ax {

namespace {

struct Spoken {
  std::string text;
  std::string asDuration;  // the part that is marked to be spoken as minutes and seconds
  bool operator==(const Spoken&) const = default;
};

std::ostream& operator<<(std::ostream& out, const Spoken& spoken) {
  return out << '"' << spoken.text << "\" with \"" << spoken.asDuration << "\" marked";
}

Spoken spokenPace(const std::string& shown) {
  const auto speak = exported<Ref<AccessibilityAttributedString>(const Ref<String>&)>(
      "accessibilityAttributedStringForPaceContainingString");
  const Ref<AccessibilityAttributedString> spoken = speak(string(shown));
  if (!spoken) return {"(nil)", ""};
  Spoken result{spoken->text(), ""};
  for (const TextAttribute& attribute : spoken->attributes()) {
    EXPECT_EQ(attribute.key, DurationTimeMMSS);
    result.asDuration += spoken->text().substr(attribute.range.location, attribute.range.length);
  }
  return result;
}

class PaceTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }
};

TEST_F(PaceTest, IsMarkedAsADurationInSeconds) {
  EXPECT_EQ(spokenPace("5'30\""), (Spoken{"330", "330"}));
  EXPECT_EQ(spokenPace("12' 05''"), (Spoken{"725", "725"}));
  for (const std::string space :
       {"\t", "\u00a0", "\u1680", "\u2007", "\u200a", "\u202f", "\u3000", "\u2028", "\u0085"}) {
    EXPECT_EQ(spokenPace("5'" + space + "30\""), (Spoken{"330", "330"})) << '"' << space << '"';
  }
  EXPECT_EQ(spokenPace("0'0\""), (Spoken{"0", "0"}));
  EXPECT_EQ(spokenPace("7'9''"), (Spoken{"429", "429"}));
  EXPECT_EQ(spokenPace("20'00\""), (Spoken{"1200", "1200"})) << "without grouping";
  EXPECT_EQ(spokenPace("5'30\"/km"), (Spoken{"330/km", "330"}));
  EXPECT_EQ(spokenPace("Ø 330 \u2013 5'30\" und 6'00\""), (Spoken{"Ø 330 \u2013 330 und 6'00\"", "330"}))
      << "the first pace alone, not the same figure before it";
  EXPECT_EQ(spokenPace(std::string(5000, 'x') + " 1'01\""), (Spoken{std::string(5000, 'x') + " 61", "61"}));
}

TEST_F(PaceTest, LeavesOtherTextsAsTheyAre) {
  const std::string others[] = {
      "330",     "5:30",  "5'",      "5' 30",  "5'  30\"", "5'\u202f\u202f30\"", "5'60\"",
      "5'300\"", "'30\"", "5'3 0''", "\u2013", "-",        "5\u203230\u2033",    "a'30\"",
      "5'30 \""};
  for (const std::string& text : others) EXPECT_EQ(spokenPace(text), (Spoken{text, ""}));
  EXPECT_EQ(spokenPace(""), (Spoken{"(nil)", ""}));
}

TEST_F(PaceTest, SaysThatThereIsNoDataWhereDashesStand) {
  for (const std::string shown : {"--", "\u2013\u2013", "--'--\"", "\u2013\u2013/km", "5'30\" --"}) {
    EXPECT_EQ(spokenPace(shown), (Spoken{"No data", ""})) << shown;
  }
  EXPECT_EQ(spokenPace("\u2013-"), (Spoken{"\u2013-", ""}));
}

TEST_F(PaceTest, WritesFiguresInTheLanguageOfTheReader) {
  const EnvironmentScope arabic(Environment{.locale = "ar_EG"});
  EXPECT_EQ(spokenPace("5'30\""), (Spoken{"\u0663\u0663\u0660", "\u0663\u0663\u0660"}));
  EXPECT_EQ(spokenPace("\u0665'\u0663\u0660\""), (Spoken{"\u0665'\u0663\u0660\"", ""}));
  EXPECT_EQ(spokenPace("\u0661\u0665'30\"").text, "\u0669\u0663\u0660") << "minutes in figures of any script";
}

TEST_F(PaceTest, SurvivesEndlessFigures) {
  EXPECT_EQ(spokenPace("99999999999999999999'30\""), (Spoken{"9223372036854775807", "9223372036854775807"}));
  EXPECT_EQ(spokenPace("153722867280912930'08\""), (Spoken{"9223372036854775807", "9223372036854775807"}));
  EXPECT_EQ(spokenPace(std::string(100'000, '0') + "5'30\"").text, "330");
  EXPECT_EQ(spokenPace(std::string(900, '7') + " 5'30\"").asDuration, "330") << "of any pace after them";
}

// Every further digit costs the search as many steps as there are.
TEST_F(PaceTest, LosesItsMarkAndNoTextWhereSearchingTakesTooLong) {
  const std::string endless = std::string(1'000'000, '7');
  const auto start = std::chrono::steady_clock::now();
  EXPECT_EQ(spokenPace(endless + " 5'30\""), (Spoken{endless + " 5'30\"", ""}));
  EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(5));
}

}  // namespace

}  // namespace ax
