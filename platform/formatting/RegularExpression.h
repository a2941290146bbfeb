// Patterns that are searched for in texts.
#pragma once

#include <cstddef>
#include <memory>
#include <string_view>
#include <vector>

namespace ax::formatting {

// Bytes of a text.
struct TextRange {
  std::size_t from = 0;
  std::size_t length = 0;

  std::string_view in(std::string_view text) const { return text.substr(from, length); }
};

// Compiled once, and only read afterwards, so that any thread may search with it.
class RegularExpression {
 public:
  // In ICU's notation, over characters: \d is a digit of any script and \s any blank. What is no pattern
  // finds nothing.
  explicit RegularExpression(std::string_view pattern);
  RegularExpression(const RegularExpression&) = delete;
  RegularExpression& operator=(const RegularExpression&) = delete;
  ~RegularExpression();

  // Where the first match lies in `text` (UTF-8), then where its groups lie; one that took no part is empty.
  // Nothing is found after about a million steps, which a few hundred thousand characters do not need unless
  // they were written to.
  std::vector<TextRange> firstMatch(std::string_view text) const;

 private:
  struct Compiled;
  std::unique_ptr<Compiled> compiled_;
};

}  // namespace ax::formatting
