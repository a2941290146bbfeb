// Walks the compiled string tables of the build tree: every key in every language.

#include <gtest/gtest.h>
#include <unicode/localpointer.h>
#include <unicode/messagepattern.h>
#include <unicode/msgfmt.h>
#include <unicode/plurrule.h>
#include <unicode/uchar.h>
#include <unicode/ures.h>

#include <cmath>
#include <filesystem>
#include <map>
#include <memory>
#include <ostream>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "platform/formatting/MessagePattern.h"
#include "platform/formatting/Region.h"
#include "platform/formatting/StringTable.h"
#include "tests/formatting/RegionScope.h"

namespace ax {

namespace {

using icu::MessagePattern;
using icu::UnicodeString;
using Table = std::map<std::string, UnicodeString>;

struct TablePlace {
  std::string name;
  std::string folder;  // relative to the root of the build tree

  friend void PrintTo(const TablePlace& place, std::ostream* out) { *out << place.name; }
};

const std::vector<TablePlace> places = {{"Accessibility", "lib/AXVelto/resources/Accessibility"},
                                        {"Platform", "share/axvelto/Platform"},
                                        {"Host", "share/axvelto/Host"},
                                        {"Reader", "share/axvelto/Reader"}};

std::string folderOf(const TablePlace& place) {
  return std::filesystem::read_symlink("/proc/self/exe").parent_path().parent_path() / place.folder;
}

// Those of the module's table, which every other table has as well; the root is English.
std::vector<std::string> languages() {
  return formatting::tableLanguages(folderOf(places.front()));
}

// Texts that are rightly the same in English and in another language.
const std::map<std::string, std::set<std::string>> sameAsEnglish = {
    {"de", {"Frost", "Name", "Tornado", "Trends", "Yoga", "minus {0}"}},
    {"fr",
     {"Blizzard", "Date", "Distance", "Message", "Messages", "Total", "Yoga", "calories", "image",
      "kilocalorie", "kilocalories", "kilojoules", "mile", "miles", "minutes", "watt", "watts", "yards"}},
    {"es", {"Tornado", "Total", "Yoga"}}};

std::string utf8(const UnicodeString& text) {
  std::string result;
  return text.toUTF8String(result);
}

icu::Locale localeOf(const std::string& language) {
  return language == "root" ? icu::Locale::getEnglish() : icu::Locale(language.c_str());
}

// Empty when the table was not built, so that every walk over it fails.
Table load(const TablePlace& place, const std::string& language) {
  UErrorCode status = U_ZERO_ERROR;
  const icu::LocalUResourceBundlePointer bundle(
      ures_openDirect(folderOf(place).c_str(), language.c_str(), &status));
  Table table;
  while (U_SUCCESS(status) && ures_hasNext(bundle.getAlias())) {
    const char* key = nullptr;
    int32_t length = 0;
    const UChar* text = ures_getNextString(bundle.getAlias(), &length, &key, &status);
    if (U_SUCCESS(status)) table[key] = UnicodeString(text, length);
  }
  EXPECT_TRUE(U_SUCCESS(status)) << place.folder << "/" << language << ": " << u_errorName(status);
  EXPECT_FALSE(table.empty()) << place.folder << "/" << language;
  return table;
}

std::set<std::string> keysOf(const Table& table) {
  std::set<std::string> keys;
  for (const auto& [key, text] : table) keys.insert(key);
  return keys;
}

std::unique_ptr<MessagePattern> parse(const UnicodeString& text) {
  UErrorCode status = U_ZERO_ERROR;
  auto pattern = std::make_unique<MessagePattern>(text, nullptr, status);
  EXPECT_TRUE(U_SUCCESS(status)) << utf8(text) << ": " << u_errorName(status);
  return pattern;
}

// The argument numbers, and for each whether it must be a number because a plural depends on it.
std::map<int, bool> argumentsOf(const UnicodeString& text) {
  const auto pattern = parse(text);
  std::map<int, bool> arguments;
  for (int32_t i = 0; i + 1 < pattern->countParts(); ++i) {
    if (pattern->getPartType(i) != UMSGPAT_PART_TYPE_ARG_START) continue;
    EXPECT_EQ(pattern->getPartType(i + 1), UMSGPAT_PART_TYPE_ARG_NUMBER) << utf8(text);
    bool& isCounted = arguments[pattern->getPart(i + 1).getValue()];
    isCounted |= pattern->getPart(i).getArgType() == UMSGPAT_ARG_TYPE_PLURAL;
    if (utf8(pattern->getSubstring(pattern->getPart(i + 2))) != "unit") continue;
    arguments.emplace(std::stoi(utf8(pattern->getSubstring(pattern->getPart(i + 3)))), false);
  }
  return arguments;
}

struct PluralForm {
  std::string keyword;
  bool saysNumber;
};

// The forms of the plural that starts at part `start`.
std::vector<PluralForm> formsAt(const MessagePattern& pattern, int32_t start) {
  std::vector<PluralForm> forms;
  const int32_t end = pattern.getLimitPartIndex(start);
  for (int32_t i = start + 2; i < end; ++i) {
    const std::string keyword = utf8(pattern.getSubstring(pattern.getPart(i)));
    while (pattern.getPartType(i) != UMSGPAT_PART_TYPE_MSG_START) ++i;
    const int32_t limit = pattern.getLimitPartIndex(i);
    bool saysNumber = false;
    for (; i < limit; ++i) saysNumber |= pattern.getPartType(i) == UMSGPAT_PART_TYPE_REPLACE_NUMBER;
    forms.push_back({keyword, saysNumber});
  }
  return forms;
}

std::set<std::string> pluralKeywords(const icu::PluralRules& rules) {
  UErrorCode status = U_ZERO_ERROR;
  const std::unique_ptr<icu::StringEnumeration> keywords(rules.getKeywords(status));
  std::set<std::string> result;
  while (const char* keyword = keywords->next(nullptr, status)) result.insert(keyword);
  return result;
}

// Such a form may leave its number out, as in "two" of Arabic.
bool standsForOneNumber(const icu::PluralRules& rules, const std::string& keyword) {
  int numbers = 0;
  for (int32_t number = 0; number < 1000; ++number) numbers += utf8(rules.select(number)) == keyword;
  return numbers == 1;
}

// A text that is shown as an abbreviation has a partner that is spoken in its place.
bool isAbbreviation(const Table& table, const std::string& key) {
  return table.contains(key + ".spoken");
}

bool hasWordOfThreeLetters(UnicodeString text) {
  for (const char* argument : {"{0, unit, 1}", "{0}", "{1}"}) text.findAndReplace(argument, " ");
  int run = 0;
  for (int32_t i = 0; i < text.length(); ++i) {
    run = u_isalpha(text[i]) ? run + 1 : 0;
    if (run == 3) return true;
  }
  return false;
}

std::vector<std::string> wordsOf(const UnicodeString& text) {
  std::vector<std::string> words;
  UnicodeString word;
  for (int32_t i = 0; i <= text.length(); ++i) {
    if (i < text.length() && u_isalpha(text[i])) {
      word.append(text[i]);
    } else if (!word.isEmpty()) {
      words.push_back(utf8(word));
      word.remove();
    }
  }
  return words;
}

void expectSpeakable(const UnicodeString& text) {
  static const std::set<std::string> abbreviations = {"kcal", "kJ", "km", "min", "hr", "sec",
                                                      "kg",   "lb", "ml", "bpm", "mph"};
  for (const std::string& word : wordsOf(text)) EXPECT_FALSE(abbreviations.contains(word)) << word;
  for (const char16_t symbol : {u'%', u'/', u'°', u'&', u'+'}) EXPECT_EQ(text.indexOf(symbol), -1);
  for (int32_t i = 1; i < text.length(); ++i) {
    const bool isUnitStuckToNumber = u_isdigit(text[i - 1]) && text[i] < 0x80 && u_isalpha(text[i]);
    EXPECT_FALSE(isUnitStuckToNumber);
  }
}

// What ICU's own messages, which follow CLDR's rules, make of a pattern whose arguments are all `number`.
std::string filledByIcu(const UnicodeString& pattern, const std::string& locale, double number) {
  UErrorCode status = U_ZERO_ERROR;
  const icu::MessageFormat message(pattern, icu::Locale(locale.c_str()), status);
  const std::vector<icu::Formattable> arguments(4, icu::Formattable(number));
  UnicodeString result;
  icu::FieldPosition ignored(icu::FieldPosition::DONT_CARE);
  message.format(arguments.data(), static_cast<int32_t>(arguments.size()), result, ignored, status);
  EXPECT_TRUE(U_SUCCESS(status)) << u_errorName(status);
  return utf8(result);
}

// ICU drops the sign of a number that Arabic says without a figure, and writes a hyphen for the others.
std::string asIcuHasIt(std::string text) {
  for (const auto& [ours, theirs] : {std::pair<std::string, const char*>("ناقص ", ""), {"−", "-"}}) {
    for (std::size_t at = text.find(ours); at != std::string::npos; at = text.find(ours)) {
      text.replace(at, ours.size(), theirs);
    }
  }
  return text;
}

std::string filledWith(const UnicodeString& pattern, const formatting::MessageArgument& argument) {
  return formatting::formatMessage(utf8(pattern), std::vector<formatting::MessageArgument>(4, argument));
}

// Whether the pattern has an argument of one of these types.
bool hasArgument(const UnicodeString& text, const std::set<UMessagePatternArgType>& types) {
  const auto pattern = parse(text);
  for (int32_t i = 0; i < pattern->countParts(); ++i) {
    if (pattern->getPartType(i) != UMSGPAT_PART_TYPE_ARG_START) continue;
    if (types.contains(pattern->getPart(i).getArgType())) return true;
  }
  return false;
}

class StringTablesTest : public testing::TestWithParam<TablePlace> {
 protected:
  const Table english = load(GetParam(), "root");

  // Calls `check(language, key, text)` for every text of every language, English included.
  template <typename Check>
  void everyText(Check check) const {
    for (const std::string& language : languages()) {
      for (const auto& [key, value] : load(GetParam(), language)) {
        SCOPED_TRACE(language + ", " + key + ": " + utf8(value));
        check(language, key, value);
      }
    }
  }
};

TEST_P(StringTablesTest, HoldTheSameKeysAndArgumentsInEveryLanguage) {
  EXPECT_EQ(formatting::tableLanguages(folderOf(GetParam())), languages());
  for (const std::string& language : languages()) {
    SCOPED_TRACE(language);
    EXPECT_EQ(keysOf(load(GetParam(), language)), keysOf(english));
  }
  everyText([this](const std::string&, const std::string& key, const UnicodeString& value) {
    const auto original = english.find(key);
    if (original == english.end()) return;
    std::map<int, bool> arguments = argumentsOf(value);
    for (const auto& [number, isCounted] : argumentsOf(original->second)) {
      const auto found = arguments.extract(number);
      EXPECT_TRUE(found && found.mapped() >= isCounted) << "argument " << number;
    }
    EXPECT_TRUE(arguments.empty()) << "argument " << arguments.begin()->first;
  });
}

TEST_P(StringTablesTest, HaveThePluralFormsOfTheirLanguage) {
  everyText([](const std::string& language, const std::string&, const UnicodeString& value) {
    UErrorCode status = U_ZERO_ERROR;
    const std::unique_ptr<icu::PluralRules> rules(icu::PluralRules::forLocale(localeOf(language), status));
    const auto pattern = parse(value);
    for (int32_t i = 0; i < pattern->countParts(); ++i) {
      if (pattern->getPart(i).getArgType() != UMSGPAT_ARG_TYPE_PLURAL) continue;
      if (pattern->getPartType(i) != UMSGPAT_PART_TYPE_ARG_START) continue;
      std::set<std::string> keywords;
      for (const PluralForm& form : formsAt(*pattern, i)) {
        keywords.insert(form.keyword);
        EXPECT_TRUE(form.saysNumber || standsForOneNumber(*rules, form.keyword)) << form.keyword;
      }
      EXPECT_EQ(keywords, pluralKeywords(*rules));
    }
  });
}

TEST_P(StringTablesTest, AreTranslated) {
  everyText([this](const std::string& language, const std::string& key, const UnicodeString& value) {
    if (language == "root" || isAbbreviation(english, key) || !hasWordOfThreeLetters(value)) return;
    const auto original = english.find(key);
    if (original == english.end() || original->second != value) return;
    const auto justified = sameAsEnglish.find(language);
    EXPECT_TRUE(justified != sameAsEnglish.end() && justified->second.contains(utf8(value)));
  });
}

TEST_P(StringTablesTest, AreFitToBeSpoken) {
  everyText([this](const std::string&, const std::string& key, const UnicodeString& value) {
    ASSERT_FALSE(value.isEmpty());
    EXPECT_FALSE(u_isUWhiteSpace(value[0]) || u_isUWhiteSpace(value[value.length() - 1]));
    EXPECT_EQ(value.indexOf(u"  "), -1);
    EXPECT_FALSE(value.indexOf('.') > 0 && english.contains(utf8(value))) << "a raw key";
    if (!isAbbreviation(english, key)) expectSpeakable(value);
  });
}

TEST_P(StringTablesTest, AgreeWithEveryNumberAsTheirLanguageHasIt) {
  everyText([](const std::string& language, const std::string&, const UnicodeString& value) {
    EXPECT_FALSE(hasArgument(value, {UMSGPAT_ARG_TYPE_SELECT, UMSGPAT_ARG_TYPE_CHOICE}))
        << "the form depends on a text";
    if (!hasArgument(value, {UMSGPAT_ARG_TYPE_PLURAL})) return;
    const std::string locale = formatting::likelyLocale(language);
    const RegionScope scope(locale);
    for (const double number :
         {0.0, 1.0, 2.0, 3.0, 5.0, 10.0, 11.0, 21.0, 100.0, 103.0, 1.5, 0.5, -1.0, 1e6}) {
      const std::string written = filledWith(value, formatting::decimalNumber(number, 2));
      EXPECT_EQ(filledWith(value, number), written) << number;
      const auto alone = formatting::filledMessage(
          "{0}", std::vector<formatting::MessageArgument>{formatting::decimalNumber(number, 2)});
      EXPECT_EQ(filledWith(value, alone), written) << number;
      EXPECT_EQ(asIcuHasIt(written), filledByIcu(value, locale, number)) << number;
    }
  });
}

// A table's patterns with numbers alone, and every pattern around one of them, by pattern and by unit.
TEST_P(StringTablesTest, SayNoValueAloneHoweverPatternsNest) {
  using Arguments = std::vector<formatting::MessageArgument>;
  everyText([](const std::string& language, const std::string&, const UnicodeString& value) {
    const std::map<int, bool> arguments = argumentsOf(value);
    if (arguments.empty()) return;
    const RegionScope scope(formatting::likelyLocale(language));
    const std::string none = formatting::noValueText();
    const std::string pattern = utf8(value);
    const formatting::CountedNoun unit{"x", arguments.size() == 1 ? pattern : "{0}"};
    for (const double number : {std::nan(""), HUGE_VAL, -HUGE_VAL}) {
      EXPECT_EQ(filledWith(value, number), none);
      EXPECT_EQ(formatting::formatMessage("{0, unit, 1}", {number, unit}), none);
      for (const Arguments& pair : {Arguments{number, 500.0}, Arguments{349.0, number}}) {
        const auto fraction = formatting::filledMessage("{0} / {1}", pair);
        EXPECT_EQ(filledWith(value, fraction), none);
        const auto inside = formatting::filledMessage(pattern, Arguments(4, fraction));
        EXPECT_EQ(formatting::formatMessage("{0, plural, other {# x}}", {inside}), none);
      }
    }
  });
}

// English shows best where a number meets a noun: every other place there takes a name or a percentage.
TEST_P(StringTablesTest, LeaveNoNounBesideANumberThatItDoesNotAgreeWith) {
  static const std::set<std::string> withoutNumber = {"achievement.badge.format", "weather.humidity"};
  for (const auto& [key, value] : english) {
    for (int32_t end = value.indexOf(u'}'); end >= 0; end = value.indexOf(u'}', end + 1)) {
      const bool isPlain = end >= 2 && value[end - 2] == u'{' && value[end + 1] == u' ';
      if (!isPlain || withoutNumber.contains(key)) continue;
      const bool isBeforePlace = value[end + 2] == u'{';
      const std::vector<std::string> words = wordsOf(value.tempSubString(end + 2));
      EXPECT_TRUE(isBeforePlace || std::set<std::string>({"of", "to", "per"}).contains(words.front()))
          << key << ": " << utf8(value);
    }
  }
}

INSTANTIATE_TEST_SUITE_P(All, StringTablesTest, testing::ValuesIn(places),
                         [](const auto& place) { return place.param.name; });

TEST(AccessibilityTableTest, TakesTheArgumentsThatTheCategoriesGive) {
  using Arguments = std::map<int, bool>;
  const Arguments none, oneText = {{0, false}}, twoTexts = {{0, false}, {1, false}}, count = {{0, true}};
  const Arguments amountOfGoal = {{0, false}, {1, true}};
  const std::map<std::string, Arguments> expected = {{"achievement.badge.format", oneText},
                                                     {"quantity.fraction.format.without.units", twoTexts},
                                                     {"trends.value.with.unit", twoTexts},
                                                     {"minutes.format.out.of", amountOfGoal},
                                                     {"heart.rate.graph.range", amountOfGoal},
                                                     {"heart.rate.graph.single", count},
                                                     {"calories.format", count},
                                                     {"calories.format.zero", count},
                                                     {"minutes.format", count},
                                                     {"badge.format", count}};
  for (const auto& [key, value] : load(places[0], "root")) {
    const auto found = expected.find(key);
    EXPECT_EQ(argumentsOf(value), found == expected.end() ? none : found->second) << key;
  }
}

TEST(AccessibilityTableTest, SpeaksAnAmountOfAGoal) {
  const struct {
    const char* language;
    double goal;
    const char* text;
  } cases[] = {{"root", 1, "349 of 1 calorie"},
               {"root", 500, "349 of 500 calories"},
               {"fr", 0, "349 sur 0 calorie"},
               {"de", 500, "349 von 500 Kalorien"},
               {"ja", 500, "500カロリーのうち349カロリー"},
               {"ar", 103, "٣٤٩ من ١٠٣ سعرات حرارية"},
               {"ar", 2, "٣٤٩ من ٢ سعرة حرارية"}};
  for (const auto& c : cases) {
    const RegionScope scope(formatting::likelyLocale(c.language));
    const Table table = load(places[0], c.language);
    const auto fraction = formatting::filledMessage(
        utf8(table.at("quantity.fraction.format.without.units")),
        std::vector<formatting::MessageArgument>{formatting::decimalNumber(349, 0), c.goal});
    EXPECT_EQ(filledWith(table.at("calories.format"), fraction), c.text);
  }
}

TEST(PlatformTableTest, TellsFortyEightWeatherConditionsApart) {
  for (const std::string& language : languages()) {
    const Table table = load(places[1], language);
    std::set<std::string> descriptions;
    for (int code = 0; code < 48; ++code) {
      const auto found = table.find("weather." + std::to_string(code));
      ASSERT_NE(found, table.end()) << language << " " << code;
      EXPECT_TRUE(descriptions.insert(utf8(found->second)).second) << language << " " << code;
    }
  }
}

}  // namespace

}  // namespace ax
