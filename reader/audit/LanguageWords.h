#pragma once

#include <string>
#include <string_view>
#include <unordered_set>
#include <vector>

namespace ax::reader {

// The words of a text: runs of three letters or more, in lower case where they are Latin. Letters beyond
// ASCII count as letters; shorter runs are units, signs and initials.
std::vector<std::string> wordsOf(std::string_view text);

// The words that one language's own string tables hold, with its months, weekdays and spoken times.
class LanguageWords {
 public:
  LanguageWords() = default;
  // Of the language of the environment; the folders hold compiled string tables. Main thread only.
  explicit LanguageWords(const std::vector<std::string>& tableFolders);

  // Whether each word of a text is the language's own. True for a text without words.
  bool hold(std::string_view text) const;

 private:
  void add(std::string_view text);

  std::unordered_set<std::string> words_;
};

}  // namespace ax::reader
