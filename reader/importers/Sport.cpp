#include "reader/importers/Sport.h"

#include <cctype>

namespace ax::reader {
namespace {

struct SportWord {
  std::string_view start;  // how a word of the file's text begins, in lower case
  std::string_view sport;
};

constexpr SportWord sportWords[] = {
    {"run", "running"},  {"jog", "running"},   {"treadmill", "running"}, {"bik", "cycling"},
    {"cycl", "cycling"}, {"ride", "cycling"},  {"riding", "cycling"},    {"walk", "walking"},
    {"hik", "hiking"},   {"swim", "swimming"}, {"yoga", "yoga"},
};

bool isLetter(char c) {
  return std::isalpha(static_cast<unsigned char>(c)) != 0;
}
bool isCapital(char c) {
  return std::isupper(static_cast<unsigned char>(c)) != 0;
}

// A word starts after anything but a letter, and at a capital inside "TrailRun".
std::string spacedWords(std::string_view text) {
  std::string words = " ";
  char former = ' ';
  for (const char c : text) {
    if (isCapital(c) && isLetter(former) && !isCapital(former)) words += ' ';
    words += isLetter(c) ? static_cast<char>(std::tolower(static_cast<unsigned char>(c))) : ' ';
    former = c;
  }
  return words;
}

}  // namespace

std::string sportNamed(std::string_view text) {
  const std::string words = spacedWords(text);
  for (const auto& [start, sport] : sportWords) {
    if (words.find(' ' + std::string(start)) != std::string::npos) return std::string(sport);
  }
  return "other";
}

}  // namespace ax::reader
