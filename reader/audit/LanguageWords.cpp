#include "reader/audit/LanguageWords.h"

#include <algorithm>

#include "platform/formatting/Dates.h"
#include "platform/formatting/Durations.h"
#include "platform/formatting/StringTable.h"

namespace ax::reader {

namespace {

constexpr std::size_t shortestWord = 3;
constexpr double day = 86400;
constexpr double month = 30.5 * day;

bool isAsciiLetter(unsigned char byte) {
  return (byte >= 'a' && byte <= 'z') || (byte >= 'A' && byte <= 'Z');
}

// Punctuation and blanks from U+2000 on, the no-break space, and the marks of Japanese and Arabic.
bool isPunctuation(std::string_view rest) {
  return rest.starts_with("\xC2") || rest.starts_with("\xE2\x80") || rest.starts_with("\xE3\x80\x80") ||
         rest.starts_with("\xE3\x80\x81") || rest.starts_with("\xE3\x80\x82") ||
         rest.starts_with("\xD8\x8C") || rest.starts_with("\xD8\x9B") || rest.starts_with("\xD8\x9F");
}

std::size_t lengthOfCharacter(unsigned char first) {
  return first < 0x80 ? 1 : first < 0xE0 ? 2 : first < 0xF0 ? 3 : 4;
}

char lowered(char c) {
  return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

}  // namespace

std::vector<std::string> wordsOf(std::string_view text) {
  std::vector<std::string> words;
  std::string word;
  std::size_t letters = 0;
  const auto end = [&] {
    if (letters >= shortestWord) words.push_back(word);
    word.clear();
    letters = 0;
  };
  for (std::size_t i = 0; i < text.size();) {
    const auto first = static_cast<unsigned char>(text[i]);
    const std::size_t length = std::min(lengthOfCharacter(first), text.size() - i);
    const bool isLetter = first < 0x80 ? isAsciiLetter(first) : !isPunctuation(text.substr(i));
    if (isLetter) {
      for (const char c : text.substr(i, length)) word += lowered(c);
      ++letters;
    } else {
      end();
    }
    i += length;
  }
  end();
  return words;
}

LanguageWords::LanguageWords(const std::vector<std::string>& tableFolders) {
  for (const std::string& folder : tableFolders) {
    const formatting::StringTable table(folder);
    for (const std::string& key : table.keys()) add(*table.find(key));
  }
  for (int i = 0; i < 12; ++i) add(formatting::dateString((i + 0.5) * month, "MMMM"));
  for (int i = 0; i < 7; ++i) add(formatting::dateString(i * day, "EEEE"));
  for (const double seconds : {3661.0, 7322.0}) add(formatting::spokenDuration(seconds));
}

void LanguageWords::add(std::string_view text) {
  for (std::string& word : wordsOf(text)) words_.insert(std::move(word));
}

bool LanguageWords::hold(std::string_view text) const {
  return std::ranges::all_of(wordsOf(text), [&](const std::string& word) { return words_.contains(word); });
}

}  // namespace ax::reader
