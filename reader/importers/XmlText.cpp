#include "reader/importers/XmlText.h"

#include <algorithm>

#include "reader/importers/TextEncoding.h"
#include "reader/importers/XmlNesting.h"

namespace ax::reader {

// Read as a fragment, so that text and elements beside the root are kept and can be complained about. Text
// that is all of an element is kept in it: that halves what the elements take.
XmlText::XmlText(std::string_view bytes) : text_(toUtf8(bytes, kept_)) {
  if (const auto excess = findXmlExcess(text_)) {
    excess_ = {"", placeAt(static_cast<std::ptrdiff_t>(excess->at + 1)), excess->what, excess->expected};
    return;
  }
  constexpr unsigned kinds = pugi::parse_default | pugi::parse_fragment | pugi::parse_embed_pcdata;
  result_ = document_.load_buffer(text_.data(), text_.size(), kinds, pugi::encoding_utf8);
}

std::string XmlText::placeAt(std::ptrdiff_t offset) const {
  const std::size_t end = std::clamp<std::ptrdiff_t>(offset, 0, static_cast<std::ptrdiff_t>(text_.size()));
  const std::string_view before = text_.substr(0, end);
  const std::string_view line = before.substr(before.rfind('\n') + 1);
  const auto startsCharacter = [](char c) { return (static_cast<unsigned char>(c) & 0xC0) != 0x80; };
  return "line " + std::to_string(std::ranges::count(before, '\n') + 1) + ", column " +
         std::to_string(std::ranges::count_if(line, startsCharacter) + 1);
}

std::optional<WorkoutFileFault> XmlText::fault() const {
  if (excess_) return excess_;
  const std::string_view lastBlanks = text_.substr(text_.find_last_not_of(" \t\r\n") + 1);
  const auto end = static_cast<std::ptrdiff_t>(text_.size() - lastBlanks.size());
  if (!result_ && result_.offset >= end - 1) {
    return WorkoutFileFault{"", placeAt(end), "the file is cut off", "all elements closed"};
  }
  if (!result_) {
    return WorkoutFileFault{"", placeAt(result_.offset), std::string("not XML: ") + result_.description(),
                            "well-formed XML"};
  }
  if (!root()) return WorkoutFileFault{"", placeAt(0), "there is no element", "an XML document"};
  for (const pugi::xml_node node : document_) {
    const bool isStray = node.type() == pugi::node_pcdata || node.type() == pugi::node_cdata ||
                         (node.type() == pugi::node_element && node != root());
    if (!isStray) continue;
    return WorkoutFileFault{"", placeOf(node), "something stands beside the root element",
                            "one root element and nothing else"};
  }
  return std::nullopt;
}

}  // namespace ax::reader
