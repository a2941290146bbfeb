#pragma once

#include <string>

namespace ax::reader {

// Why an input cannot be used. It is thrown; a command prints it and ends with "bad input".
struct Fault {
  std::string file;      // the name that the caller gave
  std::string place;     // "line 3, column 5", or a JSON pointer such as "/screen/set/text"
  std::string what;      // what is wrong
  std::string expected;  // what would have been right

  // One line: "axvelto: FILE: what, at place, expected ...". What a terminal would obey stands as escapes,
  // and a part that is too long is cut.
  std::string text() const;
};

}  // namespace ax::reader
