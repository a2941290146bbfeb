#include <gtest/gtest.h>

#include <regex>
#include <set>

#include "platform/accessibility/CategoryRegistration.h"
#include "platform/formatting/Dates.h"
#include "platform/formatting/Lists.h"
#include "platform/formatting/Region.h"
#include "platform/formatting/StringTable.h"
#include "reader/transcript/Transcript.h"
#include "tests/tour/Samples.h"

// Every sample screen in every language, searched for what a listener would stumble over.
namespace ax::tour {

namespace {

using reader::Node;

constexpr const char* locales[] = {"en_US", "de_DE", "fr_FR", "es_ES", "ja_JP", "ar_EG"};

std::string textOf(const std::optional<reader::AttributedText>& text) {
  return text ? text->text : "";
}

std::vector<std::string> piecesOf(const std::string& text) {
  const std::string separator(formatting::listSeparator());
  std::vector<std::string> pieces;
  std::size_t start = 0;
  for (std::size_t at; (at = text.find(separator, start)) != std::string::npos;
       start = at + separator.size()) {
    pieces.push_back(text.substr(start, at - start));
  }
  pieces.push_back(text.substr(start));
  for (std::string& piece : pieces) piece.erase(0, piece.find_first_not_of(' '));
  return pieces;
}

bool hasDigit(const std::string& text) {
  return std::any_of(text.begin(), text.end(), [](unsigned char c) { return std::isdigit(c) || c >= 0xD9; });
}

std::vector<std::string> roleWords() {
  const formatting::StringTable table(
      formatting::resourceFolderBeside(reinterpret_cast<const void*>(&roleWords), "../share/axvelto/Reader"));
  std::vector<std::string> words;
  for (const std::string& key : table.keys()) {
    if (key.starts_with("role.")) words.push_back(*table.find(key));
  }
  return words;
}

bool containsWord(const std::string& text, const std::string& word) {
  const std::size_t at = text.find(word);
  if (at == std::string::npos) return false;
  const auto isLetter = [&](std::size_t i) {
    return i < text.size() && std::isalpha(static_cast<unsigned char>(text[i]));
  };
  return !(at > 0 && isLetter(at - 1)) && !isLetter(at + word.size());
}

// What is wrong with one element, in words; empty when nothing is.
std::string faultOf(const Node& node, const std::vector<std::string>& roles) {
  static const std::regex rawKey("(^|[ ,])[a-z]+(\\.[a-z0-9-]+)+($|[ ,])");
  static const std::regex abbreviated(
      "[0-9][ \\xA0\\xC2\\xE2\\x80\\xAF]*(km|kcal|kJ|min|bpm|mi|m|h|hr|sec|ft|yd|kg|lb)($|[ ,./])");
  const std::string label = textOf(node.label);
  const std::string value = textOf(node.value);
  const std::string hint = textOf(node.hint);
  if (label.empty()) return "no label";
  for (const std::string& text : {label, value, hint}) {
    if (std::regex_search(text, rawKey)) return "a raw key";
    if (std::regex_search(text, abbreviated)) return "an abbreviated unit";
  }
  if (label == value || label == hint || (!value.empty() && value == hint)) return "a text twice";
  std::set<std::string> seen;
  for (const std::string& piece : piecesOf(label)) {
    if (!hasDigit(piece) && !seen.insert(piece).second) return "a text twice";
  }
  for (const std::string& role : roles) {
    if (containsWord(label, role)) return "the role word " + role;
  }
  return "";
}

std::vector<std::string> labelsOf(const reader::Snapshot& snapshot) {
  std::vector<std::string> labels;
  for (const Node& node : snapshot.nodes()) {
    if (node.isElement) labels.push_back(textOf(node.label));
  }
  return labels;
}

// The words that the current language itself has in its tables, and its months: some are English ones too.
std::set<std::string> wordsOfLanguage() {
  std::set<std::string> words;
  for (const char* folder : {"../share/axvelto/Host", "../share/axvelto/Platform", "../share/axvelto/Reader",
                             "../lib/AXVelto/resources/Accessibility"}) {
    const formatting::StringTable table(
        formatting::resourceFolderBeside(reinterpret_cast<const void*>(&wordsOfLanguage), folder));
    for (const std::string& key : table.keys()) words.insert(*table.find(key));
  }
  constexpr double month = 30.5 * 86400;
  for (int i = 0; i < 12; ++i) words.insert(formatting::dateString((i + 0.5) * month, "MMMM"));
  return words;
}

// The words of "812 kilocalories" and of "Ada!".
std::string withoutFigure(const std::string& piece) {
  return std::regex_replace(piece, std::regex(R"(^[0-9][0-9.,]*\s*|[!.]$)"), "");
}

// Names of people, apps and places sound alike in every language, and so do some figures.
bool isName(const std::string& piece) {
  static const std::set<std::string> names = {"Ada", "Kenji", "Mia", "Noor", "Riverside Runner"};
  return names.contains(piece) || !std::regex_search(piece, std::regex("[A-Za-z]{3}"));
}

}  // namespace

TEST(Tour, SpeaksEveryScreenInEveryLanguageWithoutAFault) {
  ASSERT_FALSE(sampleScenes().empty());
  for (const auto& file : sampleScenes()) {
    for (const char* locale : locales) {
      const Presented sample(file, locale);
      const std::vector<std::string> roles = roleWords();
      std::size_t elements = 0;
      for (const Node& node : sample.snapshot.nodes()) {
        if (!node.isElement) continue;
        ++elements;
        EXPECT_EQ(faultOf(node, roles), "")
            << file.filename() << " in " << locale << ": " << spokenLine(node);
      }
      EXPECT_GT(elements, 0u) << file.filename() << " in " << locale;
      EXPECT_EQ(sample.snapshot.timesRaised(), 0u) << file.filename();
      EXPECT_TRUE(sample.run->hostFaults().empty()) << file.filename();
    }
  }
}

TEST(Tour, LeavesNoEnglishInOtherLanguages) {
  for (const auto& file : sampleScenes()) {
    std::set<std::string> english;
    for (const std::string& label : labelsOf(Presented(file, locales[0]).snapshot)) {
      for (const std::string& piece : piecesOf(label)) english.insert(piece);
    }
    for (const char* locale : locales) {
      if (locale == locales[0]) continue;
      const std::vector<std::string> labels = labelsOf(Presented(file, locale).snapshot);
      const std::set<std::string> words = wordsOfLanguage();
      for (const std::string& label : labels) {
        for (const std::string& piece : piecesOf(label)) {
          const std::string said = withoutFigure(piece);
          EXPECT_TRUE(isName(said) || words.contains(said) || !english.contains(piece))
              << file.filename() << " in " << locale << ": " << piece;
        }
      }
    }
  }
}

TEST(Tour, NamesTheTargetOfEveryCategory) {
  std::string samples;
  for (const auto& file : sampleScenes()) samples += fileText(file);
  const Presented started(sampleScenes().front(), "");
  const auto& requests = ValidationManager::sharedInstance()->installationRequests();
  EXPECT_EQ(requests.size(), 65u);
  for (const InstallationRequest& request : requests) {
    ASSERT_TRUE(request.installed) << request.category;
    const std::string target = categoryTargetClassName(*Class::named(request.category));
    EXPECT_NE(samples.find("\"" + target + "\""), std::string::npos) << target;
  }
}

}  // namespace ax::tour
