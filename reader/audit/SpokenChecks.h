#pragma once

#include <string>
#include <string_view>
#include <vector>

// What is wrong with a text that is to be spoken, looked at by itself.
namespace ax::reader {

// The pieces of a text between separators, without blanks at their ends.
std::vector<std::string> piecesOf(std::string_view text, std::string_view separator);

// The first dotted lower-case key in a text, such as "friend.list"; empty for none.
std::string rawKeyIn(const std::string& text);

// The first unit abbreviation behind a figure, symbol or emoji that voices read badly; empty for none.
std::string abbreviationIn(const std::string& text);

// Whether a word stands by itself in a text, not as a part of a longer one.
bool containsWord(std::string_view text, std::string_view word);

bool hasDigit(std::string_view text);

}  // namespace ax::reader
