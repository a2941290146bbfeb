#pragma once

#include <optional>
#include <pugixml.hpp>
#include <string>
#include <string_view>

#include "reader/importers/WorkoutFile.h"

namespace ax::reader {

// An XML text and its elements, which knows where in the text each of them stands. The bytes stay the
// caller's and must outlive it.
class XmlText {
 public:
  explicit XmlText(std::string_view bytes);

  // Why the text is no well-formed document with a single root element; its `file` is left empty. The
  // elements before the fault are there, unless there are too many.
  std::optional<WorkoutFileFault> fault() const;
  pugi::xml_node root() const { return document_.document_element(); }

  // "line 12, column 5" of an element's name.
  std::string placeOf(pugi::xml_node node) const { return placeAt(node.offset_debug()); }

 private:
  std::string placeAt(std::ptrdiff_t offset) const;

  std::string kept_;
  std::string_view text_;
  std::optional<WorkoutFileFault> excess_;
  pugi::xml_document document_;
  pugi::xml_parse_result result_;
};

}  // namespace ax::reader
