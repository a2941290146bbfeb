#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace ax::reader {

// Why the elements of a text would take more memory or time than a workout is worth.
struct XmlExcess {
  std::size_t at = 0;
  std::string what;
  std::string expected;
};

// Looks through the marks of an XML text without building anything: elements may nest 100 deep, and those of
// a large text may take no more than eight times its size when they are built. Text that is no XML passes.
std::optional<XmlExcess> findXmlExcess(std::string_view text);

}  // namespace ax::reader
