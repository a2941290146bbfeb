#include "reader/audit/AuditRule.h"

namespace ax::reader {

namespace {

constexpr AuditRule rules[] = {
    {"unspoken-text", true, "a visible text that no element says",
     "What others read on the screen does not exist for a listener.", findUnspokenTexts},
    {"other-words", false, "a visible text whose element says something else",
     "It may be the same in better words. If not, the listener misses what others read.", findOtherWords},
    {"no-label", true, "an element without a label",
     "The listener stops at something and hears at best what kind of thing it is.", findMissingLabels},
    {"raw-key", true, "a key of a string table where its text belongs",
     "A key is read out letter by letter, dots included.", findRawKeys},
    {"untranslated", true, "a text that is the same in another language, names excepted",
     "A voice reads a foreign text by its own rules, and nobody understands it. Needs --locale all.",
     findUntranslated},
    {"abbreviation", true, "abbreviated units, symbols and emoji",
     "Voices spell abbreviations, skip symbols, or read out their long official names.", findAbbreviations},
    {"said-twice", true, "the same text twice in one element, or two neighbours that say the same",
     "It costs time, and the listener wonders what the difference is.", findRepeats},
    {"role-in-label", true, "a label that holds the word for its role",
     "The screen reader adds the role itself: \"sort button, button\".", findRoleWords},
    {"no-area", true, "an element without width or height",
     "Touch exploration never finds it, and no cursor is drawn around it.", findMissingAreas},
    {"outside-screen", true, "an element wholly outside the screen, in nothing that scrolls",
     "Touch exploration never finds it, and a double tap on it hits nothing.", findOutsideScreen},
    {"small-target", true, "something to operate of less than 24 by 24 points",
     "Who explores by touch, or whose hands tremble, misses it.", findSmallTargets},
    {"overlap", true, "two things to operate that lie over one another",
     "Touch exploration finds only the upper one, and a tap may hit the wrong one.", findOverlaps},
    {"same-name", true, "two buttons of one name that do different things",
     "By ear alone nobody can tell which is which.", findSameNames},
    {"order", true, "an element read before one clearly above it, or before it in its row",
     "What is heard first is taken to stand first; headings lose what they head.", findOutOfOrder},
    {"chart-without-words", true, "a chart without name, axis title, unit or elements",
     "A chart that can be played but not named is a row of notes about nothing.", findWordlessCharts},
    {"long-line", false, "an element that takes more than 10 seconds to say",
     "Nobody can skim within an element: the listener has to wait, or misses the end.", findLongLines},
};

}  // namespace

std::span<const AuditRule> auditRules() {
  return rules;
}

std::string nameOf(const std::string& className, const std::string& objectId) {
  return objectId.empty() ? className : className + " \"" + objectId + "\"";
}

Problem problemOf(const AuditedElement& element, std::string what) {
  const Node& node = *element.node;
  return {element.place, element.line, nameOf(node.className, node.objectId), std::move(what)};
}

namespace {

std::string textOf(const std::optional<AttributedText>& text) {
  return text ? text->text : "";
}

}  // namespace

std::string labelOf(const Node& node) {
  return textOf(node.label);
}

std::string valueOf(const Node& node) {
  return textOf(node.value);
}

std::string hintOf(const Node& node) {
  return textOf(node.hint);
}

bool isOperable(const Node& node) {
  return node.actions.activate || node.actions.increment || node.actions.decrement;
}

}  // namespace ax::reader
