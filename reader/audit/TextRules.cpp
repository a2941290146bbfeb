#include <algorithm>
#include <array>
#include <cmath>
#include <set>

#include "reader/audit/AuditRule.h"
#include "reader/audit/SpokenChecks.h"

// What elements say.
namespace ax::reader {

namespace {

constexpr double longestLine = 10;         // seconds
constexpr std::size_t shortestTimed = 40;  // bytes: no voice takes ten seconds for fewer

std::array<std::string, 3> textsOf(const Node& node) {
  return {labelOf(node), valueOf(node), hintOf(node)};
}

// The words of a text, and its figures without leading zeros.
std::vector<std::string> tokensOf(const std::string& text) {
  std::vector<std::string> tokens = wordsOf(text);
  constexpr const char* digits = "0123456789";
  for (std::size_t end, i = text.find_first_of(digits); i < text.size();
       i = text.find_first_of(digits, end)) {
    end = std::min(text.find_first_not_of(digits, i), text.size());
    const std::size_t first = std::min(text.find_first_not_of('0', i), end - 1);
    tokens.push_back(text.substr(first, end - first));
  }
  return tokens;
}

// Whether something that is spoken holds every word and figure of a text, in any order.
bool says(const std::string& spoken, const std::string& text) {
  if (spoken.find(text) != std::string::npos) return true;
  const std::vector<std::string> words = tokensOf(text);
  const std::vector<std::string> said = tokensOf(spoken);
  return !words.empty() && std::ranges::all_of(words, [&](const std::string& word) {
    return std::ranges::find(said, word) != said.end();
  });
}

bool covers(const Rect& frame, const Rect& other) {
  const double x = other.x + other.width / 2;
  const double y = other.y + other.height / 2;
  return frame.x <= x && x <= frame.maxX() && frame.y <= y && y <= frame.maxY();
}

bool isSaid(const AuditScreen& screen, const ShownText& text) {
  return std::ranges::any_of(screen.snapshot.nodes(), [&](const Node& node) {
    const std::string all = labelOf(node) + " " + valueOf(node) + " " + hintOf(node);
    return says(all, text.text) || says(all, text.spoken);
  });
}

// The element, or the chart, that lies over a text and so speaks for it; null for none.
const Node* speakerFor(const AuditScreen& screen, const ShownText& text) {
  for (const Node& node : screen.snapshot.nodes()) {
    const bool speaks = (node.isElement || node.series) && !labelOf(node).empty();
    if (speaks && covers(node.frame, text.frame)) return &node;
  }
  return nullptr;
}

// Hands over each visible text that no element says, with the one that speaks for it.
template <class Visit>
void visitUnsaid(const AuditScreen& screen, Visit visit) {
  for (const ShownText& text : screen.shown.texts) {
    const bool isText = !wordsOf(text.text).empty() || hasDigit(text.text);
    if (isText && !isSaid(screen, text)) visit(text, speakerFor(screen, text));
  }
}

Problem problemOf(const ShownText& text, std::string what) {
  return {0, text.text, nameOf(text.className, text.objectId), std::move(what)};
}

void checkEachText(const AuditScreen& screen, Problems& problems, const char* what,
                   std::string (*check)(const std::string&)) {
  for (const AuditedElement& element : screen.elements) {
    for (const std::string& text : textsOf(*element.node)) {
      const std::string found = check(text);
      if (!found.empty()) problems.push_back(problemOf(element, what + (" \"" + found + "\"")));
    }
  }
}

// What one element says twice; empty for none. Figures may repeat.
std::string repeatIn(const AuditedElement& element, const std::string& separator) {
  const auto [label, value, hint] = textsOf(*element.node);
  if (!value.empty() && (value == label || value == hint)) return value;
  if (!hint.empty() && hint == label) return hint;
  std::set<std::string> seen;
  for (const std::string& piece : piecesOf(label, separator)) {
    if (!hasDigit(piece) && !seen.insert(piece).second) return piece;
  }
  return "";
}

}  // namespace

void findUnspokenTexts(const Audit&, const AuditScreen& screen, Problems& problems) {
  visitUnsaid(screen, [&](const ShownText& text, const Node* speaker) {
    if (speaker == nullptr) problems.push_back(problemOf(text, "is said by no element"));
  });
}

void findOtherWords(const Audit&, const AuditScreen& screen, Problems& problems) {
  visitUnsaid(screen, [&](const ShownText& text, const Node* speaker) {
    if (speaker == nullptr) return;
    problems.push_back(problemOf(text, "lies under an element that says \"" + labelOf(*speaker) + "\""));
  });
}

void findMissingLabels(const Audit&, const AuditScreen& screen, Problems& problems) {
  for (const AuditedElement& element : screen.elements) {
    const Node& node = *element.node;
    const bool isNamedChart = node.series && node.series->name && !node.series->name->text.empty();
    if (labelOf(node).empty() && !isNamedChart) problems.push_back(problemOf(element, "has no label"));
  }
}

void findRawKeys(const Audit&, const AuditScreen& screen, Problems& problems) {
  checkEachText(screen, problems, "says the key", rawKeyIn);
}

void findAbbreviations(const Audit&, const AuditScreen& screen, Problems& problems) {
  checkEachText(screen, problems, "says", abbreviationIn);
}

void findRepeats(const Audit&, const AuditScreen& screen, Problems& problems) {
  const AuditedElement* before = nullptr;
  for (const AuditedElement& element : screen.elements) {
    const std::string repeat = repeatIn(element, screen.separator);
    if (!repeat.empty()) problems.push_back(problemOf(element, "says \"" + repeat + "\" twice"));
    if (before != nullptr && !element.line.empty() && before->line == element.line) {
      problems.push_back(problemOf(element, "says the same as the element before it"));
    }
    before = &element;
  }
}

void findRoleWords(const Audit&, const AuditScreen& screen, Problems& problems) {
  for (const AuditedElement& element : screen.elements) {
    for (const std::string& role : screen.roleWords) {
      if (containsWord(labelOf(*element.node), role)) {
        problems.push_back(problemOf(element, "has \"" + role + "\" in its label"));
      }
    }
  }
}

// Whether each word is one of a name's.
bool isName(const AuditScreen& screen, const std::string& piece) {
  return std::ranges::all_of(wordsOf(piece), [&](const std::string& word) {
    return std::ranges::any_of(screen.names, [&](const std::string& name) {
      const std::vector<std::string> words = wordsOf(name);
      return std::ranges::find(words, word) != words.end();
    });
  });
}

// A screen in another language that says the same; its own words may be the other's too.
void findUntranslated(const Audit& audit, const AuditScreen& screen, Problems& problems) {
  std::set<std::string> elsewhere;
  for (const AuditScreen& other : audit.screens) {
    if (&other == &screen) continue;
    for (const AuditedElement& element : other.elements) {
      for (const std::string& text : textsOf(*element.node)) {
        for (std::string& piece : piecesOf(text, other.separator)) elsewhere.insert(std::move(piece));
      }
    }
  }
  for (const AuditedElement& element : screen.elements) {
    for (const std::string& text : textsOf(*element.node)) {
      for (const std::string& piece : piecesOf(text, screen.separator)) {
        const bool isForeign = elsewhere.contains(piece) && !screen.words.hold(piece);
        if (isForeign && !isName(screen, piece)) {
          problems.push_back(problemOf(element, "says \"" + piece + "\" as in another language"));
        }
      }
    }
  }
}

void findSameNames(const Audit&, const AuditScreen& screen, Problems& problems) {
  std::vector<const AuditedElement*> operable;
  for (const AuditedElement& element : screen.elements) {
    if (element.node->actions.activate && !element.line.empty()) operable.push_back(&element);
  }
  std::ranges::stable_sort(operable, {}, [](const AuditedElement* e) { return e->line; });
  for (std::size_t i = 1; i < operable.size(); ++i) {
    const AuditedElement& first = *operable[i - 1];
    if (first.line != operable[i]->line) continue;
    problems.push_back(problemOf(
        *operable[i], "has the same name as element " + std::to_string(first.place) + ", and is another"));
  }
}

void findLongLines(const Audit& audit, const AuditScreen& screen, Problems& problems) {
  if (!audit.speakingTime) return;
  for (const AuditedElement& element : screen.elements) {
    if (element.line.size() < shortestTimed) continue;
    const double seconds = audit.speakingTime(element.line, screen.locale);
    if (seconds <= longestLine) continue;
    problems.push_back(
        problemOf(element, "takes " + std::to_string(std::lround(seconds)) + " seconds to say"));
  }
}

}  // namespace ax::reader
