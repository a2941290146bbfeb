// Walks the compiled string tables of the build tree: every key in every language.

#include <gtest/gtest.h>
#include <unicode/localpointer.h>
#include <unicode/messagepattern.h>
#include <unicode/msgfmt.h>
#include <unicode/plurrule.h>
#include <unicode/uchar.h>
#include <unicode/ures.h>

#include <filesystem>
#include <map>
#include <memory>
#include <ostream>
#include <set>
#include <string>
#include <vector>

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

const std::vector<std::string> languages = {"root", "de", "fr", "es", "ja", "ar"};  // the root is English

// Texts that are rightly the same in English and in another language.
const std::map<std::string, std::set<std::string>> sameAsEnglish = {
    {"de", {"Frost", "Name", "Tornado", "Trends", "Yoga"}},
    {"fr",
     {"Blizzard", "Date", "Distance", "Message", "Messages", "Total", "Yoga", "calories", "image",
      "kilocalorie", "kilocalories", "kilojoules", "mile", "miles", "minutes", "yards"}},
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
  const auto top = std::filesystem::read_symlink("/proc/self/exe").parent_path().parent_path();
  UErrorCode status = U_ZERO_ERROR;
  const icu::LocalUResourceBundlePointer bundle(
      ures_openDirect((top / place.folder).c_str(), language.c_str(), &status));
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
  for (const char* argument : {"{0}", "{1}"}) text.findAndReplace(argument, " ");
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

std::string format(const Table& table, const std::string& language, const std::string& key,
                   const std::vector<icu::Formattable>& arguments) {
  UErrorCode status = U_ZERO_ERROR;
  const icu::MessageFormat message(table.at(key), localeOf(language), status);
  UnicodeString result;
  icu::FieldPosition ignored(icu::FieldPosition::DONT_CARE);
  message.format(arguments.data(), static_cast<int32_t>(arguments.size()), result, ignored, status);
  EXPECT_TRUE(U_SUCCESS(status)) << key << ": " << u_errorName(status);
  return utf8(result);
}

icu::Formattable text(const char* value) {
  return icu::Formattable(UnicodeString::fromUTF8(value));
}

class StringTables : public testing::TestWithParam<TablePlace> {
 protected:
  const Table english = load(GetParam(), "root");

  // Calls `check(language, key, text)` for every text of every language, English included.
  template <typename Check>
  void everyText(Check check) const {
    for (const std::string& language : languages) {
      for (const auto& [key, value] : load(GetParam(), language)) {
        SCOPED_TRACE(language + ", " + key + ": " + utf8(value));
        check(language, key, value);
      }
    }
  }
};

TEST_P(StringTables, HoldTheSameKeysAndArgumentsInEveryLanguage) {
  for (const std::string& language : languages) {
    SCOPED_TRACE(language);
    EXPECT_EQ(keysOf(load(GetParam(), language)), keysOf(english));
  }
  everyText([this](const std::string&, const std::string& key, const UnicodeString& value) {
    const auto original = english.find(key);
    if (original == english.end()) return;
    EXPECT_EQ(argumentsOf(value), argumentsOf(original->second));
  });
}

TEST_P(StringTables, HaveThePluralFormsOfTheirLanguage) {
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

TEST_P(StringTables, AreTranslated) {
  everyText([this](const std::string& language, const std::string& key, const UnicodeString& value) {
    if (language == "root" || isAbbreviation(english, key) || !hasWordOfThreeLetters(value)) return;
    const auto original = english.find(key);
    if (original == english.end() || original->second != value) return;
    const auto justified = sameAsEnglish.find(language);
    EXPECT_TRUE(justified != sameAsEnglish.end() && justified->second.contains(utf8(value)));
  });
}

TEST_P(StringTables, AreFitToBeSpoken) {
  everyText([this](const std::string&, const std::string& key, const UnicodeString& value) {
    ASSERT_FALSE(value.isEmpty());
    EXPECT_FALSE(u_isUWhiteSpace(value[0]) || u_isUWhiteSpace(value[value.length() - 1]));
    EXPECT_EQ(value.indexOf(u"  "), -1);
    EXPECT_FALSE(value.indexOf('.') > 0 && english.contains(utf8(value))) << "a raw key";
    if (!isAbbreviation(english, key)) expectSpeakable(value);
  });
}

INSTANTIATE_TEST_SUITE_P(All, StringTables, testing::ValuesIn(places),
                         [](const auto& place) { return place.param.name; });

TEST(AccessibilityTable, TakesTheArgumentsThatTheCategoriesGive) {
  using Arguments = std::map<int, bool>;
  const Arguments none, oneText = {{0, false}}, twoTexts = {{0, false}, {1, false}}, count = {{0, true}};
  const std::map<std::string, Arguments> expected = {{"calories.format", oneText},
                                                     {"calories.format.zero", oneText},
                                                     {"heart.rate.graph.single", oneText},
                                                     {"achievement.badge.format", oneText},
                                                     {"minutes.format.out.of", twoTexts},
                                                     {"quantity.fraction.format.without.units", twoTexts},
                                                     {"heart.rate.graph.range", twoTexts},
                                                     {"trends.value.with.unit", twoTexts},
                                                     {"minutes.format", count},
                                                     {"badge.format", count}};
  for (const auto& [key, value] : load(places[0], "root")) {
    const auto found = expected.find(key);
    EXPECT_EQ(argumentsOf(value), found == expected.end() ? none : found->second) << key;
  }
}

TEST(AccessibilityTable, SpeaksAmountsInTheirNumber) {
  const Table en = load(places[0], "root"), fr = load(places[0], "fr"), ar = load(places[0], "ar");
  EXPECT_EQ(format(en, "root", "calories.format", {text("1")}), "1 calorie");
  EXPECT_EQ(format(en, "root", "calories.format", {text("1 of 500")}), "1 of 500 calories");
  EXPECT_EQ(format(fr, "fr", "calories.format.zero", {text("0")}), "0 calorie");
  EXPECT_EQ(format(fr, "fr", "calories.format.zero", {text("0 sur 500")}), "0 sur 500 calories");
  EXPECT_EQ(format(fr, "fr", "minutes.format", {2000000}), "2\u202f000\u202f000 de minutes");
  EXPECT_EQ(format(ar, "ar", "minutes.format", {2}), "دقيقتان");
  EXPECT_EQ(format(ar, "ar", "calories.format", {text("١")}), "سعرة حرارية واحدة");
}

TEST(PlatformTable, TellsFortyEightWeatherConditionsApart) {
  for (const std::string& language : languages) {
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
